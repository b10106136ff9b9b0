#include "tool/commands/CommandsCommand.h"

#include <algorithm>
#include <iomanip>
#include <iostream>
#include <map>
#include <memory>

#include <CLI/CLI.hpp>

#include "tool/diagnostics/Words.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

constexpr std::size_t COLUMNS = 80;

/// What stands for a word of a grammar.
std::map<std::string, char const *> const &Glossary() {
    static std::map<std::string, char const *> const glossary = {
        {"-TYPE=type", "String (the default), Integer, Float, Boolean, Bit, BitVector or User"},
        {"attribute", "the name of an attribute"},
        {"component", "the name of a component"},
        {"component.pin", "a pin of a component, such as AND2.I0"},
        {"file", "the name of a file; in quotes if it holds blanks"},
        {"flag", "\"false\"; anything else, also nothing, means true"},
        {"instance", "the name of an instance"},
        {"instance.pin", "a pin of an instance, such as U1.I0"},
        {"library", "the name of a library, or of what is used of it"},
        {"name", "a word; in quotes if it holds blanks"},
        {"option", "-NOHEADER, -APPEND or -OVERWRITE"},
        {"pin", "the name of a pin: I0, or D(7:0) for eight bits"},
        {"polarity", "Input, Output or BiDirectional, or any beginning of one, in any case"},
        {"setting", "-GENERIC=NONE, SYN or NOSYN; -SYNATTR=NONE, ASSIGN or ASSIGNNODEC"},
        {"signal", "NET, BUS(7:0), a part of a bus such as BUS(3) and BUS(6:4), or A,BUS(1:0),B"},
        {"text...", "all words to the end of the line"},
        {"tool", "QRT, EXEMPLAR, SYNPLICITY, SYNOPSYS, VERILOG2001 or PRECISION"},
        {"usertype", "the name of a type"},
        {"value", "a text; of a constant or default 1, 0110 or WIDTH:BASE:DIGITS, as in 8:h:A5"}};
    return glossary;
}

/// The words of a grammar that stand for something, each once.
std::vector<std::string> PlaceholdersOf(CommandHelp const &command) {
    std::vector<std::string> found;
    std::string word;
    for (char const *at = command.grammar;; ++at) {
        if (*at && *at != ' ' && *at != '|' && *at != '[' && *at != ']') {
            word += *at;
            continue;
        }
        if (Glossary().count(word) && std::find(found.begin(), found.end(), word) == found.end())
            found.push_back(word);
        word.clear();
        if (!*at)
            return found;
    }
}

std::string GrammarOf(CommandHelp const &command) {
    return std::string(command.keyword) + (*command.grammar ? " " : "") + command.grammar;
}

/// A text with a word in front of it, wrapped into lines that stand under each other.
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
    std::vector<std::string> const placeholders = PlaceholdersOf(command);
    std::size_t width = 0;
    for (std::string const &word : placeholders)
        width = std::max(width, word.size());
    for (std::string const &word : placeholders)
        PrintWrapped(stream, "    " + word + std::string(width + 2 - word.size(), ' '),
                     Glossary().at(word));
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
           "them. A word in\n`\"` or `'` may hold blanks. `[ ]` stands around what may be missing, "
           "`|` between alternatives, `...`\nbehind a word that stands for all the rest. Names "
           "ignore case.\n\nThis page is what `vesk-hdl commands --markdown` prints; "
           "`vesk-hdl commands WORD...` shows one command.\n";
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &command = *CommandReference::GetAt(i);
        stream << "\n## " << command.keyword << "\n\n    " << GrammarOf(command) << "\n\n"
               << command.summary;
        if (*command.notes)
            stream << ' ' << command.notes;
        stream << "\n" << (*command.grammar || *command.refused ? "\n" : "");
        for (std::string const &word : PlaceholdersOf(command))
            stream << "- `" << word << "`: " << Glossary().at(word) << '\n';
        if (*command.refused)
            stream << "- Refused: " << command.refused << ".\n";
        stream << "\n```\n" << command.example << "\n```\n";
        if (*command.wrong)
            stream << "\nBehind it, `" << command.wrong << "` gives `" << command.message << "`\n";
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
