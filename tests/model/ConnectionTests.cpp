#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

TEST(Model, RefusedConnectionsKeepTheSignalsTheyMade) {
    using Row = std::tuple<char const *, char const *, char const *>;
    for (auto const &[line, message, wiring] : std::vector<Row>{
             {"a(3) y", "Signal \"a(3)\" not found.\n", ""}, // a bit makes no bus
             {"x a(3)", "Signal \"a(3)\" not found.\n", "x\n"},
             {"a(3) u1.A", "Signal \"a(3)\" not found.\n", ""},
             {"a(3) = 1", "Signal \"a(3)\" not found.\n", ""},
             {"x u9.A", "Signal \"u9\" not found.\n", "x\n"},
             {"x U1.Z", "Pin \"U1.Z\" not found.\n", "x\n"},
             {"x U1", "Identifier \"U1\" already defined.\n", "x\n"},
             {"x,b(1:0),u1 y", "Identifier \"u1\" already defined.\n", "x\nb(1:0)\n"},
             {"u9.A = 1", "Signal \"u9\" not found.\n", ""},
             {"u1.Z = 1", "Pin \"Z\" not found.\n", ""},
             {"u1.Y = 1", "Identifier \"u1_Y_CONST_SIGNAL\" already defined.\n", ""}}) {
        Design design(CellsAnd("ADD COMPONENT u1_Y_CONST_SIGNAL"));
        Model &model = design.model;
        model.SetModifiedFlag(false);
        EXPECT_EQ(message, Refusal(model, Short(line))) << line;
        EXPECT_EQ(wiring, Wiring(design.netlist)) << line;
        EXPECT_EQ(*wiring != '\0', model.IsModified()) << line;
        EXPECT_EQ("Signal \"\" not found.\n",
                  MessageOf([&] { model.ConnectSignalToPin("x", nullptr, "A"); }));
        EXPECT_EQ("Pin \"u1.\" not found.\n",
                  MessageOf([&] { model.ConnectSignalToPin("x", "u1", nullptr); }));
    }
}

TEST(Model, DemandedNamesMakeSignals) {
    // s scalar, b bus, l slice, i bit, c compound. The form is decided with the brackets as typed:
    // "b[3]" is no bit and becomes a scalar called b(3). The range of a slice may lie outside of
    // its bus.
    for (auto const &[name, kinds] :
         Pairs("x=s; =s; x y=s; d(3:0)=b; d[3-0]=b; b(3:0)=l; B(20:19)=l; b(3)=i; b[3]=s; x,b[3]=s;"
               "x,b(3:0)\\b(3)=slic; x,c(3),d(1:0)=ssbc; b(3:0),x,B(3:0),X=lsc")) {
        Design design(Short("sig b(7:0)"));
        EXPECT_TRUE(design.model.AssignConstantToSignal(name.c_str(), "1"));
        EXPECT_TRUE(
            design.model.AssignConstantToSignal(name.c_str(), "2:b:01")); // makes no second signal
        std::string made;
        ForEach(design.netlist.GetSignalIterator(), [&made](Signal *signal) {
            made += "sblic"[signal->GetSignalType() - Signal::SIGNAL_SCALAR];
        });
        EXPECT_EQ("b" + kinds, made) << name;
        Signal const *const signal = design.model.GetSignal(name.c_str());
        EXPECT_STREQ("01", signal ? signal->GetConstantValue().GetValue() : "none") << name;
    }
}

TEST(Model, ConnectionsAndConstants) {
    using Row = std::pair<char const *, char const *>;
    for (auto const &[lines, wiring] : std::vector<Row>{
             {"x u1.A; X u1.a", "x: u1.A\n"},
             // A moved pin stays listed, and is not moved back by a signal that lists it.
             {"x u1.A; y u1.A; x u1.A", "x: u1.A!\ny: u1.A\n"},
             {"x y; x y; x x", "x <- y x\ny\n"}, // links go one way
             {"x u1.; t(1:0) u1.b(3:0)", "x <- u1.\nu1.\nt(1:0): u1.B(3:0)\n"},
             {"u1.A = 1; u1.B(3:0) = 4:b:1010; u1.S(2) = 0; U1.a = 0",
              "u1_A_CONST_SIGNAL: (u1.A)\nu1_B_CONST_SIGNAL(3:0): (u1.B(3:0))\n"
              "u1_S_CONST_SIGNAL(2): (u1.S(2))\n"},
             {"x u1.A; u1.A = 1", "x: u1.A!\nu1_A_CONST_SIGNAL: (u1.A)\n"}}) {
        Design design(CellsAnd(lines));
        EXPECT_EQ(wiring, Wiring(design.netlist)) << lines;
    }
    Design design(CellsAnd("u1.A = 1; U1.A = 8:h:FF"));
    BitVectorValue const value = design.model.GetSignal("u1_A_CONST_SIGNAL")->GetConstantValue();
    EXPECT_TRUE(value.GetValue() == "FF" && value.GetLength() == 8);
    design.model.SetModifiedFlag(false);
    design.model.AssignConstantToPin("u1", "A", "0");
    EXPECT_TRUE(design.model.IsModified());
}

} // namespace
