#include "vesk_hdl/engine/HdlCmd.h"

#include <atomic>
#include <cstdint>
#include <new>
#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/text/basis/Ascii.h"

#define RAISE(...) VESK_HDL_RAISE("HdlCmd", __VA_ARGS__)

namespace Vesk_Hdl {

using Basis::StringBase;

Command::Command(Model *model) : commandModel(model) {}
Command::~Command() = default;

Model &Command::RequireModel() const {
    if (!commandModel)
        RAISE(Messages::MISSING_MODEL);
    return *commandModel;
}

namespace {

/// The keywords, which are ways through a tree of words. A place in it is a number.
class KeywordTree {
public:
    static constexpr std::size_t ROOT = 0; ///< in front of all words
    static constexpr std::size_t NOWHERE = SIZE_MAX;

    /// The place behind all words of a token, of which one that was quoted may hold several.
    std::size_t Follow(std::size_t place, std::string_view token) const {
        while (place != NOWHERE) {
            std::size_t const found = Find(place, token);
            std::size_t const blank = found == NOWHERE ? token.find(' ') : token.npos;
            if (blank == token.npos)
                return found;
            place = Find(place, token.substr(0, blank));
            token.remove_prefix(blank + 1);
        }
        return NOWHERE;
    }
    void Add(std::string_view keyword, CommandCreator creator) {
        std::size_t place = ROOT;
        std::size_t blank = keyword.find(' ');
        for (; blank != keyword.npos; blank = keyword.find(' ')) {
            place = Enter(place, keyword.substr(0, blank));
            keyword.remove_prefix(blank + 1);
        }
        place = Enter(place, keyword);
        places[place].creator = creator;
    }
    /// Of the keyword that ends there, or null.
    CommandCreator GetCreator(std::size_t place) const { return places[place].creator; }

private:
    struct Step {
        std::string word;
        std::size_t place; ///< behind the word
    };
    struct Place {
        CommandCreator creator = nullptr;
        std::vector<Step> next = {};
    };

    std::size_t Find(std::size_t place, std::string_view word) const {
        for (Step const &step : places[place].next)
            if (Basis::Ascii::EqualIgnoringCase(step.word, word))
                return step.place;
        return NOWHERE;
    }
    std::size_t Enter(std::size_t place, std::string_view word) {
        if (std::size_t const found = Find(place, word); found != NOWHERE)
            return found;
        std::size_t const made = places.size();
        places.emplace_back();
        places[place].next.push_back({std::string(word), made});
        return made;
    }

    std::vector<Place> places{Place()};
};

} // namespace

struct CommandFactory::Record {
    KeywordTree keywords;
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
    record->keywords.Add(words.Concatenate(" ").View(), creator);
}

/// Every beginning of the line is looked up and the last hit wins. The walk ends where no keyword
/// goes on as the line does, for nothing longer can match.
CommandCreator CommandFactory::GetCommandCreator(StringArray const &tokens) const {
    KeywordTree const &keywords = record->keywords;
    std::size_t place = KeywordTree::ROOT;
    CommandCreator found = nullptr;
    for (int i = 0; i < tokens.GetSize(); ++i) {
        place = keywords.Follow(place, tokens.At(i).View());
        if (place == KeywordTree::NOWHERE)
            break;
        if (CommandCreator const creator = keywords.GetCreator(place))
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
    Command *const command = factory ? factory->CreateCommand(model, tokens) : nullptr;
    if (!command)
        RAISE(Messages::UNKNOWN_COMMAND);
    try {
        if (!command->ParseArguments(tokens))
            RAISE(Messages::INVALID_ARGUMENTS, command->GetKeyword());
        command->Execute();
        record->done.emplace_back(command);
    } catch (Exception const &refusal) {
        std::unique_ptr<Command> const failed(command);
        throw Exception(refusal); // required: a new Exception, also of a class derived from it
    } catch (std::bad_alloc const &) {
        delete command;
        throw;
    }
    return true;
}

void CommandManager::AddDoneCommand(Command *command) {
    if (command)
        record->done.emplace_back(command);
}

int CommandManager::GetDoneCommandCount() const { return static_cast<int>(record->done.size()); }

void CommandManager::Clear() { record->done.clear(); }

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
