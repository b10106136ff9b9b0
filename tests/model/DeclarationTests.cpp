#include <functional>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "vesk_hdl/model/HdlModel.h"

using namespace Vesk_Hdl;

namespace {

TEST(Model, RefusedDeclarationsChangeNothing) {
    struct Row {
        char const *name;
        std::function<void(Model &)> call;
        char const *message;
    };
    for (Row const &row : std::vector<Row>{
             {"component null", [](Model &m) { m.AddComponent(nullptr); }, "Invalid Name.\n"},
             {"component taken", [](Model &m) { m.AddComponent("cell"); },
              "Identifier \"cell\" already defined.\n"},
             {"component like an instance", [](Model &m) { m.AddComponent("U1"); },
              "Identifier \"U1\" already defined.\n"},
             {"component like a signal", [](Model &m) { m.AddComponent("A[7:0]"); },
              "Identifier \"A[7:0]\" already defined.\n"},
             {"component empty again", [](Model &m) { m.AddComponent(""); },
              "Identifier \"\" already defined.\n"},
             {"pin null", [](Model &m) { m.AddPin(nullptr, Polarity::INPUT, "CELL", ""); },
              "Invalid Name.\n"},
             {"pin of nothing", [](Model &m) { m.AddPin("p", Polarity::INPUT, "none", ""); },
              "Component \"none\" not found.\n"},
             {"pin of null", [](Model &m) { m.AddPin("p", Polarity::INPUT, "x", nullptr); },
              "Component \"x\" not found.\n"},
             {"pin taken", [](Model &m) { m.AddPin("a", Polarity::INPUT, "Cell", ""); },
              "Component \"Cell\" already has pin \"a\".\n"},
             {"pin taken in other brackets",
              [](Model &m) { m.AddPin("b<3-0>", Polarity::INPUT, "CELL", ""); },
              "Component \"CELL\" already has pin \"b<3-0>\".\n"},
             {"instance null", [](Model &m) { m.AddInstance(nullptr, "CELL"); }, "Invalid Name.\n"},
             {"instance taken", [](Model &m) { m.AddInstance("U1", "none"); },
              "Identifier \"U1\" already defined.\n"},
             {"instance of nothing", [](Model &m) { m.AddInstance("n1", "none"); },
              "Component \"none\" not found.\n"},
             {"signal null", [](Model &m) { m.AddSignal(nullptr); }, "Invalid Name.\n"},
             {"signal like an instance", [](Model &m) { m.AddSignal("U1"); },
              "Identifier \"U1\" already defined.\n"},
             {"signal taken in other brackets", [](Model &m) { m.AddSignal("A[7-0]"); },
              "Identifier \"A[7-0]\" already defined.\n"},
             {"bus of another range", [](Model &m) { m.AddSignal("A{3-0}"); },
              "Signal \"A{3-0}\" already declared.\n"},
             {"conversions are text", [](Model &m) { m.AddInstance("n", "%s%n%d"); },
              "Component \"%s%n%d\" not found.\n"}}) {
        Design design(CellsAnd({"ADD SIGNAL a(7:0)"}));
        design.model.AddComponent("");
        design.model.SetModifiedFlag(false);
        EXPECT_EQ(row.message, MessageOf([&] { row.call(design.model); })) << row.name;
        EXPECT_FALSE(design.model.IsModified()) << row.name;
        Netlist const &netlist = design.netlist;
        EXPECT_EQ("CELL  | u1 u2 u3 | a(7:0)", NamesOf(netlist.GetComponentIterator()) + " | " +
                                                   NamesOf(netlist.GetInstanceIterator()) + " | " +
                                                   NamesOf(netlist.GetSignalIterator()))
            << row.name;
        EXPECT_EQ("A Y IO B(3:0) Q(3:0) W(7:0) S(2)",
                  NamesOf(netlist.GetComponent("CELL")->GetPinIterator()));
    }
}

TEST(Model, DeclarationsSucceedAndModify) {
    std::function<bool(Model &)> const steps[] = {
        [](Model &m) { return m.AddComponent("C"); },
        [](Model &m) { return m.AddPin("C", Polarity::OUTPUT, "c", nullptr); }, // pins are no names
        [](Model &m) { return m.AddInstance("i", "c"); },
        [](Model &m) { return m.AddPin("late", Polarity::INPUT, "C", "4:h:F"); },
        [](Model &m) { return m.AddSignal("S[3-0]"); },
        [](Model &m) { return m.AddSignal("S"); }, // a scalar beside the bus
        [](Model &m) { return m.AddSignal("S(2)"); },
        [](Model &m) { return m.AddSignal("A,B"); }};
    Design design;
    for (auto const &step : steps) {
        design.model.SetModifiedFlag(false);
        EXPECT_TRUE(step(design.model));
        EXPECT_TRUE(design.model.IsModified());
    }
    EXPECT_EQ("S(3:0) S S(2) A,B", NamesOf(design.netlist.GetSignalIterator()));
    EXPECT_EQ(Signal::SIGNAL_BUS, design.model.GetSignal("S(3:0)")->GetSignalType());
    for (char const *const name : {"S", "S(2)", "A,B"})
        EXPECT_EQ(Signal::SIGNAL_SCALAR, design.model.GetSignal(name)->GetSignalType()) << name;
    EXPECT_EQ("C late", NamesOf(design.model.GetComponent("c")->GetPinIterator()));
    EXPECT_EQ("C", NamesOf(design.model.GetInstance("I")->GetPinIterator()));
}

TEST(Model, LookupsOfWhatIsNotThere) {
    Design design(Cells());
    Model const &model = design.model;
    EXPECT_EQ(nullptr, model.GetPin("A", static_cast<Component *>(nullptr)));
    EXPECT_EQ(nullptr, model.GetPin("A", static_cast<Instance *>(nullptr)));
    EXPECT_EQ(nullptr, model.GetPin("none", model.GetInstance("u1")));
    EXPECT_NE(nullptr, model.GetPin("b[3:0]", model.GetInstance("u1")));
    EXPECT_NE(model.GetPin("A", model.GetComponent("CELL")),
              model.GetPin("A", model.GetInstance("u1")));
    EXPECT_EQ(nullptr, model.GetSignal(nullptr));
    EXPECT_EQ(nullptr, model.GetComponent("u1"));
    EXPECT_EQ(nullptr, model.GetInstance("CELL"));
}

} // namespace
