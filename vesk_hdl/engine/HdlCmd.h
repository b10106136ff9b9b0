#pragma once

#include <memory>

#include "vesk_hdl/text/Exception.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class Model;

/// One command of one line. It reads its arguments once, runs once and is then kept as done.
/// ParseArguments is called before Execute. Clients add commands of their own by deriving from this
/// class, see CommandFactory::AddCommandCreator.
class VESK_HDL_API Command {
public:
    /// The model on which the command works, not owned. Null is legal until Execute is called.
    Command(Model *model = nullptr);
    virtual ~Command();
    /// Reads the arguments from all tokens of the line, the words of the keyword included. False if
    /// they are not acceptable.
    virtual bool ParseArguments(StringArray const &tokens) = 0;
    /// Does the work on the model. A refusal is raised as an Exception; a null model raises
    /// "Missing Model.\n".
    virtual void Execute() = 0;
    /// The keyword as it was registered, never null.
    virtual char const *GetKeyword() const = 0;
    Command(Command const &) = delete;
    Command &operator=(Command const &) = delete;

    /// The model given to the constructor or to SetModel; may be null.
    Model *GetModel() const { return commandModel; }
    /// The model is not owned. Null is legal until Execute is called.
    void SetModel(Model *newModel) { commandModel = newModel; }

protected:
    /// The model; raises "Missing Model.\n" if there is none.
    Model &RequireModel() const;

private:
    Model *commandModel;
};

/// Makes a command for a model. The caller owns it and calls ParseArguments next, with the same
/// tokens.
using CommandCreator = Command *(*)(Model *, StringArray const &);

/// Finds commands by keyword: one to five words that begin a line, in any case. The longest keyword
/// that a line begins with wins.
class VESK_HDL_API CommandFactory {
public:
    /// A factory of the library's commands.
    CommandFactory();
    ~CommandFactory();
    /// Copy and original share one table of keywords from then on: what is added to one is known to
    /// the other. The table lives as long as any of them.
    CommandFactory(CommandFactory const &other);
    CommandFactory &operator=(CommandFactory const &other);

    /// Adds a keyword, or replaces the creator of one that is known, in any case. A text is split
    /// at blanks into words; runs of blanks count as one.
    void AddCommandCreator(char const *keyword, Command *(*creator)(Model *, StringArray const &));
    void AddCommandCreator(StringArray const &words,
                           Command *(*creator)(Model *, StringArray const &));
    /// The creator of the longest keyword that the tokens begin with, null if there is none. A line
    /// is split into tokens as Model::Execute does. Words are compared, not tokens: a quoted token
    /// of two words matches two words of a keyword.
    Command *(*GetCommandCreator(StringArray const &tokens) const)(Model *, StringArray const &);
    Command *(*GetCommandCreator(char const *line) const)(Model *, StringArray const &);
    /// A new command from that creator, owned by the caller; null if no keyword matches.
    Command *CreateCommand(Model *model, StringArray const &tokens) const;
    Command *CreateCommand(Model *model, char const *line) const;
    /// A new model that uses this factory, owned by the caller. The factory must outlive it.
    Model *CreateModel();

private:
    struct Record;
    Record *record; ///< shared with copies
};

/// Drives commands through their life and keeps, as their owner, those that ran. There is no undo.
class VESK_HDL_API CommandManager {
public:
    CommandManager();
    /// Deletes the commands that ran.
    ~CommandManager();
    CommandManager(CommandManager const &) = delete;
    CommandManager &operator=(CommandManager const &) = delete;

    /// Makes the command of a line, has it read its arguments and runs it; true. Raises "Command
    /// not find.\n" (the wording is part of the interface) if no keyword matches, "KEYWORD: Invalid
    /// Arguments.\n", and the refusal of the command, always as a new Exception, also if the
    /// command threw an object of a class derived from Exception. What the command did before it
    /// failed stays. A refused command is deleted, and so is one that ran out of memory. One that
    /// threw anything else is not deleted: it belongs to the client that made it.
    bool CreateAndExecute(StringArray const &tokens, Model *model, CommandFactory *factory);
    /// Adds a command to those that ran and becomes its owner; null is ignored.
    void AddDoneCommand(Command *command);
    /// How many commands ran and were not deleted yet.
    int GetDoneCommandCount() const;
    /// Deletes the commands that ran. What they did to the design stays.
    void Clear();

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
