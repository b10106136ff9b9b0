#include "vesk_hdl/netlist/Signal.h"

#include <deque>
#include <limits>
#include <memory>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

/// A compound of the given members.
CompoundBus *Compound(char const *name, std::vector<Signal *> const &members) {
    auto *const compound = new CompoundBus(name);
    for (Signal *const member : members)
        compound->AddBusMember(member);
    return compound;
}

struct Bits {
    ScalarSignal scalar{"A"};
    Bus bus{"D(7:0)"};
    BusSlice slice{"D(3:0)", &bus};
    BusIndex index{"D(2)", &bus};
};

TEST(Signal, DummyNames) {
    Bits bits;
    ScalarSignal dummyPort("n1_dummy");
    struct Row {
        Signal *signal;
        char const *name;
    };
    for (Row const &row : std::vector<Row>{
             {new ScalarSignal("N1"), "N1_DUMMY"},
             {new ScalarSignal("n1_dummy"), "n1_dummy"},
             {new ScalarSignal("_DUMMY_"), "_DUMMY__DUMMY"},
             {new Bus("D(07:0)"), "D_DUMMY(07:0)"},
             {new Bus("D_Dummy(7:0)"), "D_Dummy"},
             {new BusSlice("D_DUMMY(3:0)", &bits.bus), "D_DUMMY_DUMMY(3:0)"},
             {new BusIndex("D(+3)", nullptr), "D_DUMMY(+3)"},
             {new BusIndex("D_DUMMY(3)", nullptr), "D_DUMMY_DUMMY(3)"},
             {Compound("A,D(3:0)", {&bits.scalar, &bits.slice}), "A_DUMMY,D_DUMMY(3:0)"},
             {Compound("n1_dummy,A", {&dummyPort, &bits.scalar}), "n1_dummy,A_DUMMY"},
             {Compound("A,B", {}), ""}}) {
        std::unique_ptr<Signal> const signal(row.signal);
        EXPECT_STREQ(row.name, signal->GetDummySignalName()) << signal->GetName();
    }
}

TEST(Signal, DummiesTakeTheNameAlone) {
    Bits bits;
    bits.scalar.SetPortPolarity(Polarity::OUTPUT);
    bits.scalar.AssignConstantValue("1");
    bits.scalar.AddAttr(new AttributeString("A", "x"));
    std::unique_ptr<ScalarSignal> const scalar(bits.scalar.CreateDummySignal());
    EXPECT_TRUE(!scalar->IsPort() && !scalar->HasAttrs() && !scalar->HasConstantValue());
    std::unique_ptr<Bus> const bus(bits.bus.CreateDummySignal());
    EXPECT_EQ("", NamesOf(bus->GetBusSliceIterator()));
    std::unique_ptr<BusIndex> const index(bits.index.CreateDummySignal(bus.get()));
    std::unique_ptr<BusSlice> const slice(bits.slice.CreateDummySignal(bus.get()));
    EXPECT_EQ("D_DUMMY(2) D_DUMMY(3:0)", NamesOf(bus->GetBusSliceIterator()));
    EXPECT_EQ("D(3:0) D(2)", NamesOf(bits.bus.GetBusSliceIterator()));
    std::unique_ptr<CompoundBus> const old(Compound("A,B", {&bits.scalar, &bits.bus}));
    EXPECT_EQ(0, std::unique_ptr<CompoundBus>(old->CreateDummySignal())->GetSize());
}

TEST(Signal, KindsAndWidths) {
    Bits bits;
    Bus all("E(2147483647:2147483648)");
    std::unique_ptr<CompoundBus> const compound(
        Compound("A,D(3:0),D(2)", {&bits.scalar, &bits.slice, &bits.index, nullptr}));
    std::unique_ptr<CompoundBus> const huge(Compound("E,E", {&all, &all}));
    struct Row {
        Signal const *signal;
        Signal::SignalType type;
        int width;
        bool isDeclared;
    };
    for (Row const &row : std::vector<Row>{
             {&bits.scalar, Signal::SIGNAL_SCALAR, 1, true},
             {&bits.bus, Signal::SIGNAL_BUS, 8, true},
             {&bits.slice, Signal::SIGNAL_BUS_SLICE, 4, false},
             {&bits.index, Signal::SIGNAL_BUS_INDEX, 1, false},
             {compound.get(), Signal::SIGNAL_COMPOUND_BUS, 6, false},
             {huge.get(), Signal::SIGNAL_COMPOUND_BUS, std::numeric_limits<int>::max(), false}}) {
        EXPECT_EQ(row.type, row.signal->GetSignalType()) << row.signal->GetName();
        EXPECT_EQ(row.width, row.signal->GetWidth()) << row.signal->GetName();
        EXPECT_EQ(row.isDeclared, row.signal->IsNeededToDeclared()) << row.signal->GetName();
        EXPECT_EQ(Object::OBJECT_SIGNAL, row.signal->GetObjectType());
        EXPECT_FALSE(row.signal->IsPort()) << row.signal->GetName();
    }
    EXPECT_EQ(4, compound->GetSize());
}

TEST(Signal, PolarityOfPartsIsThatOfTheBus) {
    for (auto const set : {+[](Bits &b) { b.bus.SetPortPolarity(Polarity::OUTPUT); },
                           +[](Bits &b) { b.slice.SetPortPolarity(Polarity::OUTPUT); },
                           +[](Bits &b) { b.index.SetPortPolarity(Polarity::OUTPUT); }}) {
        Bits bits;
        set(bits);
        for (Signal const *const part :
             std::vector<Signal const *>{&bits.bus, &bits.slice, &bits.index})
            EXPECT_EQ(Polarity::OUTPUT, part->GetPortPolarity().GetValue()) << part->GetName();
        EXPECT_TRUE(bits.bus.IsPort());
        EXPECT_TRUE(bits.index.IsPort());
        EXPECT_FALSE(bits.slice.IsPort());
    }
    BusIndex orphan("E(1)", nullptr);
    orphan.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INPUT, orphan.GetPortPolarity().GetValue());
    BusSlice lost("E(1:0)", nullptr);
    lost.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INVALID, lost.GetPortPolarity().GetValue());
}

TEST(Signal, PolarityOfACompoundIsThatOfItsFirstMember) {
    ScalarSignal a("a");
    ScalarSignal b("b");
    CompoundBus compound("a,b");
    compound.AddBusMember(&a);
    compound.SetPortPolarity(Polarity::OUTPUT);
    EXPECT_EQ(Polarity::OUTPUT, a.GetPortPolarity().GetValue());
    EXPECT_EQ(Polarity::INVALID, compound.GetPortPolarity().GetValue()); // one member is none
    compound.AddBusMember(&b);
    EXPECT_EQ(Polarity::OUTPUT, compound.GetPortPolarity().GetValue());
    EXPECT_EQ(Polarity::INVALID, b.GetPortPolarity().GetValue());
    EXPECT_FALSE(compound.IsPort());
    compound.SetAt(1, nullptr);
    compound.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INPUT, a.GetPortPolarity().GetValue());
}

TEST(Signal, ConnectAndDisconnect) {
    ScalarSignal a("a");
    ScalarSignal b("b");
    ScalarPin p("p", Polarity::INPUT);
    a.Connect(&p);
    a.Connect(&p);
    a.Connect(static_cast<Pin *>(nullptr));
    b.Connect(&p);
    EXPECT_EQ("p", NamesOf(a.GetPinIterator()));
    EXPECT_EQ("p", NamesOf(b.GetPinIterator()));
    EXPECT_EQ(&b, p.GetSignal());
    a.Connect(&p); // listed already: the pin stays where it is
    EXPECT_EQ(&b, p.GetSignal());
    a.Disconnect(&p); // the pin is cleared wherever it is
    EXPECT_EQ(nullptr, p.GetSignal());
    EXPECT_EQ("", NamesOf(a.GetPinIterator()));
}

TEST(Signal, AssignmentsAreListedOneWay) {
    ScalarSignal a("a");
    ScalarSignal b("b");
    b.Connect(&a);
    b.Connect(&a);
    b.Connect(&b);
    b.Connect(static_cast<Signal *>(nullptr));
    EXPECT_EQ("a b", NamesOf(b.GetSignalIterator()));
    EXPECT_EQ("", NamesOf(a.GetSignalIterator()));
    b.Disconnect(&a);
    EXPECT_EQ("b", NamesOf(b.GetSignalIterator()));
    b.AssignConstantValue("4:b:1010");
    b.DisconnectAll();
    EXPECT_EQ("", NamesOf(b.GetSignalIterator()));
    EXPECT_STREQ("1010", b.GetConstantValue().GetValue());
}

TEST(Signal, CloneConnectionMoves) {
    ScalarSignal a("a");
    ScalarSignal b("b");
    ScalarSignal c("c");
    ScalarPin p("p", Polarity::INPUT);
    ScalarPin q("q", Polarity::OUTPUT);
    ScalarPin r("r", Polarity::OUTPUT);
    a.Connect(&p);
    a.Connect(&q);
    a.Connect(&c);
    c.Connect(&p); // still listed by a, and so moved with it
    b.Connect(&r);
    b.Connect(&a);
    b.CloneConnection(&a);
    EXPECT_EQ("p q", NamesOf(b.GetPinIterator()));
    EXPECT_EQ("c", NamesOf(b.GetSignalIterator()));
    EXPECT_EQ("", NamesOf(a.GetPinIterator()) + NamesOf(a.GetSignalIterator()));
    EXPECT_TRUE(p.GetSignal() == &b && q.GetSignal() == &b && r.GetSignal() == nullptr);
}

TEST(Signal, HasMultiDriver) {
    struct Row {
        char const *pins; ///< i, o, b and - for null
        bool expected;
    };
    for (Row const &row : std::vector<Row>{{"", false},
                                           {"o", false},
                                           {"oi", false},
                                           {"obb", false},
                                           {"oibo", true},
                                           {"ooo", true}}) {
        ScalarSignal signal("s");
        signal.SetPortPolarity(Polarity::OUTPUT);
        std::deque<ScalarPin> pins;
        for (char const c : std::string(row.pins))
            signal.Connect(&pins.emplace_back("p", Polarity(std::string(1, c).c_str())));
        EXPECT_EQ(row.expected, signal.HasMultiDriver()) << row.pins;
    }
}

TEST(Signal, LongListsStillRefuseWhatTheyHold) {
    ScalarSignal signal("s");
    std::deque<ScalarPin> pins;
    for (int i = 0; i < 100000; ++i)
        signal.Connect(&pins.emplace_back("p", Polarity::INPUT));
    for (ScalarPin &pin : pins)
        signal.Connect(&pin);
    auto const count = [](Iterator<Pin *> walk) {
        int n = 0;
        ForEach(walk, [&n](Pin *) { ++n; });
        return n;
    };
    EXPECT_EQ(100000, count(signal.GetPinIterator()));
    signal.Disconnect(&pins[70000]);
    EXPECT_EQ(99999, count(signal.GetPinIterator()));
    signal.Connect(&pins[70000]); // gone from the index, too
    EXPECT_EQ(100000, count(signal.GetPinIterator()));
    ScalarSignal other("t");
    other.CloneConnection(&signal);
    signal.Connect(&pins[5]);
    other.Connect(&pins[5]);
    EXPECT_EQ(1, count(signal.GetPinIterator()));
    EXPECT_EQ(100000, count(other.GetPinIterator()));
}

TEST(Signal, SliceDirections) {
    struct Row {
        char const *bus;
        char const *slice;
        bool isSame;
    };
    for (Row const &row : std::vector<Row>{{"D(7:0)", "D(3:0)", true},
                                           {"D(7:0)", "D(0:3)", false},
                                           {"D(0:7)", "D(0:3)", true},
                                           {"D(0:7)", "D(3:0)", false},
                                           {"D(7:0)", "D(3:3)", false},
                                           {"D(0:7)", "D(3:3)", true}}) {
        Bus bus(row.bus);
        EXPECT_EQ(row.isSame, BusSlice(row.slice, &bus).IsSameDirectionAsParent()) << row.slice;
    }
}

TEST(Signal, BaseNamesThatNeedADeclaration) {
    Bits bits;
    ScalarSignal lower("a");
    std::unique_ptr<CompoundBus> const compound(
        Compound("A,D(3:0),a", {&bits.scalar, nullptr, &bits.slice, &lower}));
    StringSet names;
    bits.index.GetBaseName(names);
    compound->GetBaseName(names);
    for (char const *const name : {"D", "A,D(3:0),a", "A"})
        EXPECT_TRUE(names.Contains(name)) << name;
    EXPECT_FALSE(names.Contains("a")) << "A is there already";
    EXPECT_FALSE(names.Contains("D(3:0)"));
}

TEST(Signal, VisitorsSeeTheClassFirst) {
    struct Visitor : SignalVisitor {
        std::string seen;
        void VisitSignal(Signal *) override { seen += "signal "; }
        void VisitScalarSignal(ScalarSignal *) override { seen += "scalar "; }
        void VisitBus(Bus *) override { seen += "bus "; }
        void VisitBusSlice(BusSlice *) override { seen += "slice "; }
        void VisitBusIndex(BusIndex *) override { seen += "index "; }
        void VisitCompoundBus(CompoundBus *) override { seen += "compound "; }
    } visitor;
    Bits bits;
    CompoundBus compound("A,B");
    for (Signal *const signal :
         std::vector<Signal *>{&bits.scalar, &bits.bus, &bits.slice, &bits.index, &compound})
        signal->AcceptSignal(visitor);
    EXPECT_EQ("scalar signal bus signal slice signal index signal compound signal ", visitor.seen);
}

} // namespace
