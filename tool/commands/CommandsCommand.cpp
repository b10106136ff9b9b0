// Prints the reference of the command language from the help that the library has for each command.
// docs/commands.md is this output.

#include "tool/commands/CommandsCommand.h"

#include <algorithm>
#include <iomanip>
#include <iostream>
#include <memory>
#include <set>

#include <CLI/CLI.hpp>

#include "tool/diagnostics/Keywords.h"
#include "tool/diagnostics/Words.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

constexpr std::size_t COLUMNS = 80;

/// What the words of the command's grammar mean, each once.
std::vector<ArgumentHelp> MeaningsOf(CommandHelp const &command) {
    std::vector<ArgumentHelp> found;
    std::set<ArgumentKind> seen;
    for (Argument const &argument : command.arguments)
        for (ArgumentKind const kind : {argument.kind, argument.alternative}) {
            ArgumentHelp const &help = CommandReference::GetArgument(kind);
            if (*help.meaning && seen.insert(kind).second)
                found.push_back(help);
        }
    return found;
}

std::string GrammarOf(CommandHelp const &command) {
    return std::string(command.keyword) + (*command.grammar ? " " : "") + command.grammar;
}

/// Prints a text after a word, wrapped into lines that begin in the same column.
void PrintWrapped(std::ostream &stream, std::string const &head, std::string const &text) {
    std::size_t column = head.size();
    stream << head;
    for (std::string const &word : WordsOf(text)) {
        if (column > head.size() && column + 1 + word.size() > COLUMNS) {
            stream << '\n' << std::string(head.size(), ' ');
            column = head.size();
        } else if (column > head.size()) {
            stream << ' ';
            ++column;
        }
        stream << word;
        column += word.size();
    }
    stream << '\n';
}

void PrintScreen(std::ostream &stream, CommandHelp const &command) {
    stream << GrammarOf(command) << "\n\n";
    PrintWrapped(stream, "  ", command.summary);
    std::vector<ArgumentHelp> const arguments = MeaningsOf(command);
    std::size_t width = 0;
    for (ArgumentHelp const &help : arguments)
        width = std::max(width, std::string_view(help.word).size());
    for (ArgumentHelp const &help : arguments) {
        // Meanings are aligned below each other.
        std::string word = std::string("    ") + help.word;
        word.resize(4 + width + 2, ' ');
        PrintWrapped(stream, word, help.meaning);
    }
    if (*command.refused)
        PrintWrapped(stream, "  refused:  ", command.refused);
    if (*command.notes)
        PrintWrapped(stream, "  note:     ", command.notes);
    std::string head = "  example:  ";
    StringArray const lines(command.example, "\n", true, nullptr);
    for (int i = 0; i < lines.GetSize(); ++i) {
        stream << head << lines.At(i) << '\n';
        head.assign(head.size(), ' ');
    }
    if (*command.wrong)
        stream << "  and then: " << command.wrong << "\n            gives " << command.message
               << '\n';
}

/// The same as a page for docs/.
void PrintMarkdown(std::ostream &stream) {
    stream
        << "# The commands\n\n"
           "A line is a command: a keyword, in any case, and its arguments, with blanks between "
           "them. A word in\n`\"` or `'` may hold blanks. `[ ]` is around what may be missing, `|` "
           "between alternatives, `...`\nafter a word that takes all the rest. Names ignore "
           "case.\n\nThis page is what `vesk-hdl commands --markdown` prints; "
           "`vesk-hdl commands WORD...` shows one command.\n";
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &command = *CommandReference::GetAt(i);
        stream << "\n## " << command.keyword << "\n\n    " << GrammarOf(command) << "\n\n"
               << command.summary;
        if (*command.notes)
            stream << ' ' << command.notes;
        stream << "\n" << (*command.grammar || *command.refused ? "\n" : "");
        for (ArgumentHelp const &help : MeaningsOf(command))
            stream << "- `" << help.word << "`: " << help.meaning << '\n';
        if (*command.refused)
            stream << "- Refused: " << command.refused << ".\n";
        stream << "\n```\n" << command.example << "\n```\n";
        if (*command.wrong)
            stream << "\nAfter it, `" << command.wrong << "` gives `" << command.message << "`\n";
    }
}

int PrintReference(std::vector<std::string> const &words, bool markdown) {
    if (markdown) {
        PrintMarkdown(std::cout);
        return ALL_WELL;
    }
    if (PrintCommands(std::cout, words))
        return ALL_WELL;
    std::string wanted;
    for (std::string const &word : words)
        wanted += (wanted.empty() ? "" : " ") + word;
    std::cerr << "vesk-hdl: no keyword holds these words";
    if (CommandHelp const *const nearest = NearestKeyword(wanted))
        std::cerr << "; the nearest is " << Quoted(nearest->keyword);
    std::cerr << '\n';
    return SOMETHING_REFUSED;
}

} // namespace

bool PrintCommands(std::ostream &stream, std::vector<std::string> const &words) {
    bool found = false;
    std::string asked;
    for (std::string const &word : words)
        asked += (asked.empty() ? "" : " ") + word;
    // A whole keyword shows that command alone, although others may hold its words: "ADD COMPONENT"
    // is also in "ADD COMPONENT PIN COMMENT".
    CommandHelp const *const exact = CommandReference::Find(asked.c_str());
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &command = *CommandReference::GetAt(i);
        std::vector<std::string> const own = WordsOf(command.keyword);
        auto const holds = [&own](std::string const &word) {
            return std::any_of(own.begin(), own.end(), [&word](std::string const &each) {
                return SameIgnoringCase(each, word);
            });
        };
        if (exact ? exact != &command : !std::all_of(words.begin(), words.end(), holds))
            continue;
        if (words.empty())
            stream << GrammarOf(command) << '\n';
        else {
            stream << (found ? "\n" : "");
            PrintScreen(stream, command);
        }
        found = true;
    }
    return found;
}

void AddCommandsCommand(CLI::App &app, Action &action) {
    CLI::App &commands =
        *app.add_subcommand("commands", "The reference of the commands that a line may hold");
    auto const words = std::make_shared<std::vector<std::string>>();
    auto const markdown = std::make_shared<bool>(false);
    commands.add_option("WORD", *words,
                        "Show the commands whose keyword holds these words; without, list all");
    commands.add_flag("--markdown", *markdown, "Print the whole reference as a page");
    commands.callback([words, markdown, &action] {
        action = [words, markdown] { return PrintReference(*words, *markdown); };
    });
}
