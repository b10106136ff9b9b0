#include "vesk_hdl/engine/HdlCmd.h"

#include <atomic>
#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/text/Raise.h"
#include "vesk_hdl/text/basis/Ascii.h"

#define RAISE(...) VESK_HDL_RAISE("HdlCmd", __VA_ARGS__)

namespace Vesk_Hdl {

using Basis::StringBase;

Command::Command(Model *model) : commandModel(model) {}
Command::~Command() = default;

Model &Command::RequireModel() const {
    if (!commandModel)
        RAISE("Missing Model.\n");
    return *commandModel;
}

namespace {

/// A word of keywords, and what may follow it: the keywords are the ways through a tree.
struct Word {
    std::string text;
    CommandCreator creator = nullptr; ///< of the keyword that ends here
    std::vector<Word> next;

    Word *Find(std::string_view word) {
        for (Word &each : next)
            if (Basis::Ascii::EqualIgnoringCase(each.text, word))
                return &each;
        return nullptr;
    }
    /// Behind all words of a token: one that was quoted may hold several.
    Word *Follow(std::string_view token) {
        Word *found = Find(token);
        std::size_t const blank = found ? token.npos : token.find(' ');
        if (blank == token.npos)
            return found;
        found = Find(token.substr(0, blank));
        return found ? found->Follow(token.substr(blank + 1)) : nullptr;
    }
    /// The same, and makes what is missing.
    Word &Enter(std::string_view token) {
        std::size_t const blank = token.find(' ');
        std::string_view const word = token.substr(0, blank);
        Word *found = Find(word);
        if (!found)
            found = &next.emplace_back(Word{std::string(word), nullptr, {}});
        return blank == token.npos ? *found : found->Enter(token.substr(blank + 1));
    }
};

} // namespace

struct CommandFactory::Record {
    Word keywords; ///< the root, which is no word
    std::atomic<unsigned int> owners{1};
};

CommandFactory::CommandFactory() : record(nullptr) {
    auto made = std::make_unique<Record>(); // stays owned until all commands are known
    record = made.get();
#define REGISTER(keyword, Class, ...) AddCommandCreator(keyword, Make##Class);
    VESK_HDL_COMMANDS(REGISTER)
#undef REGISTER
    made.release();
}

CommandFactory::~CommandFactory() {
    if (--record->owners == 0)
        delete record;
}

CommandFactory::CommandFactory(CommandFactory const &other) : record(other.record) {
    ++record->owners;
}

CommandFactory &CommandFactory::operator=(CommandFactory const &other) {
    CommandFactory shared(other);
    std::swap(record, shared.record);
    return *this;
}

void CommandFactory::AddCommandCreator(char const *keyword, CommandCreator creator) {
    AddCommandCreator(StringArray(keyword, " ", true, nullptr), creator);
}

void CommandFactory::AddCommandCreator(StringArray const &words, CommandCreator creator) {
    record->keywords.Enter(words.Concatenate(" ").View()).creator = creator;
}

/// Every beginning of the line is looked up and the last hit wins. The walk ends where no keyword
/// goes on as the line does, for nothing longer can match.
CommandCreator CommandFactory::GetCommandCreator(StringArray const &tokens) const {
    Word *at = &record->keywords;
    CommandCreator found = nullptr;
    for (int i = 0; i < tokens.GetSize() && (at = at->Follow(tokens.At(i).View())); ++i)
        if (at->creator)
            found = at->creator;
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
    std::unique_ptr<Command> command(factory ? factory->CreateCommand(model, tokens) : nullptr);
    if (!command)
        RAISE("Command not find.\n");
    if (!command->ParseArguments(tokens))
        RAISE("%s: Invalid Arguments.\n", command->GetKeyword());
    command->Execute();
    record->done.push_back(std::move(command));
    return true;
}

void CommandManager::AddDoneCommand(Command *command) {
    if (command)
        record->done.emplace_back(command);
}

int CommandManager::GetDoneCommandCount() const { return static_cast<int>(record->done.size()); }

void CommandManager::Clear() { record->done.clear(); }

bool PinReference::Parse(std::string_view token) {
    std::size_t const begin = token.find_first_not_of('.');
    std::size_t const point = begin == token.npos ? begin : token.find('.', begin);
    if (point == token.npos || point + 1 == token.size())
        return false;
    holder = token.substr(0, point);
    pin = token.substr(point + 1);
    return true;
}

StringBase<char> JoinTokens(StringArray const &tokens, int first) {
    StringBase<char> joined;
    for (int i = first; i < tokens.GetSize(); ++i) {
        if (i > first)
            joined += ' ';
        joined += tokens.At(i);
    }
    return joined;
}

} // namespace Vesk_Hdl
