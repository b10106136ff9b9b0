// The help of the commands. It is made from the same table that registers them, so that it cannot
// miss one.

#include "vesk_hdl/engine/CommandHelp.h"

#include <deque>
#include <iterator>
#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/engine/CommandOf.h"
#include "vesk_hdl/engine/CommandTable.h"

namespace Vesk_Hdl {

namespace {

using enum ArgumentKind;

constexpr Vocabulary::Choice TYPE_CHOICES[] = {Vocabulary::TYPE};
constexpr Vocabulary::Choice SETTING_CHOICES[] = {Vocabulary::GENERIC, Vocabulary::SYNATTR};
constexpr Vocabulary::Choice POLARITY_CHOICES[] = {{"", Vocabulary::POLARITIES}};
constexpr Vocabulary::Choice FLAG_CHOICES[] = {{"", Vocabulary::BOOLEANS}};
constexpr Vocabulary::Choice TOOL_CHOICES[] = {{"", Vocabulary::SYNTHESIS_TOOLS}};
constexpr Vocabulary::Choice UPPERCASE_CHOICES[] = {{"", Vocabulary::UPPERCASE_NAMES}};
constexpr Vocabulary::Choice LOWERCASE_CHOICES[] = {{"", Vocabulary::LOWERCASE_NAMES}};
constexpr Vocabulary::Choice WRITE_CHOICES[] = {{"", Vocabulary::WRITE_OPTIONS}};

/// The description of each kind, by ArgumentKind. With a word of "" the grammar shows the choices
/// themselves; "{words}" in a meaning is replaced by their list.
constexpr ArgumentHelp ARGUMENTS[] = {
    {},
    {"attribute", "the name of an attribute"},
    {"-TYPE=type", "{words}; String if it is missing", TYPE_CHOICES, true},
    {"component", "the name of a component"},
    {"component.pin", "a pin of a component, such as AND2.I0"},
    {"file", "the name of a file; in quotes if it holds blanks"},
    {"flag", "\"false\"; anything else, also nothing, means true", FLAG_CHOICES},
    {"instance", "the name of an instance"},
    {"instance.pin", "a pin of an instance, such as U1.I0"},
    {"library", "the name of a library, or of what is used of it"},
    {"", "", LOWERCASE_CHOICES, true},
    {"name", "a word; in quotes if it holds blanks"},
    {"pin", "the name of a pin: I0, or D(7:0) for eight bits"},
    {"polarity", "{words}, or any beginning of one, in any case", POLARITY_CHOICES, true},
    {"setting", "{words}", SETTING_CHOICES, true},
    {"signal", "NET, BUS(7:0), a part of a bus such as BUS(3) and BUS(6:4), or A,BUS(1:0),B"},
    {"tool", "{words}; any other word means QRT", TOOL_CHOICES},
    {"text...", "all words to the end of the line", {}, false, true},
    {"", "", UPPERCASE_CHOICES, true},
    {"usertype", "the name of a type"},
    {"value", "a text; of a constant or default 1, 0110 or WIDTH:BASE:DIGITS, as in 8:h:A5"},
    {"option", "{words}", WRITE_CHOICES}};
static_assert(std::size(ARGUMENTS) == ARGUMENT_KINDS);

/// The help of all commands. It is built from the table at the first use, since only the tool and
/// clients with a user interface need it. The texts that are put together are kept here as long as
/// the library is loaded.
class Reference {
public:
    Reference() {
        for (ArgumentHelp const &plain : ARGUMENTS) {
            ArgumentHelp &help = arguments.emplace_back(plain);
            if (!*help.word && !help.choices.empty())
                help.word = Keep(List(help.choices, "|", "|", ""));
            help.meaning =
                Fill(help.meaning, {{"{words}", List(help.choices, ", ", " or ", "; ")}});
        }
        for (CommandSpec const &spec : CommandTable())
            commands.push_back(HelpOf(spec));
    }

    std::vector<CommandHelp> const &GetCommands() const { return commands; }
    ArgumentHelp const &GetArgument(ArgumentKind kind) const {
        return arguments[static_cast<std::size_t>(kind)];
    }
    CommandHelp const *FindFor(StringArray const &tokens) const {
        CommandCreator const creator = factory.GetCommandCreator(tokens);
        std::span<CommandSpec const> const table = CommandTable();
        for (std::size_t i = 0; creator && i < table.size(); ++i)
            if (table[i].create == creator)
                return &commands[i];
        return nullptr;
    }

private:
    using Insertions = std::initializer_list<std::pair<std::string_view, std::string_view>>;

    /// Keeps a text for good. A deque never moves what it holds.
    char const *Keep(std::string text) { return texts.emplace_back(std::move(text)).c_str(); }

    /// The text in which each name in braces is replaced; the text itself if it has none.
    char const *Fill(char const *text, Insertions insertions) {
        std::string filled(text);
        for (auto const &[name, insertion] : insertions)
            for (std::size_t at = filled.find(name); at != filled.npos; at = filled.find(name, at))
                filled.replace(at, name.size(), insertion);
        return filled == text ? text : Keep(std::move(filled));
    }

    /// The words of choices as a list, each with the prefix of its choice before the first word.
    static std::string List(std::span<Vocabulary::Choice const> choices, char const *comma,
                            char const *last, char const *between) {
        std::string list;
        for (Vocabulary::Choice const &choice : choices) {
            list.append(list.empty() ? "" : between).append(choice.prefix);
            for (std::size_t i = 0; i < choice.words.size(); ++i)
                list.append(i == 0                        ? ""
                            : i + 1 < choice.words.size() ? comma
                                                          : last)
                    .append(choice.words[i]);
        }
        return list;
    }

    CommandHelp HelpOf(CommandSpec const &spec) {
        CommandHelp help;
        help.keyword = spec.keyword;
        help.words = WordsIn(spec.keyword);
        std::size_t count = 0;
        while (count < CommandSpec::MAX_ARGUMENTS && spec.arguments[count].kind != NONE)
            ++count;
        help.arguments = {spec.arguments, count};
        help.grammar = Keep(GrammarOf(help.arguments));
        static constexpr CommandOwner NOBODY = {NONE, "", "", "", "", ""};
        CommandOwner const &owner = spec.owner ? *spec.owner : NOBODY;
        auto const fill = [&](char const *text) {
            return Fill(text, {{"{keyword}", spec.keyword},
                               {"{OWNER}", owner.keyword},
                               {"{owner}", owner.article},
                               {"{unknown}", owner.unknown},
                               {"{name}", owner.name},
                               {"{lines}", owner.lines}});
        };
        help.summary = fill(spec.texts.summary);
        help.refused = fill(spec.texts.refused);
        help.notes = fill(spec.texts.notes);
        help.example = fill(spec.texts.example);
        help.wrong = fill(spec.texts.wrong);
        help.message = *help.wrong ? fill(spec.texts.message) : "";
        return help;
    }

    /// Brackets of optional arguments in a row are nested, since the later one needs the earlier
    /// one.
    std::string GrammarOf(std::span<Argument const> list) const {
        std::string grammar;
        int open = 0;
        for (std::size_t i = 0; i < list.size(); ++i) {
            grammar += i > 0 ? " " : "";
            if (list[i].optional) {
                grammar += '[';
                ++open;
            }
            grammar += GetArgument(list[i].kind).word;
            if (list[i].alternative != NONE)
                grammar.append("|").append(GetArgument(list[i].alternative).word);
            if (i + 1 == list.size() || !list[i + 1].optional) {
                grammar.append(static_cast<std::size_t>(open), ']');
                open = 0;
            }
        }
        return grammar;
    }

    CommandFactory factory;
    std::deque<std::string> texts; ///< those that the table does not hold as they are
    std::vector<ArgumentHelp> arguments;
    std::vector<CommandHelp> commands;
};

/// The one reference of the process.
Reference const &TheReference() {
    static Reference const reference;
    return reference;
}

} // namespace

int CommandReference::GetCount() { return static_cast<int>(CommandTable().size()); }

CommandHelp const *CommandReference::GetAt(int index) {
    return index >= 0 && index < GetCount()
               ? &TheReference().GetCommands()[static_cast<std::size_t>(index)]
               : nullptr;
}

CommandHelp const *CommandReference::Find(char const *keyword) {
    for (CommandHelp const &command : TheReference().GetCommands())
        if (Basis::stricmp(command.keyword, keyword) == 0)
            return &command;
    return nullptr;
}

CommandHelp const *CommandReference::FindFor(StringArray const &tokens) {
    return TheReference().FindFor(tokens);
}

ArgumentHelp const &CommandReference::GetArgument(ArgumentKind kind) {
    return TheReference().GetArgument(kind);
}

} // namespace Vesk_Hdl
