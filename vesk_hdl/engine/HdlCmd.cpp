#include "vesk_hdl/engine/HdlCmd.h"

#include <algorithm>
#include <atomic>
#include <deque>
#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/text/Raise.h"
#include "vesk_hdl/text/StringTable.h"
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

#define KEYWORD_OF(keyword, Class, ...)                                                            \
    char const *Class::GetKeyword() const { return keyword; }
VESK_HDL_COMMANDS(KEYWORD_OF)
#undef KEYWORD_OF

struct CommandFactory::Record {
    /// What a line may begin with: a keyword, or a part of one that a blank follows, or both.
    struct Beginning {
        CommandCreator creator = nullptr;
        bool goesOn = false; ///< a blank and more may follow
    };

    StringTable beginnings{StringTable::CASE_IGNORED, 193}; ///< by the text with single blanks
    std::deque<Beginning> memory;
    std::size_t longestKeyword = 0; ///< in characters
    std::atomic<unsigned int> owners{1};
};

CommandFactory::CommandFactory() : record(nullptr) {
    auto made = std::make_unique<Record>(); // stays owned until all commands are known
    record = made.get();
#define REGISTER(keyword, Class, ...)                                                              \
    AddCommandCreator(                                                                             \
        keyword, [](Model *model, StringArray const &) -> Command * { return new Class(model); });
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
    StringBase<char> const key = words.Concatenate(" ");
    auto const begin = [this](std::string_view text) -> Record::Beginning & {
        if (StringTable::Node const *const known = record->beginnings.Find(text))
            return *static_cast<Record::Beginning *>(known->value);
        Record::Beginning &made = record->memory.emplace_back();
        record->beginnings.GrowForOneMore();
        record->beginnings.Insert(StringBase<char>(text), &made);
        return made;
    };
    std::string_view const text = key.View();
    for (std::size_t blank = text.find(' '); blank != text.npos; blank = text.find(' ', blank + 1))
        begin(text.substr(0, blank)).goesOn = true;
    begin(text).creator = creator;
    record->longestKeyword = std::max<std::size_t>(record->longestKeyword, key.GetLength());
}

/// Every beginning of the line is looked up and the last hit wins. The walk ends where no keyword
/// goes on as the line does, for nothing longer can match.
CommandCreator CommandFactory::GetCommandCreator(StringArray const &tokens) const {
    char room[64];
    std::unique_ptr<char[]> const largeRoom(
        record->longestKeyword > sizeof room ? new char[record->longestKeyword] : nullptr);
    char *const key = largeRoom ? largeRoom.get() : room;
    std::size_t size = 0;
    std::uint32_t hash = StringTable::FIRST_HASH; // of the text so far
    CommandCreator found = nullptr;
    for (int i = 0; i < tokens.GetSize(); ++i) {
        std::string_view const token = tokens.At(i).View();
        if (size + (i > 0 ? 1 : 0) + token.size() > record->longestKeyword)
            break;
        auto const append = [&](char c) {
            key[size++] = c;
            hash = StringTable::AddToHash(hash, Basis::Ascii::ToUpper(c));
        };
        if (i > 0)
            append(' ');
        for (char const c : token)
            append(c);
        StringTable::Node const *const node =
            record->beginnings.Find(std::string_view(key, size), hash);
        if (!node)
            break;
        auto const *const beginning = static_cast<Record::Beginning const *>(node->value);
        if (beginning->creator)
            found = beginning->creator;
        if (!beginning->goesOn)
            break;
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
    std::string_view const whole = text.View();
    std::size_t const begin = whole.find_first_not_of('.');
    std::size_t const point = begin == whole.npos ? begin : whole.find('.', begin);
    return point != whole.npos && point + 1 < whole.size() ? static_cast<unsigned int>(point)
                                                           : Basis::NOT_FOUND;
}

} // namespace

bool IsPinReference(StringBase<char> const &text) { return FindPoint(text) != Basis::NOT_FOUND; }

bool SplitPinReference(StringBase<char> const &text, StringBase<char> &left,
                       StringBase<char> &right) {
    StringBase<char> const whole(text); // an output may be the text itself
    unsigned int const point = FindPoint(whole);
    if (point == Basis::NOT_FOUND)
        return false;
    left = StringBase<char>(whole.View().substr(0, point));
    right = StringBase<char>(whole.View().substr(point + 1));
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
