#include "vesk_hdl/netlist/Netlist.h"

#include <algorithm>
#include <cctype>
#include <random>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "vesk_hdl/netlist/NaturalOrder.h"

using namespace Vesk_Hdl;

namespace {

Signal *AddScalar(Netlist &netlist, char const *name, Polarity const &polarity = Polarity()) {
    auto *const signal = new ScalarSignal(name);
    signal->SetPortPolarity(polarity);
    netlist.Add(signal);
    return signal;
}

TEST(NaturalCompare, Table) {
    struct Row {
        char const *a;
        char const *b;
        int result;
    };
    for (Row const &row :
         std::vector<Row>{{"abc", "ABC", 0},     {"", "", 0},
                          {"", "a", -1},         {"a", "ab", -1},
                          {"n9", "n10", -1},     {"A2", "a10", -1},
                          {"a19", "a2", 1},      {"a12", "a13", -1},
                          {"a1b2", "a1b10", -1}, {"a1", "ab", 1}, // a digit comes after all others
                          {"a1", "a_", 1},       {"a", "a0", -1},
                          {"A007", "A7", 1}, // the longer run is greater
                          {"a07", "a10", -1},    {"a01b", "a1a", 1},
                          {"a10", "a1a", 1},     {"a_", "aB", 1},
                          {"a_", "ab", 1},       {"\x80", "a", -1},
                          {"\x80", "", -1}}) { // characters are signed
        EXPECT_EQ(row.result, NaturalCompare(row.a, row.b)) << row.a << ' ' << row.b;
        EXPECT_EQ(-row.result, NaturalCompare(row.b, row.a)) << row.b << ' ' << row.a;
    }
}

/// The same order from whole digit runs behind the common beginning.
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

TEST(NaturalCompare, AgreesWithAModelOnAllShortTexts) {
    std::vector<std::string> texts = {""};
    for (std::size_t i = 0; i < texts.size() && texts[i].size() < 3; ++i)
        for (char const c : std::string("aB102_\x80\xff"))
            texts.push_back(texts[i] + c);
    for (std::string const &a : texts)
        for (std::string const &b : texts)
            ASSERT_EQ(ModelCompare(a, b), NaturalCompare(a.c_str(), b.c_str())) << a << ' ' << b;
}

TEST(Netlist, FindsByNameInAnyForm) {
    Netlist netlist("n[1]");
    EXPECT_STREQ("n[1]", netlist.GetName()); // the one name that stays as given
    EXPECT_EQ(nullptr, netlist.GetSignal(nullptr));
    auto *const bus = new Bus("D[7-0]");
    netlist.Add(bus);
    auto *const slice = new BusSlice("D(3:0)", bus);
    netlist.Add(slice);
    Signal *const empty = AddScalar(netlist, "");
    netlist.Add(new Component("c<1>"));
    netlist.Add(new Instance("u{1}", netlist.GetComponent("C(1)")));
    EXPECT_EQ(bus, netlist.GetSignal("d<7:0>"));
    EXPECT_EQ(slice, netlist.GetSignal("D{3-0}"));
    EXPECT_EQ(nullptr, netlist.GetSignal("D(3)"));
    EXPECT_EQ(empty, netlist.GetSignal(nullptr));
    EXPECT_STREQ("u(1)", netlist.GetInstance("U[1]")->GetName());
    EXPECT_STREQ("c(1)", netlist.GetInstance("u(1)")->GetComponentName());
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
    EXPECT_EQ("s S S(3:0) s(1:0)", NamesOf(netlist.GetSignalIterator()));
    netlist.Remove(first); // takes the name out of the map, whoever bears it
    EXPECT_EQ(nullptr, netlist.GetSignal("s"));
    EXPECT_EQ("S S(3:0) s(1:0)", NamesOf(netlist.GetSignalIterator()));
}

TEST(Netlist, RemoveFreesPinsAndNames) {
    Design design(
        CellsAnd({"CONNECT SIGNAL s u1.A", "CONNECT SIGNAL s u2.A", "ADD SIGNAL D(3:0)"}));
    Netlist &netlist = design.netlist;
    netlist.Remove(netlist.GetSignal("s"));
    netlist.Remove(netlist.GetSignal("D(3:0)"));
    netlist.Remove(netlist.GetInstance("u3"));
    netlist.Remove(static_cast<Signal *>(nullptr));
    EXPECT_EQ("", Wiring(netlist));
    EXPECT_EQ(nullptr, netlist.GetSignal("s"));
    EXPECT_EQ(nullptr, netlist.GetParentBus("D"));
    EXPECT_EQ(nullptr, netlist.GetInstance("u3"));
    EXPECT_EQ("", Refusal(design.model, {"ADD SIGNAL D(7:0)", "ADD INSTANCE CELL u3"}));
}

TEST(Netlist, InstancesOfAComponent) {
    Design design(CellsAnd({"ADD COMPONENT OTHER", "ADD INSTANCE OTHER o1"}));
    PtrArray<Instance *> found;
    design.netlist.GetInstances("cell", found);
    EXPECT_EQ("u1 u2 u3", NamesOf(found));
    design.netlist.GetInstances(design.netlist.GetComponent("OTHER"), found);
    EXPECT_EQ("o1", NamesOf(found));
    design.netlist.GetInstances(static_cast<Component *>(nullptr), found);
    EXPECT_EQ(0, found.GetSize());
    design.netlist.GetInstances("CELL", found);
    design.netlist.GetInstances("unknown", found);
    EXPECT_EQ(0, found.GetSize());
}

TEST(Netlist, SortsByPolarityAndName) {
    Design design({"ADD COMPONENT b10", "ADD COMPONENT B9", "ADD PIN b10 y out", "ADD PIN b10 z bi",
                   "ADD PIN b10 A10 in", "ADD PIN b10 a9 in", "ADD INSTANCE b10 u2",
                   "ADD INSTANCE b10 U1", "ADD PORT q out", "ADD PORT D10 in", "ADD PORT D2 in",
                   "ADD PORT io bi", "ADD SIGNAL clk", "ADD PORT a(3:0) in", "ADD SIGNAL AB",
                   "CONNECT SIGNAL a(1) u2.z"});
    design.netlist.SortNetlist();
    EXPECT_EQ("AB clk a(1) a(3:0) D2 D10 q io", NamesOf(design.netlist.GetSignalIterator()));
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

TEST(Netlist, PartsThatAscendAreMovedAsASortWouldMoveThem) {
    std::mt19937 random(5);
    for (int round = 0; round < 200; ++round) {
        Netlist netlist("n");
        std::vector<Signal *> expected;
        int const size = static_cast<int>(random() % 12);
        for (int i = 0; i < size; ++i) {
            auto *const signal = AddScalar(netlist, ("n" + std::to_string(i)).c_str());
            if (random() % 2)
                signal->SetPortPolarity(static_cast<Polarity::Value>(random() % 3));
            expected.push_back(signal);
        }
        if (round % 4 == 0 && size > 2) // one name out of its order
            expected[random() % expected.size()]->SetName("a");
        std::stable_sort(expected.begin(), expected.end(), [](Signal *a, Signal *b) {
            Polarity const left = a->GetPortPolarity();
            Polarity const right = b->GetPortPolarity();
            return left == right ? NaturalCompare(a->GetNameRef(), b->GetNameRef()) < 0
                                 : left < right;
        });
        netlist.SortNetlist();
        std::vector<Signal *> sorted;
        ForEach(netlist.GetSignalIterator(), [&sorted](Signal *s) { sorted.push_back(s); });
        EXPECT_EQ(expected, sorted);
    }
}

TEST(Netlist, EqualNamesGoWhereTheArraySortPutsThem) {
    Netlist netlist("n");
    PtrArray<Signal *> expected;
    std::mt19937 random(1);
    for (int i = 0; i < 500; ++i) {
        std::string const name = (random() % 2 ? "n" : "N") + std::to_string(random() % 40);
        auto const polarity = static_cast<Polarity::Value>(static_cast<int>(random() % 4) - 1);
        expected.Add(AddScalar(netlist, name.c_str(), polarity));
    }
    expected.Sort(SortsBefore, nullptr);
    netlist.SortNetlist();
    int i = 0;
    ForEach(netlist.GetSignalIterator(), [&](Signal *signal) {
        ASSERT_EQ(expected.GetAt(i), signal) << i;
        ++i;
    });
    EXPECT_EQ(500, i);
}

TEST(Netlist, LongestNames) {
    Design design(
        CellsAnd({"ADD PORT DATA(31:0) in", "ADD PORT q out", "ADD SIGNAL signal(1:0)",
                  "CONNECT SIGNAL DATA(31:16) u1.B(3:0)", "CONNECT SIGNAL DATA,signal(1:0) q"}));
    Iterator<Signal *> signals = design.netlist.GetSignalIterator();
    signals.Advance();
    EXPECT_EQ(4, Netlist::GetLongestPortName(signals));
    EXPECT_EQ(6, Netlist::GetLongestSignalName(signals));
    EXPECT_FALSE(signals.HasMore());
    Iterator<Pin *> pins = design.netlist.GetInstance("u1")->GetPinIterator();
    EXPECT_EQ(2, Netlist::GetLongestPinName(pins)); // IO
    Iterator<Pin *> none;
    EXPECT_EQ(0, Netlist::GetLongestPinName(none));
}

TEST(Netlist, LongestAttributeNames) {
    Design design(CellsAnd({"ADD COMPONENT UNUSED", "ADD PORT p in", "ADD SIGNAL s(3:0)",
                            "CONNECT SIGNAL s(1) u1.A"}));
    Netlist &netlist = design.netlist;
    auto const longestAfter = [&netlist](AttributeHolder *holder, char const *name) {
        holder->AddAttr(new AttributeString(name, ""));
        return Netlist::GetLongestAttrName(&netlist);
    };
    EXPECT_EQ(0, Netlist::GetLongestAttrName(&netlist));
    EXPECT_EQ(0, longestAfter(&netlist, "of_the_module"));
    EXPECT_EQ(0, longestAfter(netlist.GetSignal("p"), "of_a_port"));
    EXPECT_EQ(0, longestAfter(netlist.GetSignal("s(1)"), "of_a_bit"));
    EXPECT_EQ(0, longestAfter(netlist.GetComponent("UNUSED"), "of_no_instance"));
    EXPECT_EQ(0, longestAfter(netlist.GetInstance("u1")->GetPin("A"), "of_a_pin"));
    EXPECT_EQ(1, longestAfter(netlist.GetInstance("u1"), "i"));
    EXPECT_EQ(2, longestAfter(netlist.GetComponent("CELL"), "co"));
    EXPECT_EQ(3, longestAfter(netlist.GetSignal("s(3:0)"), "sig"));
    int longest = 12;
    Netlist::GetLongestAttrName(netlist.GetSignal("p"), longest);
    Netlist::GetLongestAttrName(nullptr, longest);
    EXPECT_EQ(12, longest);
}

} // namespace
