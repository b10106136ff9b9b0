#pragma once

#include <memory>

#include "vesk_hdl/text/Exception.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class Model;

/// One command of one line. It reads its arguments once, runs once and is then kept as done.
/// ParseArguments comes before Execute.
class VESK_HDL_API Command {
public:
    /// The model is not owned. Null is legal up to Execute.
    Command(Model *model = nullptr);
    virtual ~Command();
    /// Reads the whole line's tokens, keyword words included, by index from 0. False if the
    /// arguments are not acceptable.
    virtual bool ParseArguments(StringArray const &tokens) = 0;
    /// Does the work on the model. Refusals are exceptions; a null model raises "Missing Model.\n".
    virtual void Execute() = 0;
    /// The keyword as it was registered, never null.
    virtual char const *GetKeyword() const = 0;
    Command(Command const &) = delete;
    Command &operator=(Command const &) = delete;

    Model *GetModel() const { return commandModel; }
    void SetModel(Model *newModel) { commandModel = newModel; }

protected:
    /// The model; raises "Missing Model.\n" if there is none.
    Model &RequireModel() const;

private:
    Model *commandModel;
};

/// Makes a command for a model, owned by the caller. The tokens are for ParseArguments.
using CommandCreator = Command *(*)(Model *, StringArray const &);

/// Finds commands by keyword: one to five words that begin a line, in any case. The longest keyword
/// that a line begins with wins.
class VESK_HDL_API CommandFactory {
public:
    /// Knows the library's commands.
    CommandFactory();
    ~CommandFactory();
    /// Copy and original share one table from then on, also for what is added later.
    CommandFactory(CommandFactory const &other);
    CommandFactory &operator=(CommandFactory const &other);

    /// Adds a keyword, or replaces the creator of one that is known in whatever case. The words of
    /// a text are split at blanks and joined by single ones.
    void AddCommandCreator(char const *keyword, Command *(*creator)(Model *, StringArray const &));
    void AddCommandCreator(StringArray const &words,
                           Command *(*creator)(Model *, StringArray const &));
    /// The creator for a line's tokens, or for a line, which is split as Model::Execute does; null
    /// if no keyword matches. Joined text is compared: where the tokens end plays no part.
    Command *(*GetCommandCreator(StringArray const &tokens) const)(Model *, StringArray const &);
    Command *(*GetCommandCreator(char const *line) const)(Model *, StringArray const &);
    /// A new command, owned by the caller, or null.
    Command *CreateCommand(Model *model, StringArray const &tokens) const;
    Command *CreateCommand(Model *model, char const *line) const;
    /// A new model with this factory, owned by the caller.
    Model *CreateModel();

private:
    struct Record;
    Record *record; ///< shared with copies
};

/// Drives commands through their life and keeps, as their owner, those that ran. There is no undo.
class VESK_HDL_API CommandManager {
public:
    CommandManager();
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
    /// Takes over a command; null is ignored.
    void AddDoneCommand(Command *command);
    int GetDoneCommandCount() const;
    /// Deletes the commands that ran. The design stays as it is.
    void Clear();

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
