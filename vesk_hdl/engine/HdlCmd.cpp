#include "vesk_hdl/engine/HdlCmd.h"

#include <algorithm>
#include <atomic>
#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/text/IStringPtrMap.h"
#include "vesk_hdl/text/Raise.h"

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

#define KEYWORD_OF(keyword, Class, grammar)                                                        \
    char const *Class::GetKeyword() const { return keyword; }
VESK_HDL_COMMANDS(KEYWORD_OF)
#undef KEYWORD_OF

struct CommandFactory::Record {
    IStringPtrMap<CommandCreator> creators; ///< by the keyword with single blanks
    std::size_t longestKeyword = 0;         ///< in characters
    std::atomic<unsigned int> owners{1};
};

CommandFactory::CommandFactory() : record(new Record) {
#define REGISTER(keyword, Class, grammar)                                                          \
    AddCommandCreator(                                                                             \
        keyword, [](Model *model, StringArray const &) -> Command * { return new Class(model); });
    VESK_HDL_COMMANDS(REGISTER)
#undef REGISTER
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
    StringBase<char> const key = words.Concatenate(" ");
    record->creators.Add(key, creator);
    record->longestKeyword = std::max<std::size_t>(record->longestKeyword, key.GetLength());
}

/// Every beginning of the line is looked up and the last hit wins. The walk ends where the text
/// is longer than any keyword, for nothing longer can match.
CommandCreator CommandFactory::GetCommandCreator(StringArray const &tokens) const {
    std::string key;
    key.reserve(record->longestKeyword);
    CommandCreator found = nullptr;
    for (int i = 0; i < tokens.GetSize(); ++i) {
        std::string_view const token = tokens.At(i).View();
        std::size_t const blank = i > 0 ? 1 : 0;
        if (key.size() + blank + token.size() > record->longestKeyword)
            break;
        key.append(blank, ' ').append(token);
        if (CommandCreator const creator = record->creators.Get(std::string_view(key)))
            found = creator;
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

namespace {

/// The index of the point that ends the first part, NOT_FOUND if the text is no pin reference.
unsigned int FindPoint(StringBase<char> const &text) {
    Basis_Range range = {1, 0};
    if (!text.NextTokenRange(range, ".", StringBase<char>::PARSE_SKIPPING_EMPTY))
        return Basis::NOT_FOUND;
    return range.last + 2 < text.GetLength() ? range.last + 1 : Basis::NOT_FOUND;
}

} // namespace

bool IsPinReference(StringBase<char> const &text) { return FindPoint(text) != Basis::NOT_FOUND; }

bool SplitPinReference(StringBase<char> const &text, StringBase<char> &left,
                       StringBase<char> &right) {
    StringBase<char> const whole(text); // an output may be the text itself
    unsigned int const point = FindPoint(whole);
    if (point == Basis::NOT_FOUND)
        return false;
    left = whole.Extract({0, point - 1});
    right = whole.Extract({point + 1, whole.GetLength() - 1});
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
