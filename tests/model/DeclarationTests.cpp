#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

/// What is declared, in the order of the netlist.
std::string Declared(Netlist const &netlist) {
    return NamesOf(netlist.GetComponentIterator()) + " | " +
           NamesOf(netlist.GetInstanceIterator()) + " | " + NamesOf(netlist.GetSignalIterator()) +
           " | " + NamesOf(netlist.GetComponent("CELL")->GetPinIterator());
}

TEST(Model, RefusedDeclarationsChangeNothing) {
    Design design(CellsAnd("sig a(7:0)"));
    Model &model = design.model;
    model.AddComponent("");
    model.SetModifiedFlag(false);
    using Row = std::pair<char const *, char const *>;
    for (auto const &[line, message] : std::vector<Row>{
             {"ADD COMPONENT cell", "Identifier \"cell\" already defined.\n"},
             {"ADD COMPONENT U1", "Identifier \"U1\" already defined.\n"},
             {"ADD COMPONENT A[7:0]", "Identifier \"A[7:0]\" already defined.\n"},
             {"ADD INSTANCE CELL ''  x", "Identifier \"\" already defined.\n"},
             {"ADD PIN none p in", "Component \"none\" not found.\n"},
             {"ADD PIN Cell a in", "Component \"Cell\" already has pin \"a\".\n"},
             {"ADD PIN CELL b<3-0> in", "Component \"CELL\" already has pin \"b<3-0>\".\n"},
             {"ADD INSTANCE none U1", "Identifier \"U1\" already defined.\n"},
             {"ADD INSTANCE %s%n%d n", "Component \"%s%n%d\" not found.\n"},
             {"sig U1", "Identifier \"U1\" already defined.\n"},
             {"sig A[7-0]", "Identifier \"A[7-0]\" already defined.\n"},
             {"sig A{3-0}", "Signal \"A{3-0}\" already declared.\n"}})
        EXPECT_EQ(message, Refusal(model, Short(line))) << line;
    EXPECT_EQ("Invalid Name.\n", MessageOf([&] { model.AddComponent(nullptr); }));
    EXPECT_EQ("Invalid Name.\n", MessageOf([&] { model.AddInstance(nullptr, "none"); }));
    EXPECT_EQ("Invalid Name.\n", MessageOf([&] { model.AddSignal(nullptr); }));
    EXPECT_EQ("Invalid Name.\n",
              MessageOf([&] { model.AddPin(nullptr, Polarity::INPUT, "none", ""); }));
    EXPECT_FALSE(model.IsModified());
    EXPECT_EQ("CELL  | u1 u2 u3 | a(7:0) | A Y IO B(3:0) Q(3:0) W(7:0) S(2)",
              Declared(design.netlist));
}

TEST(Model, DeclarationsModify) {
    Design design(Cells());
    // A pin may have the name of a component and be added late; a scalar may have the base name of
    // a bus.
    for (std::string const &line : Short("ADD COMPONENT C; ADD PIN cell C out; ADD INSTANCE c i;"
                                         "sig S[3-0]; sig S; sig S(2); sig A,B")) {
        design.model.SetModifiedFlag(false);
        EXPECT_EQ("", Refusal(design.model, {line}));
        EXPECT_TRUE(design.model.IsModified()) << line;
    }
    EXPECT_EQ("CELL C | u1 u2 u3 i | S(3:0) S S(2) A,B | A Y IO B(3:0) Q(3:0) W(7:0) S(2) C",
              Declared(design.netlist));
    EXPECT_EQ(Signal::SIGNAL_BUS, design.model.GetSignal("S(3:0)")->GetSignalType());
    for (char const *const name : {"S", "S(2)", "A,B"})
        EXPECT_EQ(Signal::SIGNAL_SCALAR, design.model.GetSignal(name)->GetSignalType()) << name;
}

} // namespace
