#include "tests/support/RandomLines.h"

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

constexpr char const *PINS[] = {"a", "b", "o", "z", "io", "D(3:0)", "Q(0:7)", "K(2)", "one(3:3)"};
constexpr char const *DIRECTIONS[] = {"in", "in", "out", "out", "bi", "in", "out", "in", "in"};
constexpr char const *BASES[] = {"D", "d", "E", "s", "T", "x_DUMMY", "q"};
constexpr char const *INSTANCES[] = {"u1", "U2", "u3", "v"};
constexpr char const *COMPONENTS[] = {"C", "c", "B"};
constexpr char const *POLARITIES[] = {"in", "OUT", "BiDir", "x"};
constexpr char const *ATTRIBUTES[] = {"INIT", "K", "Level", "BOX_TYPE", "k"};
constexpr char const *TYPES[] = {"String", "Integer", "Float",     "Boolean",
                                 "Bit",    "User",    "BitVector", "word"};
constexpr char const *VALUES[] = {"1",      "0",    "x",       "2.50",     "ORVANE", "4:b:1010",
                                  "8:h:FF", "\"\"", "\"a b\"", "10:d:512", "'it'"};
constexpr char const *SETTINGS[] = {"-GENERIC=SYN",    "-GENERIC=NOSYN",       "-GENERIC=none",
                                    "-SYNATTR=ASSIGN", "-SYNATTR=ASSIGNNODEC", "-SYNATTR=x"};
constexpr char const *TOOLS[] = {"QRT",         "exemplar",  "SYNPLICITY", "synopsys",
                                 "VERILOG2001", "PRECISION", "other"};
constexpr char const *OPTIONS[] = {"-APPEND", "-NOHEADER", "-OVERWRITE", "-x"};
constexpr char const *TEXTS[] = {"hello", "a fairly long text of many words that has to wrap",
                                 "\"quoted  blanks\"", "/*", "--"};
constexpr char const *FLAGS[] = {"false", "true", ""};

std::vector<std::string> Split(std::string const &text, char separator) {
    std::vector<std::string> parts(1);
    for (char const c : text)
        if (c == separator)
            parts.emplace_back();
        else
            parts.back() += c;
    return parts;
}

} // namespace

std::string RandomLines::Preface() {
    std::string lines = "ADD COMPONENT C\nADD COMPONENT B\n";
    for (std::size_t i = 0; i < std::size(PINS); ++i)
        for (char const *const component : {"C", "B"})
            lines +=
                std::string("ADD PIN ") + component + " " + PINS[i] + " " + DIRECTIONS[i] + "\n";
    for (char const *const instance : INSTANCES)
        lines += std::string("ADD INSTANCE ") + (*instance == 'v' ? "B " : "C ") + instance + "\n";
    return lines;
}

std::string RandomLines::Next() {
    CommandHelp const &command =
        Below(2) ? *CommandReference::Find("CONNECT SIGNAL")
                 : *CommandReference::GetAt(Below(CommandReference::GetCount()));
    std::string line = command.keyword;
    for (std::string word : Split(command.grammar, ' ')) {
        bool const optional = word.find_first_of("[]") != std::string::npos;
        std::erase_if(word, [](char c) { return c == '[' || c == ']'; });
        if (!word.empty() && (!optional || Below(2)))
            line += " " + Argument(word);
    }
    return line + "\n";
}

std::string RandomLines::Argument(std::string word) {
    std::vector<std::string> const alternatives = Split(word, '|');
    word = alternatives[random() % alternatives.size()];
    if (alternatives.size() == 3)
        return word; // of UPPERCASE and LOWERCASE
    if (word == "component")
        return Pick(COMPONENTS);
    if (word == "instance")
        return Pick(INSTANCES);
    if (word == "component.pin")
        return Pick(COMPONENTS) + std::string(".") + Pick(PINS);
    if (word == "instance.pin")
        return Pick(INSTANCES) + std::string(".") + Pick(PINS);
    if (word == "pin")
        return Pick(PINS);
    if (word == "signal")
        return Name();
    if (word == "polarity")
        return Pick(POLARITIES);
    if (word == "attribute")
        return Pick(ATTRIBUTES);
    if (word == "usertype")
        return Pick(TYPES);
    if (word == "-TYPE=type")
        return std::string("-TYPE=") + Pick(TYPES);
    if (word == "setting")
        return Pick(SETTINGS);
    if (word == "option")
        return Pick(OPTIONS);
    if (word == "tool")
        return Pick(TOOLS);
    if (word == "flag")
        return Pick(FLAGS);
    if (word == "text...")
        return Pick(TEXTS);
    return word == "value" ? Pick(VALUES) : "name";
}

std::string RandomLines::Index() { return std::to_string(Below(10)); }

std::string RandomLines::SimpleName() {
    std::string const base = Pick(BASES);
    switch (Below(4)) {
    case 0:
        return base;
    case 1:
        return base + "(" + Index() + ")";
    default:
        return base + "(" + Index() + ":" + Index() + ")";
    }
}

std::string RandomLines::Name() {
    std::string name = SimpleName();
    switch (Below(8)) {
    case 0:
        for (int more = 1 + Below(3); more > 0; --more)
            name += (Below(4) ? "," : "\\") + SimpleName();
        break;
    case 1:
        return Pick(BASES) + ("[" + Index()) + "-" + Index() + "]";
    case 2:
        return Pick(INSTANCES) + std::string("_D_CONST_SIGNAL(3:0)"); // as a tied pin names it
    default:
        break;
    }
    return name;
}
