#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "vesk_hdl/engine/HdlCmd.h"
#include "vesk_hdl/engine/PinReference.h"

using namespace Vesk_Hdl;

namespace {

/// A command that tells the keyword that made it as its refusal.
template <int N> class TellingCommand : public Command {
public:
    static inline int alive = 0;
    explicit TellingCommand(Model *owner) : Command(owner) { ++alive; }
    ~TellingCommand() override { --alive; }
    bool ParseArguments(StringArray const &tokens) override { return tokens.GetSize() < 9; }
    void Execute() override { GetModel()->AddComponent(nullptr); }
    char const *GetKeyword() const override { return N == 1 ? "100% one" : "two"; }
    static Command *Make(Model *owner, StringArray const &) { return new TellingCommand(owner); }
};

int CreatorOf(CommandFactory const &factory, char const *line) {
    auto const creator = factory.GetCommandCreator(line);
    return creator == TellingCommand<1>::Make ? 1 : creator == TellingCommand<2>::Make ? 2 : 0;
}

TEST(CommandFactory, TheLongestKeywordWins) {
    CommandFactory factory;
    factory.AddCommandCreator("  TELL   a ", TellingCommand<1>::Make);
    factory.AddCommandCreator("Tell A b c d", TellingCommand<2>::Make);
    struct Row {
        char const *line;
        int creator;
    };
    for (Row const &row : std::vector<Row>{{"tell A", 1},
                                           {"TELL a b c", 1},
                                           {"  tell   a b C d e", 2},
                                           {"'tell a' x", 1},
                                           {"\"tell a b\" 'c d'", 2},
                                           {"tell", 0},
                                           {"tell ab", 0},
                                           {"tell\ta", 0},
                                           {"x tell a", 0},
                                           {"tell '' a", 0},
                                           {"", 0}})
        EXPECT_EQ(row.creator, CreatorOf(factory, row.line)) << row.line;
    StringArray words;
    words.Add("TELL");
    words.Add("A");
    factory.AddCommandCreator(words, TellingCommand<2>::Make); // in place of the former
    EXPECT_EQ(2, CreatorOf(factory, "tell a"));
    CommandFactory copy;
    copy = factory;
    factory.AddCommandCreator("late", TellingCommand<1>::Make);
    EXPECT_EQ(1, CreatorOf(copy, "LATE"));
    std::unique_ptr<Command> const made(factory.CreateCommand(nullptr, "late 1"));
    EXPECT_TRUE(made && !made->GetModel());
    EXPECT_EQ(nullptr, factory.CreateCommand(nullptr, "unknown"));
}

/// A command that runs another line before it looks at its own.
class NestingCommand : public Command {
public:
    static inline std::string seen;
    using Command::Command;
    bool ParseArguments(StringArray const &tokens) override {
        GetModel()->Execute("ADD SIGNAL 'in side' in");
        seen = tokens.Concatenate("|");
        return true;
    }
    void Execute() override {}
    char const *GetKeyword() const override { return "nest"; }
    static Command *Make(Model *owner, StringArray const &) { return new NestingCommand(owner); }
};

TEST(Model, EachLineHasItsOwnTokensAlsoInsideAnother) {
    Design design;
    design.factory.AddCommandCreator("nest", NestingCommand::Make);
    for (char const *const line :
         {"nest a 'b c' d", "nest a bcd e f g h", "nest", "nest x ''  y"}) {
        Basis::StringBase<char> const alone =
            StringArray(line, " ", true, "\"\"''").Concatenate("|");
        if (Signal *const made = design.netlist.GetSignal("in side"))
            design.netlist.Remove(made);
        EXPECT_EQ("", Refusal(design.model, {line})) << line;
        EXPECT_EQ(alone.GetText(), NestingCommand::seen) << line;
    }
}

TEST(CommandManager, KeepsWhatRanAndDeletesWhatFailed) {
    Design design;
    design.factory.AddCommandCreator("tell", TellingCommand<1>::Make);
    CommandManager &manager = *design.model.GetCommandManager();
    struct Row {
        char const *line;
        char const *message;
    };
    for (Row const &row :
         std::vector<Row>{{"unknown", "Command not find.\n"},
                          {"tell", "Invalid Name.\n"},
                          {"tell 2 3 4 5 6 7 8 9", "100% one: Invalid Arguments.\n"},
                          {"noop", ""}}) {
        int const before = manager.GetDoneCommandCount();
        EXPECT_EQ(row.message, Refusal(design.model, {row.line})) << row.line;
        EXPECT_EQ(0, TellingCommand<1>::alive) << row.line;
        EXPECT_EQ(before + (row.message[0] == '\0'), manager.GetDoneCommandCount()) << row.line;
    }
    manager.AddDoneCommand(new TellingCommand<1>(nullptr));
    manager.AddDoneCommand(nullptr);
    EXPECT_EQ(2, manager.GetDoneCommandCount());
    manager.Clear();
    EXPECT_EQ(0, manager.GetDoneCommandCount());
    EXPECT_EQ(0, TellingCommand<1>::alive);
}

TEST(Command, NeedsAModelButForNoop) {
    CommandFactory factory;
    for (char const *const line :
         {"NOOP", "SET NETLIST NAME n", "SET SOURCE FILE f", "ADD COMPONENT c", "ADD PIN c p in",
          "ADD INSTANCE c i", "ADD PORT p in", "ADD SIGNAL s", "CONNECT SIGNAL a b",
          "CONNECT SIGNAL a b.c", "ASSIGN CONSTANT a 1", "WRITE VHDL /dev/null"}) {
        StringArray const tokens(line, " ", true, "\"\"''");
        CommandManager manager;
        EXPECT_EQ(std::string(line) == "NOOP" ? "" : "Missing Model.\n",
                  MessageOf([&] { manager.CreateAndExecute(tokens, nullptr, &factory); }))
            << line;
    }
}

TEST(DesignCommands, Grammar) {
    struct Row {
        char const *line;
        char const *message;
    };
    for (Row const &row :
         std::vector<Row>{{"add", "Command not find.\n"},
                          {"-- ADD SIGNAL s", "Command not find.\n"},
                          {"noop a b c", ""},
                          {"set netlist name", "SET NETLIST NAME: Invalid Arguments.\n"},
                          {"set netlist name \"\"", "SET NETLIST NAME: Invalid Arguments.\n"},
                          {"set netlist name \"\" x", "SET NETLIST NAME: Invalid Arguments.\n"},
                          {"set netlist name \"a b\" x", ""},
                          {"Set Source File", "SET SOURCE FILE: Invalid Arguments.\n"},
                          {"Set Source File f", ""},
                          {"add component", "ADD COMPONENT: Invalid Arguments.\n"},
                          {"add component '' x", "ADD COMPONENT: Invalid Arguments.\n"},
                          {"add component PIN x", ""},
                          {"'add component' C1", "ADD COMPONENT: Invalid Arguments.\n"},
                          {"'add component' x C1", ""},
                          {"ADD PIN CELL p", "ADD PIN: Invalid Arguments.\n"},
                          {"ADD PIN CELL p Bogus", "ADD PIN: Invalid Arguments.\n"},
                          {"ADD PIN CELL p inout 1", "ADD PIN: Invalid Arguments.\n"},
                          {"ADD PIN CELL p in", ""},
                          {"ADD PIN CELL p bi 4:h:F x", ""},
                          {"ADD PIN p CELL in", "Component \"p\" not found.\n"},
                          {"ADD INSTANCE CELL", "ADD INSTANCE: Invalid Arguments.\n"},
                          {"ADD INSTANCE n1 n2", "Component \"n1\" not found.\n"},
                          {"ADD INSTANCE CELL n1 x", ""},
                          {"ADD INSTANCE CELL \"\" x", ""}, // an empty name is a name
                          {"ADD SIGNAL", "ADD SIGNAL: Invalid Arguments.\n"},
                          {"ADD SIGNAL s Bogus", "ADD SIGNAL: Invalid Arguments.\n"},
                          {"ADD SIGNAL s '' x", "ADD SIGNAL: Invalid Arguments.\n"},
                          {"ADD SIGNAL s Input x", ""},
                          {"ADD SIGNAL s", ""},
                          {"ADD PORT p", "ADD PORT: Invalid Arguments.\n"},
                          {"ADD PORT p Bogus", "ADD PORT: Invalid Arguments.\n"},
                          {"ADD PORT p o x", ""},
                          {"ADD PORT u1 in", "Identifier \"u1\" already defined.\n"},
                          {"CONNECT SIGNAL s", "CONNECT SIGNAL: Invalid Arguments.\n"},
                          {"CONNECT SIGNAL s ''", "CONNECT SIGNAL: Invalid Arguments.\n"},
                          {"CONNECT SIGNAL s u1.A", ""},
                          {"CONNECT SIGNAL s u1.A.B", "Pin \"u1.A.B\" not found.\n"},
                          {"CONNECT SIGNAL s u1..A", "Pin \"u1..A\" not found.\n"},
                          {"CONNECT SIGNAL s .u1.A", "Signal \".u1\" not found.\n"},
                          {"ASSIGN CONSTANT s", "ASSIGN CONSTANT: Invalid Arguments.\n"},
                          {"ASSIGN CONSTANT s 1 x", ""},
                          {"ASSIGN CONSTANT u1.A 1", ""},
                          {"ASSIGN CONSTANT u1.Z 1", "Pin \"Z\" not found.\n"},
                          {"WRITE VHDL", "WRITE VHDL: Invalid Arguments.\n"},
                          {"write vhdl '' x '' x", "WRITE VHDL: Invalid Arguments.\n"}}) {
        Design design(Cells());
        EXPECT_EQ(row.message, Refusal(design.model, {row.line})) << row.line;
    }
}

TEST(DesignCommands, DoWhatTheyName) {
    Design design(
        CellsAnd({"SET NETLIST NAME 'my [top]'", "SET SOURCE FILE \"a b.sch\"",
                  "ADD PIN CELL p bi 4:h:F", "ADD PORT D[7-0] o", "ADD SIGNAL s Input",
                  "CONNECT SIGNAL s u1.", "CONNECT SIGNAL s u1.A", "CONNECT SIGNAL s D(3)",
                  "ASSIGN CONSTANT D(7:0) 8:h:0A", "CONNECT SIGNAL t(1:0) u1.b(3:0)"}));
    EXPECT_STREQ("my [top]", design.model.GetName());
    EXPECT_STREQ("a b.sch", design.model.GetSourceFileName());
    Pin const *const pin = design.model.GetComponent("CELL")->GetPin("p");
    EXPECT_EQ(Polarity::BIDIRECTIONAL, pin->GetPolarity().GetValue());
    EXPECT_STREQ("F", pin->GetDefaultValue().GetValue());
    EXPECT_EQ("out D(7:0)\ns: u1.A <- u1. D(3)\nu1.\nout D(3)\nt(1:0): u1.B(3:0)\n",
              Wiring(design.netlist));
    EXPECT_STREQ("0A", design.model.GetSignal("D(7:0)")->GetConstantValue().GetValue());
}

TEST(PinReference, SplitsAtTheFirstPoint) {
    struct Row {
        char const *text;
        char const *left; ///< null for no reference
        char const *right;
    };
    for (Row const &row : std::vector<Row>{{"i1.A", "i1", "A"},
                                           {"i1.A.B", "i1", "A.B"},
                                           {"a..b", "a", ".b"},
                                           {"a..", "a", "."},
                                           {".a.b", ".a", "b"},
                                           {"..a.b", "..a", "b"},
                                           {"i1.", nullptr, nullptr},
                                           {".a", nullptr, nullptr},
                                           {".", nullptr, nullptr},
                                           {"...", nullptr, nullptr},
                                           {"a", nullptr, nullptr},
                                           {"a(7:0)", nullptr, nullptr},
                                           {"", nullptr, nullptr}}) {
        Basis::StringBase<char> left = "?";
        Basis::StringBase<char> right = "?";
        EXPECT_EQ(row.left != nullptr, IsPinReference(row.text)) << row.text;
        EXPECT_EQ(row.left != nullptr, SplitPinReference(row.text, left, right)) << row.text;
        EXPECT_STREQ(row.left ? row.left : "?", left) << row.text;
        EXPECT_STREQ(row.right ? row.right : "?", right) << row.text;
    }
}

} // namespace
