#pragma once

#include <memory>

#include "vesk_hdl/text/Exception.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class Model;

/// One command of one line. It is made for the line, reads its arguments once, runs once, and is
/// then kept as done. A client adds a command of its own by deriving from this class, see
/// CommandFactory::AddCommandCreator.
class VESK_HDL_API Command {
public:
    /// A command for a model, which is not owned. Null is legal until Execute.
    Command(Model *model = nullptr);
    /// Called by the CommandManager that owns the command.
    virtual ~Command();
    /// Reads the arguments from the tokens of the whole line, the words of the keyword included,
    /// and returns whether they are acceptable. Called once, before Execute. The array is valid
    /// during the call only.
    virtual bool ParseArguments(StringArray const &tokens) = 0;
    /// Does the work on the model. A refusal is thrown as an Exception: those of the model, and
    /// MISSING_MODEL if there is none. What was done before the refusal stays.
    virtual void Execute() = 0;
    /// The keyword as it was registered. Never null, and valid as long as the command.
    virtual char const *GetKeyword() const = 0;
    Command(Command const &) = delete;
    Command &operator=(Command const &) = delete;

    /// The model given to the constructor or to SetModel; may be null.
    Model *GetModel() const { return commandModel; }
    /// Sets the model, which is not owned. Null is legal until Execute.
    void SetModel(Model *newModel) { commandModel = newModel; }

protected:
    /// The model; throws an Exception (MISSING_MODEL) if there is none.
    Model &RequireModel() const;

private:
    Model *commandModel;
};

/// Makes a command for a model. The caller owns it, and calls ParseArguments with the same tokens
/// next. A creator may throw; it then has to free what it made.
using CommandCreator = Command *(*)(Model *, StringArray const &);

/// Finds commands by keyword: one or more words at the beginning of a line, in any case. The
/// longest keyword that a line begins with wins. Several threads may look up commands in one
/// factory as long as none adds any.
class VESK_HDL_API CommandFactory {
public:
    /// A factory with the commands of the library.
    CommandFactory();
    /// Frees the table of keywords, unless a copy shares it.
    ~CommandFactory();
    /// A factory that shares the table of keywords: a keyword that is added to one is known to
    /// both.
    CommandFactory(CommandFactory const &other);
    /// Shares the table of `other` from now on, in place of its own.
    CommandFactory &operator=(CommandFactory const &other);

    /// Adds a keyword, or replaces the creator of one that is known in any case. The text is split
    /// into words at blanks, of which several count as one. Null counts as empty.
    void AddCommandCreator(char const *keyword, Command *(*creator)(Model *, StringArray const &));
    /// The same for a keyword that is split into words already.
    void AddCommandCreator(StringArray const &words,
                           Command *(*creator)(Model *, StringArray const &));
    /// The creator of the longest keyword that the tokens begin with; null if there is none. Words
    /// are compared and not tokens: a quoted token of two words matches two words of a keyword.
    Command *(*GetCommandCreator(StringArray const &tokens) const)(Model *, StringArray const &);
    /// The same for a line, which is split into tokens as Model::Execute does.
    Command *(*GetCommandCreator(char const *line) const)(Model *, StringArray const &);
    /// A new command of that creator, owned by the caller; null if no keyword matches.
    Command *CreateCommand(Model *model, StringArray const &tokens) const;
    /// The same for a line.
    Command *CreateCommand(Model *model, char const *line) const;
    /// A new model that uses this factory, owned by the caller. The factory must outlive it.
    Model *CreateModel();

private:
    struct Record;
    Record *record; ///< shared with copies
};

/// Makes and runs commands, and keeps those that ran, which it owns. Nothing reads them back: there
/// is no undo.
class VESK_HDL_API CommandManager {
public:
    /// A manager without commands.
    CommandManager();
    /// Deletes the commands that ran.
    ~CommandManager();
    CommandManager(CommandManager const &) = delete;
    CommandManager &operator=(CommandManager const &) = delete;

    /// Makes the command of a line for a model, has it read its arguments, runs it and returns
    /// true. Model and factory are not owned; a null factory knows no command.
    ///
    /// Throws an Exception: UNKNOWN_COMMAND with the message "Command not find.\n" (the wording is
    /// part of the interface); INVALID_ARGUMENTS; or the refusal of the command, as a new Exception
    /// even if the command threw an object of a derived class. What the command did before stays. A
    /// refused command is deleted, and so is one that ran out of memory (std::bad_alloc). One that
    /// threw anything else is not deleted: it belongs to the client that made it.
    bool CreateAndExecute(StringArray const &tokens, Model *model, CommandFactory *factory);
    /// Adds a command to those that ran and becomes its owner. Null is ignored.
    void AddDoneCommand(Command *command);
    /// How many commands ran and were not cleared since.
    int GetDoneCommandCount() const;
    /// Deletes the commands that ran. What they did to the design stays.
    void Clear();

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
