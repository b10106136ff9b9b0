#include "vesk_hdl/netlist/Netlist.h"

#include <cctype>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/RandomText.h"

using namespace Vesk_Hdl;

namespace {

Signal *AddScalar(Netlist &netlist, char const *name, Polarity const &polarity = Polarity()) {
    auto *const signal = new ScalarSignal(name);
    signal->SetPortPolarity(polarity);
    netlist.Add(signal);
    return signal;
}

/// Computes the order in another way: finds the first difference, then compares whole runs of
/// digits.
int ModelCompare(std::string const &a, std::string const &b) {
    auto const at = [](std::string const &text, std::size_t i) {
        return i < text.size() ? static_cast<signed char>(std::toupper(text[i] & 0xFF)) : 0;
    };
    auto const run = [](std::string const &text, std::size_t i) {
        std::size_t const end = text.find_first_not_of("0123456789", i);
        return (end == std::string::npos ? text.size() : end) - i;
    };
    std::size_t i = 0;
    while (i < a.size() && at(a, i) == at(b, i))
        ++i;
    std::size_t const runA = i < a.size() ? run(a, i) : 0;
    std::size_t const runB = i < b.size() ? run(b, i) : 0;
    if (runA != runB)
        return runA > runB ? 1 : -1;
    return at(a, i) == at(b, i) ? 0 : at(a, i) < at(b, i) ? -1 : 1;
}

TEST(Netlist, FindsByNameInAnyForm) {
    Netlist netlist("n[1]");
    EXPECT_STREQ("n[1]", netlist.GetName()); // the one name that stays as given
    EXPECT_EQ(nullptr, netlist.GetSignal(nullptr));
    auto *const bus = new Bus("D[7-0]");
    netlist.Add(bus);
    netlist.Add(new BusSlice("D(3:0)", bus));
    Signal *const empty = AddScalar(netlist, "");
    netlist.Add(new Component("c<1>"));
    netlist.Add(new Instance("u{1}", netlist.GetComponent("C(1)")));
    EXPECT_EQ(bus, netlist.GetSignal("d<7:0>"));
    EXPECT_EQ(nullptr, netlist.GetSignal("D(3)"));
    EXPECT_EQ(empty, netlist.GetSignal(nullptr));
    EXPECT_STREQ("c(1)", netlist.GetInstance("U[1]")->GetComponentName());
    for (char const *const name : {"D(3)", "d[3]", "D<1-0>", "d"})
        EXPECT_EQ(bus, netlist.GetParentBus(name)) << name;
    for (char const *const name : {"D,E", "E", "D(3),E(2)", ""})
        EXPECT_EQ(nullptr, netlist.GetParentBus(name)) << name;
}

TEST(Netlist, TheNewerOfTwoIsFound) {
    Netlist netlist("n");
    Signal *const first = AddScalar(netlist, "s");
    Signal *const second = AddScalar(netlist, "S");
    auto *const bus = new Bus("s(1:0)");
    netlist.Add(new Bus("S(3:0)"));
    netlist.Add(bus);
    EXPECT_EQ(second, netlist.GetSignal("s"));
    EXPECT_EQ(bus, netlist.GetParentBus("s"));
    netlist.Remove(first); // takes the name out of the map, although the second signal has it
    EXPECT_EQ(nullptr, netlist.GetSignal("s"));
    EXPECT_EQ("S S(3:0) s(1:0)", NamesOf(netlist.GetSignalIterator()));
}

TEST(Netlist, RemoveFreesPinsAndNames) {
    Design design(CellsAnd("s u1.A; s u2.A; sig D(3:0); ADD COMPONENT EMPTY"));
    Netlist &netlist = design.netlist;
    netlist.Remove(netlist.GetSignal("s"));
    netlist.Remove(netlist.GetSignal("D(3:0)"));
    netlist.Remove(netlist.GetInstance("u3"));
    netlist.Remove(netlist.GetComponent("EMPTY"));
    netlist.Remove(static_cast<Signal *>(nullptr));
    EXPECT_EQ("", Wiring(netlist));
    EXPECT_EQ(nullptr, netlist.GetParentBus("D"));
    EXPECT_EQ("", Refusal(design.model, Short("sig s; sig D(7:0); ADD INSTANCE CELL u3;"
                                              "ADD COMPONENT EMPTY")));
}

/// A netlist goes on finding an object by the name that it was added under, but not when it is
/// gone.
TEST(Netlist, FindsNothingThatWasRenamedAndRemoved) {
    Design design(Short("sig s; sig D(3:0)"));
    Netlist &netlist = design.netlist;
    for (char const *const name : {"s", "D(3:0)", "late"}) {
        Signal *const found = netlist.GetSignal(name);
        Signal *const signal = found ? found : AddScalar(netlist, name);
        signal->SetName("E(1:0)");
        EXPECT_EQ(signal, netlist.GetSignal(name));
        netlist.Remove(signal);
        EXPECT_TRUE(!netlist.GetSignal(name) && !netlist.GetParentBus(name)) << name;
    }
}

TEST(Netlist, InstancesOfAComponent) {
    Design design(CellsAnd("ADD COMPONENT OTHER; ADD INSTANCE OTHER o1"));
    PtrArray<Instance *> found;
    for (auto const &[name, instances] :
         {std::pair{"cell", "u1 u2 u3"}, {"OTHER", "o1"}, {"unknown", ""}}) {
        design.netlist.GetInstances("CELL", found);
        design.netlist.GetInstances(name, found);
        EXPECT_EQ(instances, NamesOf(found));
    }
}

TEST(Netlist, SortsByPolarityAndName) {
    Design design(Short(
        "ADD COMPONENT b10; ADD COMPONENT B9; ADD PIN b10 y out; ADD PIN b10 z bi;"
        "ADD PIN b10 A10 in; ADD PIN b10 a9 in; ADD INSTANCE b10 u2; ADD INSTANCE b10 U1;"
        "port q out; port D10 in; port D2 in; port io bi; sig clk; port a(3:0) in; a(1) u2.z"));
    design.netlist.SortNetlist();
    EXPECT_EQ("clk a(1) a(3:0) D2 D10 q io", NamesOf(design.netlist.GetSignalIterator()));
    EXPECT_EQ("B9 b10", NamesOf(design.netlist.GetComponentIterator()));
    EXPECT_EQ("U1 u2", NamesOf(design.netlist.GetInstanceIterator()));
    EXPECT_EQ("a9 A10 y z", NamesOf(design.netlist.GetInstance("u2")->GetPinIterator()));
    EXPECT_EQ("y z A10 a9", NamesOf(design.netlist.GetComponent("b10")->GetPinIterator()));
}

/// The rule of the order, as a comparison for PtrArray::Sort.
bool SortsBefore(void *a, void *b, void *) {
    auto const *const first = static_cast<Signal *>(a);
    auto const *const second = static_cast<Signal *>(b);
    if (first->GetPortPolarity() != second->GetPortPolarity())
        return first->GetPortPolarity() < second->GetPortPolarity();
    return ModelCompare(first->GetName().GetText(), second->GetName().GetText()) < 0;
}

/// Names at random, and names that ascend, which are moved without a sort, but for one now and
/// then.
TEST(Netlist, SortsLikeAModelAndAsTheArraySortDoes) {
    std::mt19937 random(1);
    for (int round = 0; round < 200; ++round) {
        bool const ascends = round > 2;
        std::string const start = round == 0   ? "a_name_of_thirty_characters_9"
                                  : round == 1 ? "n"
                                               : "";
        Netlist netlist("n");
        PtrArray<Signal *> expected;
        int const size = ascends ? static_cast<int>(random() % 12) : 700;
        for (int i = 0; i < size; ++i) {
            std::string const name =
                ascends ? "n" + std::to_string(i) : start + RandomText(random, "aB102_\x80\xff", 4);
            auto const polarity = static_cast<Polarity::Value>(static_cast<int>(random() % 4) - 1);
            expected.Add(AddScalar(netlist, name.c_str(), polarity));
        }
        if (ascends && round % 4 == 0 && size > 2)
            expected.GetAt(static_cast<int>(random()) & 1)->SetName("n5");
        expected.Sort(SortsBefore, nullptr);
        netlist.SortNetlist();
        Iterator<Signal *> walk = netlist.GetSignalIterator();
        for (int i = 0; i < size; ++i, walk.Advance())
            ASSERT_EQ(expected.GetAt(i), walk.Current()) << round << ", " << i;
    }
}

TEST(Netlist, SeriesThatTakeTurnsAreMergedAsTheArraySortSorts) {
    std::mt19937 random(2);
    for (int series = 1; series < 11; ++series)
        for (bool const repeats : {false, true}) {
            Netlist netlist("n");
            PtrArray<Signal *> expected;
            for (int i = 0; i < 300; ++i) {
                int const one = static_cast<int>(random()) & 0xff;
                std::string name(static_cast<std::size_t>(7 * series), 'x');
                name += char('a' + one % series);
                name += std::to_string(repeats && i == 200 ? 100 : i);
                expected.Add(AddScalar(netlist, name.c_str()));
            }
            expected.Sort(SortsBefore, nullptr);
            netlist.SortNetlist();
            Iterator<Signal *> walk = netlist.GetSignalIterator();
            for (int i = 0; i < 300; ++i, walk.Advance())
                ASSERT_EQ(expected.GetAt(i), walk.Current()) << series << ' ' << i;
        }
}

} // namespace
