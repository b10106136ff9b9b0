#include <new>
#include <typeinfo>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "vesk_hdl/engine/HdlCmd.h"

using namespace Vesk_Hdl;

namespace {

/// A command whose lines are always refused. N distinguishes two creators.
template <int N> class RefusedCommand : public Command {
public:
    static inline int alive = 0;
    explicit RefusedCommand(Model *owner) : Command(owner) { ++alive; }
    ~RefusedCommand() override { --alive; }
    bool ParseArguments(StringArray const &tokens) override { return tokens.GetSize() < 9; }
    void Execute() override { GetModel()->AddComponent(nullptr); }
    char const *GetKeyword() const override { return N == 1 ? "100% one" : "two"; }
    static Command *Make(Model *owner, StringArray const &) { return new RefusedCommand(owner); }
};

int CreatorOf(CommandFactory const &factory, char const *line) {
    auto const creator = factory.GetCommandCreator(line);
    return creator == RefusedCommand<1>::Make ? 1 : creator == RefusedCommand<2>::Make ? 2 : 0;
}

TEST(CommandFactory, TheLongestKeywordWins) {
    CommandFactory factory;
    factory.AddCommandCreator("  TELL   a ", RefusedCommand<1>::Make);
    factory.AddCommandCreator("Tell A b c d", RefusedCommand<2>::Make);
    using Row = std::pair<char const *, int>;
    for (auto const &[line, creator] :
         {Row{"tell A", 1}, Row{"TELL a b c", 1}, Row{"  tell   a b C d e", 2},
          Row{"'tell a' x", 1}, Row{"\"tell a b\" 'c d'", 2}, Row{"tell", 0}, Row{"tell ab", 0},
          Row{"tell\ta", 0}, Row{"x tell a", 0}, Row{"tell '' a", 0}, Row{"", 0}})
        EXPECT_EQ(creator, CreatorOf(factory, line)) << line;
    factory.AddCommandCreator(StringArray("TELL A", " ", true, nullptr),
                              RefusedCommand<2>::Make); // in place of the former
    EXPECT_EQ(2, CreatorOf(factory, "tell a"));
    CommandFactory copy;
    copy = factory;
    factory.AddCommandCreator("late", RefusedCommand<1>::Make);
    EXPECT_EQ(1, CreatorOf(copy, "LATE"));
    EXPECT_EQ(nullptr, factory.CreateCommand(nullptr, "unknown"));
    for (int i = 0; i < 40; ++i) // more words than follow any word of the library's keywords
        factory.AddCommandCreator(("many k" + std::to_string(i)).c_str(), RefusedCommand<1>::Make);
    factory.AddCommandCreator("MANY K39", RefusedCommand<2>::Make);
    for (auto const &[line, creator] : {Row{"Many K0", 1}, Row{"many k38 x", 1}, Row{"MANY k39", 2},
                                        Row{"many k40", 0}, Row{"'many k20'", 1}})
        EXPECT_EQ(creator, CreatorOf(factory, line)) << line;
    std::string endless = "word";
    for (int i = 0; i < 100000; ++i)
        endless += " word";
    factory.AddCommandCreator(endless.c_str(), RefusedCommand<1>::Make);
    EXPECT_EQ(1, CreatorOf(factory, ("'" + endless + "'").c_str()));
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
    design.factory.AddCommandCreator("tell", RefusedCommand<1>::Make);
    CommandManager &manager = *design.model.GetCommandManager();
    for (auto const &[line, message] :
         {std::pair{"unknown", "Command not find.\n"},
          {"tell", "Invalid Name.\n"},
          {"tell 2 3 4 5 6 7 8 9", "100% one: Invalid Arguments.\n"}}) {
        EXPECT_EQ(message, Refusal(design.model, {line})) << line;
        EXPECT_EQ(0, RefusedCommand<1>::alive) << line;
        EXPECT_EQ(0, manager.GetDoneCommandCount()) << line;
    }
    manager.AddDoneCommand(new RefusedCommand<1>(nullptr));
    manager.AddDoneCommand(nullptr);
    EXPECT_EQ("", Refusal(design.model, {"noop"}));
    EXPECT_EQ(2, manager.GetDoneCommandCount());
    manager.Clear();
    EXPECT_EQ(0, manager.GetDoneCommandCount());
    EXPECT_EQ(0, RefusedCommand<1>::alive);
}

struct OwnRefusal : Exception {
    using Exception::Exception;
};

/// A command that throws what its first argument names.
class ThrowingCommand : public Command {
public:
    static inline ThrowingCommand *alive = nullptr;
    ThrowingCommand(Model *owner) : Command(owner) { alive = this; }
    ~ThrowingCommand() override { alive = nullptr; }
    bool ParseArguments(StringArray const &tokens) override {
        what = tokens.GetAt(1);
        return true;
    }
    void Execute() override {
        if (what == "refusal")
            throw OwnRefusal(Basis::Exception("m", "f", "r", 7).setDescription("own"));
        if (what == "memory")
            throw std::bad_alloc();
        throw 5;
    }
    char const *GetKeyword() const override { return "throw"; }
    static Command *Make(Model *owner, StringArray const &) { return new ThrowingCommand(owner); }

private:
    Basis::StringBase<char> what;
};

TEST(CommandManager, WhatAClientsCommandThrows) {
    Design design;
    design.factory.AddCommandCreator("throw", ThrowingCommand::Make);
    try {
        design.model.Execute("throw refusal");
        ADD_FAILURE();
    } catch (Exception const &refusal) {
        EXPECT_EQ(typeid(refusal), typeid(Exception)); // a new one, not the command's
        EXPECT_STREQ(refusal.getDescription(), "own");
        EXPECT_EQ(refusal.getLine(), 7);
    }
    EXPECT_EQ(ThrowingCommand::alive, nullptr);
    EXPECT_THROW(design.model.Execute("throw memory"), std::bad_alloc);
    EXPECT_EQ(ThrowingCommand::alive, nullptr);
    EXPECT_THROW(design.model.Execute("throw 5"), int);
    EXPECT_NE(ThrowingCommand::alive, nullptr); // the client's, who may have kept it
    delete ThrowingCommand::alive;
    EXPECT_EQ(design.model.GetCommandManager()->GetDoneCommandCount(), 0);
}

TEST(Exception, KindAndSubjectOfEachRefusal) {
    using E = Exception;
    using Row = std::tuple<char const *, E::Kind, char const *>;
    for (auto const &[lines, kind, subject] :
         {Row{"add; x y", E::UNKNOWN_COMMAND, ""},
          Row{"add pin CELL; add pin", E::INVALID_ARGUMENTS, "ADD PIN"},
          Row{"ADD COMPONENT U1; ADD INSTANCE CELL U1; ADD SIGNAL U1; CONNECT SIGNAL U1 u2.A",
              E::NAME_TAKEN, "U1"},
          Row{"ADD SIGNAL d(3:0); ADD PORT d(3:0) in", E::BUS_DECLARED, "d(3:0)"},
          Row{"ADD PIN CELL a in", E::PIN_TAKEN, "a"},
          Row{"ADD INSTANCE X n; ADD PIN X p in; ADD COMPONENT COMMENT X c;"
              "ADD COMPONENT PIN COMMENT X.A c; SET COMPONENT PIN ATTRIBUTE VALUE X.A K v",
              E::COMPONENT_NOT_FOUND, "X"},
          Row{"CONNECT SIGNAL n X.A; ASSIGN CONSTANT X.A 1; ADD INSTANCE ATTRIBUTE X K;"
              "ADD INSTANCE PIN ATTRIBUTE X.A K; SET INSTANCE ATTRIBUTE VALUE X K v;"
              "SET INSTANCE ATTRIBUTE OPTION X K -GENERIC=SYN;"
              "SET INSTANCE ATTRIBUTE OPTION X K -SYNATTR=NONE",
              E::INSTANCE_NOT_FOUND, "X"},
          Row{"CONNECT SIGNAL X(3) u1.A; ASSIGN CONSTANT X(3) 1; ADD SIGNAL COMMENT X(3) c",
              E::SIGNAL_NOT_FOUND, "X(3)"},
          Row{"CONNECT SIGNAL n u1.X; ASSIGN CONSTANT u1.X 1; ADD COMPONENT PIN COMMENT CELL.X c;"
              "SET INSTANCE PIN ATTRIBUTE VALUE u1.X K v",
              E::PIN_NOT_FOUND, "X"},
          Row{"SET MODULE ATTRIBUTE VALUE X v; SET INSTANCE ATTRIBUTE USERTYPE u1 X t",
              E::ATTRIBUTE_NOT_FOUND, "X"},
          Row{"ADD MODULE ATTRIBUTE -TYPE=Word K v", E::INVALID_ATTRIBUTE_TYPE, "Word"},
          Row{"SET MODULE ATTRIBUTE USERTYPE w t", E::NOT_A_USER_ATTRIBUTE, "W"},
          Row{"SET MODULE ATTRIBUTE OPTION W -GENERIC=1", E::INVALID_GENERIC_WORD, "1"},
          Row{"SET MODULE ATTRIBUTE OPTION W -SYNATTR=", E::INVALID_SYNTHESIS_WORD, ""}})
        for (std::string const &line : Pieces(lines)) {
            Design design(CellsAnd("sig D(7:0); ADD MODULE ATTRIBUTE -TYPE=Integer W 1"));
            try {
                design.model.Execute(line.c_str());
                ADD_FAILURE() << line;
            } catch (E const &refusal) {
                EXPECT_EQ(refusal.getKind(), kind) << line;
                EXPECT_STREQ(refusal.getSubject(), subject) << line;
            }
        }
    Model model;
    try {
        model.AddSignal(nullptr);
    } catch (E const &refusal) {
        EXPECT_EQ(refusal.getKind(), E::INVALID_NAME);
    }
    EXPECT_EQ(Basis::Exception("m", "f", "r", 1).getKind(), E::OTHER);
}

TEST(DesignCommands, Grammar) {
    // Lines, each in a design of its own, and the message of them all.
    using Row = std::pair<char const *, char const *>;
    for (auto const &[lines, message] :
         {Row{"noop a b c; set netlist name \"a b\" x; add component PIN x;'add component' x C1;"
              "ADD PIN CELL p bi 4:h:F x; ADD INSTANCE CELL n1 x; ADD INSTANCE CELL \"\" x;"
              "ADD SIGNAL s Input x; ADD PORT p o x; CONNECT SIGNAL s u1.; ASSIGN CONSTANT s 1 x",
              ""},
          Row{"add; -- ADD SIGNAL s", "Command not find.\n"},
          Row{"set netlist name \"\" x", "SET NETLIST NAME: Invalid Arguments.\n"},
          Row{"set source file \"\" x", "SET SOURCE FILE: Invalid Arguments.\n"},
          Row{"add component '' x; 'add component' C1", "ADD COMPONENT: Invalid Arguments.\n"},
          Row{"ADD PIN CELL p inout 1", "ADD PIN: Invalid Arguments.\n"},
          Row{"ADD PIN p CELL in; ADD INSTANCE p n2", "Component \"p\" not found.\n"},
          Row{"ADD SIGNAL s Bogus; ADD SIGNAL s '' x", "ADD SIGNAL: Invalid Arguments.\n"},
          Row{"ADD PORT p Bogus", "ADD PORT: Invalid Arguments.\n"},
          Row{"ADD PORT u1 in", "Identifier \"u1\" already defined.\n"},
          Row{"CONNECT SIGNAL s ''", "CONNECT SIGNAL: Invalid Arguments.\n"},
          Row{"CONNECT SIGNAL s u1.A.B", "Pin \"u1.A.B\" not found.\n"},
          Row{"CONNECT SIGNAL s u1..A", "Pin \"u1..A\" not found.\n"},
          Row{"CONNECT SIGNAL s u1..", "Pin \"u1..\" not found.\n"},
          Row{"CONNECT SIGNAL s .u1.A", "Signal \".u1\" not found.\n"},
          Row{"ASSIGN CONSTANT u1.Z 1", "Pin \"Z\" not found.\n"},
          Row{"write vhdl '' x '' x", "WRITE VHDL: Invalid Arguments.\n"}})
        for (std::string const &line : Pieces(lines)) {
            Design design(Cells());
            EXPECT_EQ(message, Refusal(design.model, {line})) << line;
        }
}

} // namespace
