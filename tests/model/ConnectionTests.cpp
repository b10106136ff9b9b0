#include <functional>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "vesk_hdl/model/HdlModel.h"

using namespace Vesk_Hdl;

namespace {

TEST(Model, RefusedConnectionsKeepTheSignalsTheyMade) {
    struct Row {
        char const *name;
        std::function<void(Model &)> call;
        char const *message;
        char const *wiring;
    };
    for (Row const &row : std::vector<Row>{
             {"bit without a bus", [](Model &m) { m.ConnectSignals("a(3)", "y"); },
              "Signal \"a(3)\" not found.\n", ""},
             {"bit without a bus on the right", [](Model &m) { m.ConnectSignals("x", "a(3)"); },
              "Signal \"a(3)\" not found.\n", "x\n"},
             {"bit without a bus on a pin",
              [](Model &m) { m.ConnectSignalToPin("a(3)", "u1", "A"); },
              "Signal \"a(3)\" not found.\n", ""},
             {"constant bit", [](Model &m) { m.AssignConstantToSignal("a(3)", "1"); },
              "Signal \"a(3)\" not found.\n", ""},
             {"unknown instance", [](Model &m) { m.ConnectSignalToPin("x", "u9", "A"); },
              "Signal \"u9\" not found.\n", "x\n"},
             {"null instance", [](Model &m) { m.ConnectSignalToPin("x", nullptr, "A"); },
              "Signal \"\" not found.\n", "x\n"},
             {"unknown pin", [](Model &m) { m.ConnectSignalToPin("x", "U1", "Z"); },
              "Pin \"U1.Z\" not found.\n", "x\n"},
             {"null pin", [](Model &m) { m.ConnectSignalToPin("x", "u1", nullptr); },
              "Pin \"u1.\" not found.\n", "x\n"},
             {"name of an instance", [](Model &m) { m.ConnectSignals("x", "U1"); },
              "Identifier \"U1\" already defined.\n", "x\n"},
             {"member like an instance", [](Model &m) { m.ConnectSignals("x,b(1:0),u1", "y"); },
              "Identifier \"u1\" already defined.\n", "x\nb(1:0)\n"},
             {"constant on an unknown instance",
              [](Model &m) { m.AssignConstantToPin("u9", "A", "1"); }, "Signal \"u9\" not found.\n",
              ""},
             {"constant on an unknown pin", [](Model &m) { m.AssignConstantToPin("u1", "Z", "1"); },
              "Pin \"Z\" not found.\n", ""},
             {"name of the constant taken", [](Model &m) { m.AssignConstantToPin("u1", "Y", "1"); },
              "Identifier \"u1_Y_CONST_SIGNAL\" already defined.\n", ""}}) {
        Design design(CellsAnd({"ADD COMPONENT u1_Y_CONST_SIGNAL"}));
        design.model.SetModifiedFlag(false);
        EXPECT_EQ(row.message, MessageOf([&] { row.call(design.model); })) << row.name;
        EXPECT_EQ(row.wiring, Wiring(design.netlist)) << row.name;
        EXPECT_EQ(row.wiring[0] != '\0', design.model.IsModified()) << row.name;
    }
}

TEST(Model, DemandedNamesMakeSignals) {
    struct Row {
        char const *name;
        std::vector<Signal::SignalType> types;
    };
    using S = Signal;
    for (Row const &row : std::vector<Row>{
             {"x", {S::SIGNAL_SCALAR}},
             {"", {S::SIGNAL_SCALAR}},
             {"d(3:0)", {S::SIGNAL_BUS}},
             {"d[3-0]", {S::SIGNAL_BUS}}, // a scalar by its typed form, declared as what it reads
             {"b(3:0)", {S::SIGNAL_BUS_SLICE}},
             {"B(20:19)", {S::SIGNAL_BUS_SLICE}}, // the range is not tested
             {"b(3)", {S::SIGNAL_BUS_INDEX}},
             {"b[3]", {S::SIGNAL_SCALAR}}, // by its typed form
             {"x,b(3:0)\\b(3)",
              {S::SIGNAL_SCALAR, S::SIGNAL_BUS_SLICE, S::SIGNAL_BUS_INDEX, S::SIGNAL_COMPOUND_BUS}},
             {"x,c(3),d(1:0)",
              {S::SIGNAL_SCALAR, S::SIGNAL_SCALAR, S::SIGNAL_BUS, S::SIGNAL_COMPOUND_BUS}},
             {"b(3:0),x,B(3:0),X", {S::SIGNAL_BUS_SLICE, S::SIGNAL_SCALAR, S::SIGNAL_COMPOUND_BUS}},
             {"x,b[3]", {S::SIGNAL_SCALAR}}, // no compound by its typed form
             {"x y", {S::SIGNAL_SCALAR}}}) {
        Design design({"ADD SIGNAL b(7:0)"});
        EXPECT_TRUE(design.model.AssignConstantToSignal(row.name, "1"));
        EXPECT_TRUE(design.model.AssignConstantToSignal(row.name, "2:b:01")); // makes none anew
        std::vector<Signal::SignalType> types;
        ForEach(design.netlist.GetSignalIterator(),
                [&types](Signal *signal) { types.push_back(signal->GetSignalType()); });
        types.erase(types.begin());
        EXPECT_EQ(row.types, types) << row.name;
        Signal const *const signal = design.model.GetSignal(row.name);
        ASSERT_TRUE(signal) << row.name;
        EXPECT_STREQ("01", signal->GetConstantValue().GetValue()) << row.name;
    }
}

TEST(Model, ConnectionsAndConstants) {
    struct Row {
        char const *name;
        Lines lines;
        char const *wiring;
    };
    for (Row const &row : std::vector<Row>{
             {"a pin twice", {"CONNECT SIGNAL x u1.A", "CONNECT SIGNAL X u1.a"}, "x: u1.A\n"},
             {"a moved pin stays listed",
              {"CONNECT SIGNAL x u1.A", "CONNECT SIGNAL y u1.A"},
              "x: u1.A!\ny: u1.A\n"},
             {"links go one way",
              {"CONNECT SIGNAL x y", "CONNECT SIGNAL x y", "CONNECT SIGNAL x x"},
              "x <- y x\ny\n"},
             {"constants on pins of all forms",
              {"ASSIGN CONSTANT u1.A 1", "ASSIGN CONSTANT u1.B(3:0) 4:b:1010",
               "ASSIGN CONSTANT u1.S(2) 0", "ASSIGN CONSTANT U1.a 0"},
              "u1_A_CONST_SIGNAL: (u1.A)\nu1_B_CONST_SIGNAL(3:0): (u1.B(3:0))\n"
              "u1_S_CONST_SIGNAL(2): (u1.S(2))\n"},
             {"a constant on a connected pin",
              {"CONNECT SIGNAL x u1.A", "ASSIGN CONSTANT u1.A 1"},
              "x: u1.A!\nu1_A_CONST_SIGNAL: (u1.A)\n"}}) {
        Design design(CellsAnd(row.lines));
        EXPECT_EQ(row.wiring, Wiring(design.netlist)) << row.name;
    }
    Design design(CellsAnd({"ASSIGN CONSTANT u1.A 1", "ASSIGN CONSTANT U1.A 8:h:FF"}));
    BitVectorValue const value = design.model.GetSignal("u1_A_CONST_SIGNAL")->GetConstantValue();
    EXPECT_TRUE(value.GetValue() == "FF" && value.GetLength() == 8);
}

TEST(Model, WideningKeepsEverythingThatLedToTheOldBus) {
    struct Row {
        char const *name;
        Lines lines;
        char const *wiring;
    };
    for (Row const &row : std::vector<Row>{
             {"pins",
              {"CONNECT SIGNAL D(3:0) u1.B(3:0)", "CONNECT SIGNAL D(7:0) u1.W(7:0)"},
              "D(7:0): u1.W(7:0)\n[D(3:0)]: u1.B(3:0)\n"},
             {"links to it",
              {"CONNECT SIGNAL n D(3:0)", "CONNECT SIGNAL D(7:0) m"},
              "n <- D(3:0)\nD(7:0) <- m\nm\n[D(3:0)]\n"},
             {"links from it",
              {"CONNECT SIGNAL D(3:0) n", "CONNECT SIGNAL D(7:0) m"},
              "n\nD(7:0) <- m\nm\n[D(3:0)] <- n\n"},
             {"a link to itself",
              {"CONNECT SIGNAL D(3:0) D(3:0)", "CONNECT SIGNAL D(7:0) m"},
              "D(7:0) <- m\nm\n[D(3:0)] <- D(3:0)\n"},
             {"the left side", {"CONNECT SIGNAL D(3:0) D(7:0)"}, "D(7:0)\n[D(3:0)] <- D(7:0)\n"},
             {"the left side in a compound",
              {"CONNECT SIGNAL D(3:0) n,D(7:0)"},
              "n\nD(7:0)\nn,D(7:0) {n D(7:0)}\n[D(3:0)] <- n,D(7:0)\n"},
             {"a member of the compound in hand",
              {"CONNECT SIGNAL X(3:0),X(7:0) n"},
              "X(7:0)\nX(3:0),X(7:0) {X(3:0) X(7:0)} <- n\nn\n[X(3:0)]\n"},
             {"three members",
              {"CONNECT SIGNAL X(0:0),X(3:0),X(7:0) X(9:0)"},
              "X(0:0),X(3:0),X(7:0) {X(0:0) X(3:0) X(7:0)} <- X(9:0)\nX(9:0)\n"
              "[X(0:0)]\n[X(3:0)]\n[X(7:0)]\n"},
             {"the wider first",
              {"CONNECT SIGNAL X(7:0),X(3:0) n"},
              "X(7:0)\nX(3:0)\nX(7:0),X(3:0) {X(7:0) X(3:0)} <- n\nn\n"},
             {"members of compounds",
              {"CONNECT SIGNAL A,D(3:0) n", "CONNECT SIGNAL D(7:0) n"},
              "A\nA,D(3:0) {A D(3:0)} <- n\nn\nD(7:0) <- n\n[D(3:0)]\n"},
             {"a pin tied to its constant",
              {"ASSIGN CONSTANT u1.B(3:0) 0", "CONNECT SIGNAL u1_B_CONST_SIGNAL(7:0) n"},
              "u1_B_CONST_SIGNAL(7:0) <- n\nn\n[u1_B_CONST_SIGNAL(3:0)]: (u1.B(3:0))\n"},
             {"twice",
              {"CONNECT SIGNAL D(1:0) u1.B(3:0)", "CONNECT SIGNAL n D(1:0)",
               "CONNECT SIGNAL D(3:0) u1.Q(3:0)", "CONNECT SIGNAL m,D(3:0) n",
               "CONNECT SIGNAL D(7:0) u1.W(7:0)"},
              "n <- D(1:0)\nm\nm,D(3:0) {m D(3:0)} <- n\nD(7:0): u1.W(7:0)\n[D(1:0)]: u1.B(3:0)\n"
              "[D(3:0)]: u1.Q(3:0)\n"},
             {"a link from a widened one",
              {"CONNECT SIGNAL D(1:0) E(1:0)", "CONNECT SIGNAL D(3:0) n",
               "CONNECT SIGNAL E(3:0) n"},
              "D(3:0) <- n\nn\nE(3:0) <- n\n[D(1:0)] <- E(1:0)\n[E(1:0)]\n"},
             {"as wide as before",
              {"CONNECT SIGNAL D(7:0) u1.W(7:0)", "CONNECT SIGNAL D(0:7) n"},
              "D(0:7) <- n\nn\n[D(7:0)]: u1.W(7:0)\n"},
             {"the old name again",
              {"CONNECT SIGNAL D(3:0) u1.B(3:0)", "CONNECT SIGNAL D(7:0) n",
               "CONNECT SIGNAL D(3:0) u2.B(3:0)"},
              "D(7:0) <- n\nn\nD(3:0): u2.B(3:0)\n[D(3:0)]: u1.B(3:0)\n"},
             {"narrower than before",
              {"CONNECT SIGNAL D(7:0) u1.W(7:0)", "CONNECT SIGNAL D(12:10) u1.B(3:0)"},
              "D(7:0): u1.W(7:0)\nD(12:10): u1.B(3:0)\n"},
             {"all an int can count", // 4294967296 bits, which no int counts
              {"ADD SIGNAL D(7:0)", "CONNECT SIGNAL D(2147483647:2147483648) n"},
              "D(2147483647:2147483648) <- n\nn\n[D(7:0)]\n"}}) {
        Design design(CellsAnd(row.lines));
        EXPECT_EQ(row.wiring, Wiring(design.netlist)) << row.name;
    }
}

TEST(Model, WideningGivesPartsTheNewParent) {
    Design design(CellsAnd({"ADD PORT D(3:0) out", "CONNECT SIGNAL D(2) u1.A",
                            "CONNECT SIGNAL D(1:0) u1.B(3:0)", "ASSIGN CONSTANT D(3:0) 1"}));
    design.model.GetSignal("D(3:0)")->AddComment("c");
    EXPECT_EQ("", Refusal(design.model, {"CONNECT SIGNAL D(7:0) u1.W(7:0)"}));
    EXPECT_EQ(nullptr, design.model.GetSignal("D(3:0)"));
    auto *const wide = dynamic_cast<Bus *>(design.model.GetSignal("D(7:0)"));
    ASSERT_TRUE(wide);
    EXPECT_EQ(wide, design.netlist.GetParentBus("D"));
    EXPECT_EQ("D(3:0) D(2) D(1:0)", NamesOf(wide->GetBusSliceIterator()));
    EXPECT_TRUE(!wide->IsPort() && !wide->HasComment() && !wide->HasConstantValue());
    for (char const *const part : {"D(2)", "D(1:0)"}) {
        design.model.GetSignal(part)->SetPortPolarity(Polarity::INPUT);
        EXPECT_EQ(Polarity::INPUT, wide->GetPortPolarity().GetValue()) << part;
        wide->SetPortPolarity(Polarity());
        EXPECT_EQ(Polarity::INVALID, design.model.GetSignal(part)->GetPortPolarity().GetValue());
    }
}

TEST(Model, ATypedBracketDoesNotWiden) {
    Design design({"ADD SIGNAL D(3:0)"});
    EXPECT_EQ("Signal \"D[7:0]\" already declared.\n",
              Refusal(design.model, {"CONNECT SIGNAL n D[7:0]"}));
    EXPECT_EQ("",
              Refusal(design.model, {"CONNECT SIGNAL n D[3:0]"})); // found by its rewritten name
    EXPECT_EQ("D(3:0)\nn <- D(3:0)\n", Wiring(design.netlist));
}

} // namespace
