#include "tests/support/RandomLines.h"

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;
using enum ArgumentKind;

namespace {

constexpr char const *PINS[] = {"a", "b", "o", "z", "io", "D(3:0)", "Q(0:7)", "K(2)", "one(3:3)"};
constexpr char const *DIRECTIONS[] = {"in", "in", "out", "out", "bi", "in", "out", "in", "in"};
constexpr char const *BASES[] = {"D", "d", "E", "s", "T", "x_DUMMY", "q"};
constexpr char const *INSTANCES[] = {"u1", "U2", "u3", "v"};
constexpr char const *COMPONENTS[] = {"C", "c", "B"};
constexpr char const *ATTRIBUTES[] = {"INIT", "K", "Level", "BOX_TYPE", "k"};
constexpr char const *VALUES[] = {"1",      "0",    "x",       "2.50",     "ORVANE", "4:b:1010",
                                  "8:h:FF", "\"\"", "\"a b\"", "10:d:512", "'it'"};
constexpr char const *TEXTS[] = {"hello", "a fairly long text of many words that has to wrap",
                                 "\"quoted  blanks\"", "/*", "--"};

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
    for (Argument const &argument : command.arguments)
        if (!argument.optional || Below(2))
            line += " " + Word(argument.alternative != NONE && Below(2) ? argument.alternative
                                                                        : argument.kind);
    return line + "\n";
}

std::string RandomLines::Word(ArgumentKind kind) {
    switch (kind) {
    case COMPONENT:
        return Pick(COMPONENTS);
    case INSTANCE:
        return Pick(INSTANCES);
    case COMPONENT_PIN:
        return Pick(COMPONENTS) + std::string(".") + Pick(PINS);
    case INSTANCE_PIN:
        return Pick(INSTANCES) + std::string(".") + Pick(PINS);
    case PIN:
        return Pick(PINS);
    case SIGNAL:
        return Name();
    case ATTRIBUTE:
        return Pick(ATTRIBUTES);
    case VALUE:
        return Pick(VALUES);
    case TEXT:
        return Pick(TEXTS);
    case USER_TYPE:
        return Pick(Vocabulary::ATTRIBUTE_TYPES);
    default:
        break;
    }
    std::span<Vocabulary::Choice const> const choices = CommandReference::GetArgument(kind).choices;
    if (choices.empty())
        return "name";
    Vocabulary::Choice const &choice = Pick(choices);
    return choice.prefix + std::string(Below(8) ? Pick(choice.words) : "x");
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
