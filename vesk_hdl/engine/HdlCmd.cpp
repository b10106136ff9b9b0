// How a line becomes a command: the factory finds it by keyword, the manager runs and keeps it.

#include "vesk_hdl/engine/HdlCmd.h"

#include <atomic>
#include <new>
#include <utility>
#include <vector>

#include "vesk_hdl/engine/CommandTable.h"
#include "vesk_hdl/engine/KeywordTree.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/Messages.h"

#define RAISE(...) VESK_HDL_RAISE("HdlCmd", __VA_ARGS__)

namespace Vesk_Hdl {

Command::Command(Model *model) : commandModel(model) {}
Command::~Command() = default;

Model &Command::RequireModel() const {
    if (!commandModel)
        RAISE(Messages::MISSING_MODEL);
    return *commandModel;
}

/// The table of keywords and the number of factories that share it.
struct CommandFactory::Record {
    KeywordTree keywords;
    std::atomic<unsigned int> owners{1};
};

CommandFactory::CommandFactory() : record(nullptr) {
    auto made = std::make_unique<Record>(); // freed if a registration runs out of memory
    for (CommandSpec const &spec : CommandTable())
        made->keywords.Add(spec.keyword, spec.create);
    record = made.release();
}

CommandFactory::~CommandFactory() {
    if (--record->owners == 0)
        delete record;
}

CommandFactory::CommandFactory(CommandFactory const &other) : record(other.record) {
    ++record->owners;
}

/// Required: both factories share one table afterwards. It is counted, so that it is freed once.
CommandFactory &CommandFactory::operator=(CommandFactory const &other) {
    CommandFactory shared(other);
    std::swap(record, shared.record);
    return *this;
}

void CommandFactory::AddCommandCreator(char const *keyword, CommandCreator creator) {
    AddCommandCreator(StringArray(keyword, " ", true, nullptr), creator);
}

/// Required: of two creators of one keyword the newer one wins.
void CommandFactory::AddCommandCreator(StringArray const &words, CommandCreator creator) {
    record->keywords.Add(words.Concatenate(" ").View(), creator);
}

/// Looks up each beginning of the line, and the last one that is a keyword wins. The walk ends at
/// the first word that continues no keyword, since nothing longer can match.
CommandCreator CommandFactory::GetCommandCreator(StringArray const &tokens) const {
    KeywordTree::Node const *node = &record->keywords.GetRoot();
    CommandCreator found = nullptr;
    for (int i = 0; node && i < tokens.GetSize(); ++i) {
        node = record->keywords.Follow(*node, tokens.At(i).View());
        if (node && node->GetCreator())
            found = node->GetCreator();
    }
    return found;
}

CommandCreator CommandFactory::GetCommandCreator(char const *line) const {
    return GetCommandCreator(StringArray(line, " ", true, "\"\"''"));
}

Command *CommandFactory::CreateCommand(Model *model, StringArray const &tokens) const {
    CommandCreator const creator = GetCommandCreator(tokens);
    return creator ? creator(model, tokens) : nullptr;
}

Command *CommandFactory::CreateCommand(Model *model, char const *line) const {
    return CreateCommand(model, StringArray(line, " ", true, "\"\"''"));
}

Model *CommandFactory::CreateModel() { return new Model(this); }

struct CommandManager::Record {
    std::vector<std::unique_ptr<Command>> done; ///< in the order in which they ended
};

CommandManager::CommandManager() : record(std::make_unique<Record>()) {}
CommandManager::~CommandManager() = default;

bool CommandManager::CreateAndExecute(StringArray const &tokens, Model *model,
                                      CommandFactory *factory) {
    Command *const command = factory ? factory->CreateCommand(model, tokens) : nullptr;
    if (!command)
        RAISE(Messages::UNKNOWN_COMMAND);
    try {
        if (!command->ParseArguments(tokens))
            RAISE(Messages::INVALID_ARGUMENTS, command->GetKeyword());
        command->Execute();
        record->done.emplace_back(command);
    } catch (Exception const &refusal) { // a refusal: the command ends here
        std::unique_ptr<Command> const failed(command);
        throw Exception(refusal);      // required: a new Exception, also of a class derived from it
    } catch (std::bad_alloc const &) { // no client threw this, and none holds the command
        delete command;
        throw;
    }
    // Anything else that a client's command throws passes through and leaves the command alone:
    // required, since the client may still hold it.
    return true;
}

void CommandManager::AddDoneCommand(Command *command) {
    if (command)
        record->done.emplace_back(command);
}

int CommandManager::GetDoneCommandCount() const { return static_cast<int>(record->done.size()); }

void CommandManager::Clear() { record->done.clear(); }

} // namespace Vesk_Hdl
