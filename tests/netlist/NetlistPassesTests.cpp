#include <cstdint>
#include <map>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

TEST(NetlistPasses, VhdlDummies) {
    struct Row {
        char const *name;
        Lines lines;
        char const *wiring;
    };
    for (Row const &row : std::vector<Row>{
             {"out port read",
              {"ADD PORT q out", "CONNECT SIGNAL q u1.Y", "CONNECT SIGNAL q u2.A"},
              "out q <- q_DUMMY\nq_DUMMY: u1.Y u2.A\n"},
             {"in port driven",
              {"ADD PORT d in", "CONNECT SIGNAL d u2.A", "CONNECT SIGNAL d u1.Y"},
              "in d\nd_DUMMY: u2.A u1.Y <- d\n"},
             {"two drivers",
              {"ADD PORT q out", "CONNECT SIGNAL q u1.Y", "CONNECT SIGNAL q u2.Y"},
              "out q <- q_DUMMY\nq_DUMMY: u1.Y u2.Y\n"},
             {"two drivers and a reader",
              {"ADD PORT q out", "CONNECT SIGNAL q u1.Y", "CONNECT SIGNAL q u2.Y",
               "CONNECT SIGNAL q u3.A"},
              "out q <- q_DUMMY\nq_DUMMY: u1.Y u2.Y u3.A\n"},
             {"inout pin on an out port",
              {"ADD PORT q out", "CONNECT SIGNAL q u1.IO"},
              "out q <- q_DUMMY\nq_DUMMY: u1.IO\n"},
             {"inout pin on an in port",
              {"ADD PORT d in", "CONNECT SIGNAL d u1.IO"},
              "in d\nd_DUMMY: u1.IO <- d\n"},
             {"what is legal stays",
              {"ADD PORT z bi", "CONNECT SIGNAL z u1.IO", "CONNECT SIGNAL z u2.Y",
               "CONNECT SIGNAL z u3.Y", "ADD PORT q out", "CONNECT SIGNAL q u1.Y", "ADD PORT d in",
               "CONNECT SIGNAL d u1.A", "CONNECT SIGNAL n u2.A", "CONNECT SIGNAL n u3.IO"},
              "inout z: u1.IO u2.Y u3.Y\nout q: u1.Y\nin d: u1.A\nn: u2.A u3.IO\n"},
             {"earlier assignments move along",
              {"ADD PORT q out", "ADD PORT d in", "CONNECT SIGNAL q n", "CONNECT SIGNAL q u1.A",
               "CONNECT SIGNAL d n", "CONNECT SIGNAL d u1.Y"},
              "out q <- q_DUMMY\nin d\nn\nq_DUMMY: u1.A <- n\nd_DUMMY: u1.Y <- n d\n"},
             {"parts of a bus",
              {"ADD PORT a(7:0) out", "CONNECT SIGNAL a(3:0) u1.Q(3:0)",
               "CONNECT SIGNAL a(3:0) u2.B(3:0)", "CONNECT SIGNAL a(7) u3.A"},
              "out a(7:0) <- a_DUMMY(7:0)\nout a(3:0)\nout a(7)\na_DUMMY(7:0)\n"
              "a_DUMMY(3:0): u1.Q(3:0) u2.B(3:0)\na_DUMMY(7): u3.A\n"},
             {"a compound and its members",
              {"ADD PORT x out", "ADD PORT y out", "CONNECT SIGNAL x,y u1.A"},
              "out x <- x_DUMMY\nout y <- y_DUMMY\nx,y {x_DUMMY y_DUMMY}\nx_DUMMY\ny_DUMMY\n"
              "x_DUMMY,y_DUMMY {x_DUMMY y_DUMMY}: u1.A\n"},
             {"a member without a dummy is left out of the compound's", // a bit of no bus is none
              {"ADD PORT x out", "CONNECT SIGNAL x,c(3) u1.A"},
              "out x <- x_DUMMY\nc(3)\nx,c(3) {x_DUMMY c(3)}\nx_DUMMY\n"
              "x_DUMMY,c(3)_DUMMY {x_DUMMY}: u1.A\n"},
             {"a compound with a slice of no port",
              {"ADD PORT x out", "ADD SIGNAL b(3:0)", "CONNECT SIGNAL x,b(1:0) u1.A"},
              "out x <- x_DUMMY\nb(3:0) <- b_DUMMY(3:0)\nb(1:0)\nx,b(1:0) {x_DUMMY b(1:0)}\n"
              "b_DUMMY(3:0)\nb_DUMMY(1:0)\nx_DUMMY\n"
              "x_DUMMY,b_DUMMY(1:0) {x_DUMMY b_DUMMY(1:0)}: u1.A\n"},
             {"a compound that is not read itself",
              {"ADD PORT x out", "CONNECT SIGNAL x u1.A", "CONNECT SIGNAL X,n m"},
              "out x <- x_DUMMY\nn\nX,n {x_DUMMY n} <- m\nm\nx_DUMMY: u1.A\n"},
             {"a port that is called like a dummy",
              {"ADD PORT x_DUMMY out", "CONNECT SIGNAL x_DUMMY u1.A"},
              "out x_DUMMY <- x_DUMMY\nx_DUMMY: u1.A\n"},
             {"a bus that is called like a dummy",
              {"ADD PORT a_DUMMY(3:0) out", "CONNECT SIGNAL a_DUMMY(3:0) u1.B(3:0)"},
              "out a_DUMMY(3:0) <- a_DUMMY\na_DUMMY: u1.B(3:0)\n"}}) {
        Design design(CellsAnd(row.lines));
        design.netlist.CreateVhdlDummySignals();
        EXPECT_EQ(row.wiring, Wiring(design.netlist)) << row.name;
        design.netlist.CreateVhdlDummySignals(); // finds nothing more to do
        EXPECT_EQ(row.wiring, Wiring(design.netlist)) << row.name << ", again";
    }
}

TEST(NetlistPasses, ANameDoesNotComeBackInALaterStage) {
    // Stage one finds no signal "x_DUMMY". Stage two makes one, and stage three, whose port has
    // that base name too, must leave it alone.
    Design design(CellsAnd({"ADD PORT x_DUMMY(3) out", "ADD PORT x in",
                            "CONNECT SIGNAL x_DUMMY(3) u1.Y", "CONNECT SIGNAL x_DUMMY(3) u2.Y",
                            "CONNECT SIGNAL x_DUMMY(3) u3.A", "CONNECT SIGNAL x u3.Y"}));
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out x_DUMMY(3): u1.Y u2.Y u3.A\nin x\nx_DUMMY: u3.Y <- x\n", Wiring(design.netlist));
}

TEST(NetlistPasses, VerilogDummiesConcernInPortsAlone) {
    Design design(CellsAnd({"ADD PORT q out", "CONNECT SIGNAL q u1.A", "CONNECT SIGNAL q u1.Y",
                            "CONNECT SIGNAL q u2.Y", "ADD PORT d in", "CONNECT SIGNAL d u3.Y"}));
    design.netlist.CreateVerilogDummySignals();
    EXPECT_EQ("out q: u1.A u1.Y u2.Y\nin d\nd_DUMMY: u3.Y <- d\n", Wiring(design.netlist));
}

TEST(NetlistPasses, APortThatIsReadAgainGetsASecondDummy) {
    Design design(CellsAnd({"ADD PORT q out", "CONNECT SIGNAL q u1.A"}));
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("", Refusal(design.model, {"CONNECT SIGNAL q u2.A"}));
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out q <- q_DUMMY\nq_DUMMY: u1.A\nq_DUMMY: u2.A <- q_DUMMY\n",
              Wiring(design.netlist));
    EXPECT_EQ(design.netlist.GetSignal("q_DUMMY"), // the newer one
              design.model.GetInstance("u2")->GetPin("A")->GetSignal());
}

TEST(NetlistPasses, TheSliceOfAWidenedBusGetsADummyToo) {
    Design design(CellsAnd({"CONNECT SIGNAL D(3:0) u1.B(3:0)", "CONNECT SIGNAL D(7:0) u1.W(7:0)"}));
    design.model.GetSignal("D(7:0)")->SetPortPolarity(Polarity::OUTPUT);
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out D(7:0) <- D_DUMMY(7:0)\nD_DUMMY(7:0): u1.W(7:0)\nD_DUMMY(3:0): u1.B(3:0)\n"
              "out [D(3:0)]\n",
              Wiring(design.netlist));
}

/// The order in which a set of strings is walked: by bucket, and in a bucket the oldest first and
/// then the newest before the older ones.
class SetOrder {
public:
    void Add(std::string const &name) {
        std::uint32_t hash = 5381;
        for (char const c : name)
            hash = hash * 33 + static_cast<std::uint32_t>(static_cast<signed char>(c));
        std::vector<std::string> &bucket = buckets[hash % 193];
        bucket.insert(bucket.empty() ? bucket.end() : bucket.begin() + 1, name);
    }
    template <class Act> void ForEachName(Act act) const {
        for (auto const &[index, names] : buckets)
            for (std::string const &name : names)
                act(name);
    }

private:
    std::map<std::uint32_t, std::vector<std::string>> buckets;
};

TEST(NetlistPasses, DummiesComeInTheOrderOfTheSet) {
    Lines lines = Cells();
    SetOrder order;
    std::string expected;
    for (int i = 0; i < 150; ++i) {
        std::string const name = "Port" + std::to_string(i * 7919 % 1000);
        expected += (expected.empty() ? "" : " ") + name;
        order.Add(name);
        lines.push_back("ADD PORT " + name + " out");
        lines.push_back("ADD INSTANCE CELL i" + std::to_string(i));
        lines.push_back("CONNECT SIGNAL " + name + " i" + std::to_string(i) + ".A");
    }
    order.ForEachName([&expected](std::string const &name) { expected += " " + name + "_DUMMY"; });
    Design design(lines);
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ(expected, NamesOf(design.netlist.GetSignalIterator()));
}

TEST(NetlistPasses, OpenInputPinsGetSignalsOfTheirOwn) {
    Design design({"ADD COMPONENT C", "ADD PIN C b(+3:00) in", "ADD PIN C a in",
                   "ADD PIN C s(2) in", "ADD PIN C y out", "ADD PIN C z bi", "ADD PIN C t in",
                   "ADD PIN C r[1:0] in", "ADD INSTANCE C u1", "ADD INSTANCE C u2",
                   "CONNECT SIGNAL n u1.t", "ASSIGN CONSTANT u2.t 0", "CONNECT SIGNAL n u2.a",
                   "CONNECT SIGNAL n u2.b(+3:00)"});
    std::string const after = "n: u1.t u2.a u2.b(+3:00)\nu2_t_CONST_SIGNAL: (u2.t)\n"
                              "u1_b_openSignal(+3:00): (u1.b(+3:00))\nu1_a_openSignal: (u1.a)\n"
                              "u1_r(1:0)_openSignal: (u1.r(1:0))\n"
                              "u2_r(1:0)_openSignal: (u2.r(1:0))\n";
    for (int round = 0; round < 2; ++round) {
        design.netlist.ConnectOpenPinToDummy();
        EXPECT_EQ(after, Wiring(design.netlist)) << round;
    }
    EXPECT_TRUE(dynamic_cast<Bus *>(design.netlist.GetSignal("u1_b_openSignal(+3:00)")));
}

TEST(NetlistPasses, VendorCellsBecomeBlackBoxes) {
    struct Row {
        char const *name;
        char const *level; ///< null for none
        char const *own;   ///< BOX_TYPE of the component itself
        char const *boxType;
        char const *synAttr;
    };
    for (Row const &row : std::vector<Row>{{"vendor", "orvane", nullptr, "BLACK_BOX", "ASSIGN"},
                                           {"other", "other", nullptr, nullptr, nullptr},
                                           {"longer", "ORVANE2", nullptr, nullptr, nullptr},
                                           {"none", nullptr, nullptr, nullptr, nullptr},
                                           {"own", "ORVANE", "WHITE", "WHITE", "NONE"}}) {
        Design design({"ADD COMPONENT C"});
        Component *const component = design.model.GetComponent("C");
        if (row.level)
            component->AddAttr(new AttributeString("LEVEL", row.level));
        if (row.own)
            component->AddAttr(new AttributeString("Box_Type", row.own));
        for (int round = 0; round < 2; ++round)
            design.netlist.SetBoxTypeAttribute();
        Attribute const *const boxType = component->GetAttr("BOX_TYPE");
        ASSERT_EQ(row.boxType != nullptr, boxType != nullptr) << row.name;
        EXPECT_STREQ(row.boxType, boxType ? boxType->GetValueString().GetText() : nullptr);
        EXPECT_STREQ(row.synAttr, boxType ? boxType->GetSynAttr().GetText() : nullptr);
        std::string const names = NamesOf(component->GetAttrIterator());
        EXPECT_EQ(names.rfind("BOX_TYPE"), names.find("BOX_TYPE")) << row.name;
    }
}

} // namespace
