// Hostile kinds that follow from the grammar of each command.

#include <cctype>
#include <sstream>

#include "bench/hostile_parts.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace {

struct Placeholder {
    char const *begin; ///< of the word in the grammar
    char const *text;  ///< {o} is the number of the object, or nothing
};

/// The first one that fits counts.
constexpr Placeholder PLACEHOLDERS[] = {
    {"component.pin", "C{o}.P"},
    {"instance.pin", "U{o}.P"},
    {"component", "C{o}"},
    {"instance|siganl", "signal"},
    {"instance|signal", "signal"},
    {"instance", "U{o}"},
    {"signal|instance.pin", "U{o}.P"},
    {"signal", "S{o}"},
    {"[-TYPE", "-TYPE=User"},
    {"attribute", "A"},
    {"setting", "-GENERIC=SYN"},
    {"[setting", "-SYNATTR=ASSIGN"},
    {"polarity", "in"},
    {"[polarity", "in"},
    {"pin", "P"},
    {"[flag", "true"},
    {"[option", ""},
    {"tool", "SYNOPSYS"},
    {"", "v{i}"},
};

std::vector<std::string> WordsOf(std::string const &text) {
    std::istringstream stream(text);
    std::vector<std::string> words;
    for (std::string word; stream >> word;)
        words.push_back(word);
    return words;
}

void Replace(std::string &text, std::string_view mark, std::string_view with) {
    for (std::size_t at = text.find(mark); at != std::string::npos; at = text.find(mark, at))
        text.replace(at, mark.size(), with);
}

/// The words of the command's line. A name that it makes is new in each line, as is the attribute.
std::vector<std::string> LineOf(Vesk_Hdl::CommandHelp const &command) {
    std::string const keyword = command.keyword;
    bool const writes = keyword.rfind("WRITE ", 0) == 0;
    std::vector<std::string> words = {keyword};
    for (std::string const &word : WordsOf(command.grammar))
        for (Placeholder const &placeholder : PLACEHOLDERS)
            if (word.rfind(placeholder.begin, 0) == 0) {
                if (*placeholder.text)
                    words.emplace_back(writes ? "/dev/null" : placeholder.text);
                break;
            }
    std::string const adds = keyword.rfind("ADD ", 0) == 0 ? keyword.substr(4) : "";
    if (adds == "PIN")
        words[2] = "N{i}";
    else if (adds == "INSTANCE")
        words[2] = "N{i}";
    else if (adds == "PORT" || adds == "SIGNAL" || adds == "COMPONENT")
        words[1] = "N{i}";
    else if (adds.find("ATTRIBUTE") != std::string::npos)
        words[words.size() - 2] = "A{i}";
    return words;
}

/// What has to be there for the line to run.
std::string ObjectsFor(Vesk_Hdl::CommandHelp const &command) {
    std::string lines = "ADD COMPONENT C{o}\nADD PIN C{o} P in\nADD INSTANCE C{o} U{o}\n"
                        "ADD SIGNAL S{o}\n";
    std::string const keyword = command.keyword;
    std::size_t const at = keyword.find(" ATTRIBUTE ");
    if (at == std::string::npos)
        return lines;
    std::vector<std::string> const words = LineOf(command);
    bool const ofModule = keyword.find("MODULE") != std::string::npos;
    return lines + "ADD" + keyword.substr(3, at - 3) + " ATTRIBUTE " +
           (ofModule ? "" : words[1] + " ") + "-TYPE=User A v\n";
}

std::string Joined(std::vector<std::string> const &words) {
    std::string line;
    for (std::string const &word : words)
        line += (line.empty() ? "" : " ") + word;
    return line + "\n";
}

void AddKindsOf(Vesk_Hdl::CommandHelp const &command, std::vector<HostileKind> &kinds) {
    std::string name;
    for (char const *c = command.keyword; *c; ++c)
        name += *c == ' ' ? '-' : static_cast<char>(std::tolower(*c));
    std::string const what = std::string("lines ") + command.keyword;
    bool const writes = name.rfind("write-", 0) == 0;
    std::vector<std::string> const words = LineOf(command);
    std::string const objects = ObjectsFor(command);

    auto const numbered = [](std::string text, char const *number) {
        Replace(text, "{o}", number);
        return text;
    };
    std::string const line = Joined(words);
    kinds.push_back({name + ".one",
                     what + " for one object",
                     {Once(numbered(objects, "")), Each(numbered(line, ""))},
                     writes ? 4000L : 64000L});
    kinds.push_back({name + ".many",
                     what + " for n objects",
                     {Each(numbered(objects, "{i}")), Each(numbered(line, "{i}"))},
                     writes ? 1000L : 16000L,
                     writes ? WRITTEN_OFTEN : nullptr});

    std::string longest = objects;
    for (std::size_t at = 1; at < words.size(); ++at) {
        std::vector<std::string> longWords = words;
        longWords[at] = (longWords[at][0] == '-' ? longWords[at] : "L") + "{long}";
        longest += Joined(longWords);
    }
    if (words.size() > 1)
        kinds.push_back(
            {name + ".long", what + " with a long word, times 16", {Once(numbered(longest, ""))}});
}

} // namespace

std::vector<HostileKind> CommandKinds() {
    std::vector<HostileKind> kinds;
    for (int i = 0; i < Vesk_Hdl::CommandReference::GetCount(); ++i)
        AddKindsOf(*Vesk_Hdl::CommandReference::GetAt(i), kinds);
    return kinds;
}
