#include "vesk_hdl/netlist/Signal.h"

#include <deque>
#include <limits>
#include <memory>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

/// A signal of each class, and compounds of them.
struct Bits {
    Bits() {
        for (Signal *const member : std::vector<Signal *>{&scalar, nullptr, &slice, &index, &lower})
            compound.AddBusMember(member);
        huge.AddBusMember(&all);
        huge.AddBusMember(&all);
        tagged.AddBusMember(&dummy);
        tagged.AddBusMember(&scalar);
    }

    ScalarSignal scalar{"A"}, lower{"a"}, dummy{"n1_dummy"};
    Bus bus{"D(7:0)"}, all{"E(2147483647:2147483648)"};
    BusSlice slice{"D(3:0)", &bus};
    BusIndex index{"D(2)", &bus};
    CompoundBus compound{"A,D(3:0),D(2),a"}, huge{"E,E"}, tagged{"n1_dummy,A"};
};

struct Visitor : SignalVisitor {
    std::string seen;
    void VisitSignal(Signal *) override { seen += "signal"; }
    void VisitBusSlice(BusSlice *) override { seen += "slice "; }
};

TEST(Signal, FiveClasses) {
    Bits bits;
    int const most = std::numeric_limits<int>::max();
    using Row = std::tuple<Signal *, Signal::SignalType, int, bool>;
    for (auto const &[signal, type, width, isDeclared] :
         {Row{&bits.scalar, Signal::SIGNAL_SCALAR, 1, true},
          Row{&bits.bus, Signal::SIGNAL_BUS, 8, true},
          Row{&bits.slice, Signal::SIGNAL_BUS_SLICE, 4, false},
          Row{&bits.index, Signal::SIGNAL_BUS_INDEX, 1, false},
          Row{&bits.compound, Signal::SIGNAL_COMPOUND_BUS, 7, false},
          Row{&bits.huge, Signal::SIGNAL_COMPOUND_BUS, most, false}}) {
        SCOPED_TRACE(signal->GetName());
        EXPECT_EQ(type, signal->GetSignalType());
        EXPECT_EQ(width, signal->GetWidth());
        EXPECT_EQ(isDeclared, signal->IsNeededToDeclared());
        EXPECT_FALSE(signal->IsPort());
        Visitor visitor; // the operation of the class is called before that of Signal
        signal->AcceptSignal(visitor);
        EXPECT_EQ(signal == &bits.slice ? "slice signal" : "signal", visitor.seen);
    }
}

TEST(Signal, DummyNames) {
    Bits bits;
    using Row = std::tuple<Signal *, char const *>;
    for (auto const &[signal, name] :
         {Row{new ScalarSignal("n1_dummy"), "n1_dummy"},
          Row{new ScalarSignal("_DUMMY_"), "_DUMMY__DUMMY"},
          Row{new Bus("D(07:0)"), "D_DUMMY(07:0)"}, Row{new Bus("D_Dummy(7:0)"), "D_Dummy"},
          Row{new BusSlice("D_DUMMY(3:0)", nullptr), "D_DUMMY_DUMMY(3:0)"},
          Row{new BusIndex("D(+3)", nullptr), "D_DUMMY(+3)"},
          Row{new BusIndex("D_DUMMY(3)", nullptr), "D_DUMMY_DUMMY(3)"}}) {
        EXPECT_STREQ(name, signal->GetDummySignalName());
        delete signal;
    }
    EXPECT_STREQ("A_DUMMY,D_DUMMY(3:0),D_DUMMY(2),a_DUMMY", bits.compound.GetDummySignalName());
    EXPECT_STREQ("n1_dummy,A_DUMMY", bits.tagged.GetDummySignalName());
    EXPECT_STREQ("", CompoundBus("A,B").GetDummySignalName());
}

TEST(Signal, PolarityOfPartsIsThatOfTheBus) {
    Bits bits;
    bits.slice.SetPortPolarity(Polarity::OUTPUT);
    for (Signal const *const each :
         std::vector<Signal const *>{&bits.bus, &bits.slice, &bits.index})
        EXPECT_EQ(Polarity::OUTPUT, each->GetPortPolarity().GetValue()) << each->GetName();
    EXPECT_TRUE(bits.bus.IsPort() && bits.index.IsPort() && !bits.slice.IsPort());
    BusIndex orphan("E(1)", nullptr);
    orphan.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INPUT, orphan.GetPortPolarity().GetValue());
    BusSlice lost("E(1:0)", nullptr);
    lost.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INVALID, lost.GetPortPolarity().GetValue());
}

TEST(Signal, PolarityOfACompoundIsThatOfItsFirstMember) {
    Bits bits;
    CompoundBus compound("A,a");
    compound.AddBusMember(&bits.scalar);
    compound.SetPortPolarity(Polarity::OUTPUT);
    EXPECT_EQ(Polarity::INVALID, compound.GetPortPolarity().GetValue()); // one member is none
    compound.AddBusMember(nullptr);
    EXPECT_EQ(Polarity::OUTPUT, compound.GetPortPolarity().GetValue());
    compound.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INPUT, bits.scalar.GetPortPolarity().GetValue());
    EXPECT_FALSE(compound.IsPort());
}

TEST(Signal, ACommentMayBeItsName) {
    ScalarSignal signal("a_name_that_takes_memory");
    signal.AddComment(signal.GetNameRef());
    EXPECT_STREQ("a_name_that_takes_memory\n", signal.GetComment());
}

/// A walk leaves out a compound that it is in already.
TEST(Signal, ACompoundMayBeInItself) {
    Bits bits;
    CompoundBus own("A,own"), outer("A,a"), inner("B,b"), above("C,c");
    for (Signal *const member : std::vector<Signal *>{&bits.scalar, &own})
        own.AddBusMember(member);
    for (Signal *const member : std::vector<Signal *>{&inner, &bits.lower})
        outer.AddBusMember(member);
    for (Signal *const member : std::vector<Signal *>{&outer, &bits.slice, &bits.scalar})
        inner.AddBusMember(member);
    inner.SetAt(0, &bits.scalar);
    inner.SetAt(2, &outer);
    for (Signal *const member : std::vector<Signal *>{&outer, &bits.lower})
        above.AddBusMember(member);
    using Row = std::tuple<CompoundBus *, int, int, char const *>;
    for (auto const &[compound, size, width, dummy] :
         {Row{&own, 2, 1, "A_DUMMY"}, Row{&outer, 2, 6, "A_DUMMY,D_DUMMY(3:0),a_DUMMY"},
          Row{&inner, 3, 6, "A_DUMMY,D_DUMMY(3:0),a_DUMMY"},
          Row{&above, 2, 7, "A_DUMMY,D_DUMMY(3:0),a_DUMMY,a_DUMMY"}}) {
        SCOPED_TRACE(compound->GetName());
        EXPECT_EQ(size, compound->GetSize());
        EXPECT_EQ(width, compound->GetWidth());
        EXPECT_STREQ(dummy, compound->GetDummySignalName());
        bits.scalar.SetPortPolarity(Polarity());
        compound->SetPortPolarity(Polarity::OUTPUT);
        EXPECT_EQ(Polarity::OUTPUT, bits.scalar.GetPortPolarity().GetValue());
        EXPECT_EQ(Polarity::OUTPUT, compound->GetPortPolarity().GetValue());
        EXPECT_FALSE(compound->IsPort());
    }
    own.SetAt(0, &own);
    EXPECT_TRUE(own.GetWidth() == 0 && own.GetPortPolarity() == Polarity::INVALID);

    Design design(CellsAnd("a,b u1.B(3:0)"));
    auto *const written = static_cast<CompoundBus *>(design.model.GetSignal("a,b"));
    written->AddBusMember(written);
    TextMemOutStream vhdl(""), verilog("");
    VhdlNetlister(vhdl).WriteNetlist(&design.netlist, design.model.GetOptions());
    VerilogNetlister(verilog).WriteNetlist(&design.netlist, *design.model.GetOptions());
    EXPECT_NE(vhdl.GetValue().View().find("B(2)=>b"), std::string::npos) << vhdl.GetValue();
    EXPECT_NE(verilog.GetValue().View().find(".B({a, b})"), std::string::npos)
        << verilog.GetValue();
}

TEST(Signal, DisconnectAndMove) {
    Design design(CellsAnd("a u1.A; a u2.A; a c; c u1.A; b u3.A; b a"));
    Signal &a = *design.model.GetSignal("a");
    Signal &b = *design.model.GetSignal("b");
    b.CloneConnection(&a); // moves also the pin that went to c meanwhile
    EXPECT_EQ("a\nc: u1.A!\nb: u1.A u2.A <- c\n", Wiring(design.netlist));
    a.Disconnect(design.model.GetInstance("u1")->GetPin("A")); // cleared wherever it is
    a.Disconnect(static_cast<Pin *>(nullptr));
    a.Connect(static_cast<Pin *>(nullptr));
    a.Connect(static_cast<Signal *>(nullptr));
    EXPECT_EQ("a\nc: u1.A!\nb: u1.A! u2.A <- c\n", Wiring(design.netlist));
    b.Disconnect(design.model.GetSignal("c"));
    EXPECT_FALSE(b.GetSignalIterator().HasMore());
    b.AssignConstantValue("4:b:1010");
    b.CloneConnection(nullptr);
    EXPECT_EQ("a\nc: u1.A!\nb\n", Wiring(design.netlist));
    EXPECT_STREQ("1010", b.GetConstantValue().GetValue());
}

TEST(Signal, HasMultiDriver) {
    for (auto const &[polarities, expected] :
         {std::pair{"", false}, {"o", false}, {"obb", false}, {"oibo", true}, {"ooo", true}}) {
        ScalarSignal signal("s");
        std::deque<ScalarPin> pins;
        for (char const c : std::string(polarities))
            signal.Connect(&pins.emplace_back("p", Polarity(std::string(1, c).c_str())));
        EXPECT_EQ(expected, signal.HasMultiDriver()) << polarities;
    }
}

TEST(Signal, LongListsStillRefuseWhatTheyHold) {
    ScalarSignal signal("s"), other("t");
    std::deque<ScalarPin> pins;
    auto const count = [](Signal const &s) {
        int n = 0;
        ForEach(s.GetPinIterator(), [&n](Pin *) { ++n; });
        return n;
    };
    signal.Connect(&other);
    for (int i = 0; i < 100000; ++i)
        signal.Connect(&pins.emplace_back("p", Polarity::INPUT));
    for (ScalarPin &pin : pins)
        signal.Connect(&pin);
    signal.Disconnect(&pins[70000]);
    signal.Disconnect(&other);
    EXPECT_FALSE(signal.GetSignalIterator().HasMore());
    EXPECT_EQ(99999, count(signal));
    signal.Connect(&pins[70000]); // gone from the index, too
    other.CloneConnection(&signal);
    signal.Connect(&pins[5]);
    other.Connect(&pins[5]);
    EXPECT_TRUE(count(signal) == 1 && count(other) == 100000);
}

} // namespace
