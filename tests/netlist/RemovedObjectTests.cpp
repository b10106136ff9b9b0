// Pointers to a removed object stay where they are; the client that removed it has to clear them.
// Operations on the other objects' own data must not follow such a pointer.

#include <deque>
#include <memory>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

TEST(RemovedComponent, ItsInstancesAnswerForTheirPins) {
    for (int const pins : {3, 20}) { // found by a walk, by index
        SCOPED_TRACE(pins);
        Lines lines = Short("ADD COMPONENT C; ADD COMPONENT D; ADD PIN C y out; ADD PIN C b10 in;"
                            "ADD PIN C B9 in");
        for (int i = 3; i < pins; ++i)
            lines.push_back("ADD PIN C p" + std::to_string(i) + " bi");
        lines.insert(lines.end(), {"ADD INSTANCE C u2", "ADD INSTANCE C u1", "ADD PORT q out",
                                   "CONNECT SIGNAL q u2.b10"});
        Design design(lines);
        Netlist &netlist = design.netlist;
        Instance *const instance = netlist.GetInstance("u2");
        Component *const gone = netlist.GetComponent("C");
        netlist.Remove(gone);
        PtrArray<Instance *> placed;
        netlist.GetInstances(gone, placed);
        EXPECT_EQ("u2 u1", NamesOf(placed));
        PtrArray<Pin *> open, reading;
        EXPECT_TRUE(instance->GetOpenPin(open, true));
        instance->GetOutPortConnectedToInPin(reading);
        EXPECT_EQ("B9", NamesOf(open));
        EXPECT_EQ("b10", NamesOf(reading));
        for (int round = 0; round < 2; ++round) { // as it was made, then sorted
            EXPECT_EQ(nullptr, instance->GetPin("z"));
            for (char const *const name : {"Y", "b9", "B10"})
                EXPECT_TRUE(instance->GetPin(name)->IsNamed(name)) << name;
            instance->SortPinName();
        }
        netlist.SortNetlist();
        netlist.ConnectOpenPinToDummy();
        for (char const *const name : {"u1", "u2"})
            EXPECT_TRUE(
                NamesOf(netlist.GetInstance(name)->GetPinIterator()).starts_with("B9 b10 y"))
                << name;
        EXPECT_TRUE(netlist.GetSignal("u1_b10_openSignal") &&
                    !netlist.GetSignal("u2_b10_openSignal"));
    }
}

TEST(RemovedSignal, CompoundsPinsAndLinksTakeItAsItIs) {
    struct Row {
        char const *name;
        void (*act)(Signal *gone);
    };
    for (Row const &row : std::vector<Row>{
             {"a member",
              [](Signal *gone) {
                  CompoundBus compound("a,b"), outer("c,d");
                  compound.AddBusMember(gone);
                  compound.SetAt(3, gone);
                  outer.AddBusMember(&compound);
                  outer.SetAt(0, &compound);
                  EXPECT_TRUE(compound.GetSize() == 4 && compound.GetAt(3) == gone &&
                              compound.GetAt(0) == gone && outer.GetSize() == 1);
              }},
             {"a member of a compound that is added",
              [](Signal *gone) {
                  Netlist netlist("n");
                  auto *const compound = new CompoundBus("a,b");
                  compound->AddBusMember(gone);
                  netlist.Add(compound);
                  EXPECT_EQ(compound, netlist.GetSignal("a,b"));
                  netlist.Remove(compound);
              }},
             {"a pin that is tied, and its copies",
              [](Signal *gone) {
                  ScalarPin pin("p", Polarity::INPUT), assigned("q", Polarity::OUTPUT);
                  pin.Connect(gone);
                  std::unique_ptr<Pin> const clone(pin.ClonePin());
                  assigned = pin;
                  EXPECT_TRUE(clone->GetSignal() == gone && assigned.GetSignal() == gone);
              }},
             {"a link", [](Signal *gone) {
                  ScalarSignal signal("s"), other("t");
                  signal.Connect(gone);
                  signal.Connect(gone);
                  other.CloneConnection(&signal);
                  EXPECT_EQ(gone, other.GetSignalIterator().Current());
                  other.Disconnect(gone);
                  EXPECT_FALSE(other.GetSignalIterator().HasMore());
              }}}) {
        SCOPED_TRACE(row.name);
        Design design(Short("sig removed"));
        Signal *const gone = design.netlist.GetSignal("removed");
        design.netlist.Remove(gone);
        row.act(gone);
    }
    Design design(CellsAnd("u1.A = 1"));
    Pin const *const tied = design.model.GetInstance("u1")->GetPin("A");
    design.netlist.Remove(tied->GetSignal());
    std::unique_ptr<Pin> const clone(tied->ClonePin());
    *design.model.GetInstance("u2")->GetPin("A") = *tied;
    EXPECT_EQ(tied->GetSignal(), clone->GetSignal());
}

/// The slice that takes the place of a widened bus is the netlist's until a client removes it.
TEST(RemovedSignal, MayBeTheSliceOfAWidenedBus) {
    Design design(Short("sig a; sig b; sig D(3:0); D(7:0) n"));
    Netlist &netlist = design.netlist;
    netlist.SortNetlist();
    Bus *const wide = netlist.GetParentBus("D");
    Signal *const slice = wide->GetBusSliceIterator().Current();
    wide->RemoveBusSlice(slice);
    netlist.Remove(slice);
    netlist.GetSignal("a")->SetName("z");
    netlist.SortNetlist(); // which moves "b" from the place where the last removal saw it
    netlist.Remove(netlist.GetSignal("b"));
    EXPECT_EQ("D(7:0) <- n\nn\nz\n", Wiring(netlist));
}

/// Each level lists the one below it twice: a walk into the members would take 2^60 steps.
TEST(CompoundBus, TakesMembersHoweverDeepTheyNest) {
    ScalarSignal scalar("s");
    Signal *below = &scalar;
    std::deque<CompoundBus> levels;
    for (int level = 0; level < 60; ++level) {
        CompoundBus &compound = levels.emplace_back("a,b");
        compound.AddBusMember(below);
        compound.SetAt(1, below);
        below = &compound;
    }
    EXPECT_EQ(2, levels.back().GetSize());
    scalar.SetPortPolarity(Polarity::INPUT);
    EXPECT_EQ(Polarity::INPUT, below->GetPortPolarity().GetValue());
}

} // namespace
