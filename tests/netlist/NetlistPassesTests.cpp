#include <cstdint>
#include <map>

#include <gtest/gtest.h>

#include "tests/support/Dummies.h"
#include "tests/support/Lines.h"
#include "tests/support/Owners.h"

using namespace Vesk_Hdl;

namespace {

TEST(NetlistPasses, VhdlDummies) {
    struct Row {
        char const *lines, *wiring;
    };
    for (Row const &row : std::vector<Row>{
             {"port q out; q u1.Y; q u2.Y; q u3.A", "out q <- q_DUMMY\nq_DUMMY: u1.Y u2.Y u3.A\n"},
             {"port q out; q u1.IO", "out q <- q_DUMMY\nq_DUMMY: u1.IO\n"},
             {"port d in; d u1.IO", "in d\nd_DUMMY: u1.IO <- d\n"},
             // The first dummy takes a pin that went to the in port meanwhile: that is driven no
             // more.
             {"port q out; port d in; q u1.Y; d u1.Y; q u2.A",
              "out q <- q_DUMMY\nin d: u1.Y!\nq_DUMMY: u1.Y u2.A\n"},
             // What is legal stays.
             {"port z bi; z u1.IO; z u2.Y; z u3.Y; port q out; q u1.Y; port d in; d u1.A;"
              "n u2.A; n u3.IO",
              "inout z: u1.IO u2.Y u3.Y\nout q: u1.Y\nin d: u1.A\nn: u2.A u3.IO\n"},
             // Earlier assignments move to the dummy too.
             {"port q out; port d in; q n; q u1.A; d n; d u1.Y",
              "out q <- q_DUMMY\nin d\nn\nq_DUMMY: u1.A <- n\nd_DUMMY: u1.Y <- n d\n"},
             {"port a(7:0) out; a(3:0) u1.Q(3:0); a(3:0) u2.B(3:0); a(7) u3.A",
              "out a(7:0) <- a_DUMMY(7:0)\nout a(3:0)\nout a(7)\na_DUMMY(7:0)\n"
              "a_DUMMY(3:0): u1.Q(3:0) u2.B(3:0)\na_DUMMY(7): u3.A\n"},
             // Compounds: the dummy lists the dummies of the members; a member without a dummy,
             // here a bit of no bus, is left out; a slice of a bus that is no port; a compound that
             // is not read.
             {"port x out; port y out; x,y u1.A",
              "out x <- x_DUMMY\nout y <- y_DUMMY\nx,y {x_DUMMY y_DUMMY}\nx_DUMMY\ny_DUMMY\n"
              "x_DUMMY,y_DUMMY {x_DUMMY y_DUMMY}: u1.A\n"},
             {"port x out; x,c(3) u1.A", "out x <- x_DUMMY\nc(3)\nx,c(3) {x_DUMMY c(3)}\nx_DUMMY\n"
                                         "x_DUMMY,c(3)_DUMMY {x_DUMMY}: u1.A\n"},
             {"port x out; sig b(3:0); x,b(1:0) u1.A",
              "out x <- x_DUMMY\nb(3:0) <- b_DUMMY(3:0)\nb(1:0)\nx,b(1:0) {x_DUMMY b(1:0)}\n"
              "b_DUMMY(3:0)\nb_DUMMY(1:0)\nx_DUMMY\n"
              "x_DUMMY,b_DUMMY(1:0) {x_DUMMY b_DUMMY(1:0)}: u1.A\n"},
             {"port x out; x u1.A; X,n m",
              "out x <- x_DUMMY\nn\nX,n {x_DUMMY n} <- m\nm\nx_DUMMY: u1.A\n"},
             // Ports that are called like a dummy.
             {"port x_DUMMY out; x_DUMMY u1.A", "out x_DUMMY <- x_DUMMY\nx_DUMMY: u1.A\n"},
             {"port a_DUMMY(3:0) out; a_DUMMY(3:0) u1.B(3:0)",
              "out a_DUMMY(3:0) <- a_DUMMY\na_DUMMY: u1.B(3:0)\n"}}) {
        Design design(CellsAnd(row.lines));
        for (int round = 0; round < 2; ++round) { // the second finds nothing more to do
            std::string const planned =
                Dummies(design.netlist, DummyPlan(design.netlist)).GetNames();
            int const before = design.netlist.GetSignals().GetSize();
            design.netlist.CreateVhdlDummySignals();
            EXPECT_EQ(row.wiring, Wiring(design.netlist)) << row.lines;
            EXPECT_EQ(planned, SignalsFrom(design.netlist, before)) << row.lines;
        }
    }
}

TEST(DummyPlan, SaysWhyEachNetGetsADummy) {
    // 1: out port that is read, 2: in port that is driven, 3: several drivers.
    struct Row {
        char const *lines, *steps;
    };
    for (Row const &row :
         std::vector<Row>{{"port q out; port d in; port w out; q u1.A; d u1.Y; w u2.Y; w u3.Y",
                           "q 1 of q; d 2 of d; w 3 of w"},
                          // The bus for its part, members for their compound, a compound last.
                          {"port a(7:0) out; a(3:0) u2.B(3:0)", "a(7:0) 1 of a(3:0)"},
                          {"port x out; sig n; x,n u1.A", "n 1 of x,n; x 1 of x,n; x,n 1 of x,n"},
                          // A compound that begins with a dummy by then is none of an in port any
                          // more; one that holds a dummy gives it a dummy of its own.
                          {"port q out; port d in; q u1.A; q,d u2.Y; q,d u3.Y", "q 1 of q"},
                          {"port q out; port d in; q u1.A; d,q u2.Y",
                           "q 1 of q; q 2 of d,q after 0; d 2 of d,q; d,q 2 of d,q"},
                          // A pin goes with the net that lists it, wherever it was connected later.
                          {"port q out; port d in; q u1.IO; q u2.A; d u1.IO", "q 1 of q"},
                          // A name with brackets that is no bit of a bus has no dummy.
                          {"port c(3) out; c(3) u1.A", ""}}) {
        Design design(CellsAnd(row.lines));
        design.netlist.SortNetlist();
        DummyPlan const plan(design.netlist);
        std::string steps;
        for (int i = 0; i < plan.GetSize(); ++i) {
            DummyPlan::Step const &step = plan.GetAt(i);
            bool const isFirst = step.former == DummyPlan::NONE;
            steps += (i > 0 ? "; " : "") + std::string(step.net->GetName()) + " " +
                     std::to_string(step.reason) + " of " + step.demand->GetName().GetText() +
                     (isFirst ? "" : " after " + std::to_string(step.former));
            EXPECT_EQ(isFirst, plan.Find(step.net) == &step) << steps;
            EXPECT_TRUE(isFirst || plan.GetAt(step.former).later == i) << steps;
        }
        EXPECT_EQ(row.steps, steps);
        std::string const planned = Dummies(design.netlist, plan).GetNames();
        int const before = design.netlist.GetSignals().GetSize();
        design.netlist.CreateVhdlDummySignals();
        EXPECT_EQ(planned, SignalsFrom(design.netlist, before)) << row.lines;
    }
}

TEST(NetlistPasses, ANameDoesNotComeBackInALaterStage) {
    // Stage one finds no signal "x_DUMMY". Stage two makes one, and stage three, whose port has
    // that base name too, must leave it alone.
    Design design(CellsAnd("port x_DUMMY(3) out; port x in; x_DUMMY(3) u1.Y; x_DUMMY(3) u2.Y;"
                           "x_DUMMY(3) u3.A; x u3.Y"));
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out x_DUMMY(3): u1.Y u2.Y u3.A\nin x\nx_DUMMY: u3.Y <- x\n", Wiring(design.netlist));
}

/// The dummy of "a" has the name of a port. Where that port's dummy is made later, it also takes
/// the places of the first dummy. The order is that of a hash table: of these names some come so.
TEST(NetlistPasses, ACompoundListsTheLastOfTwoDummiesOfOneName) {
    for (std::string const name : {"a", "b", "c", "d", "e", "f"}) {
        Design design(CellsAnd("port " + name + "_DUMMY out; port " + name + " out; " + name +
                               "_DUMMY u1.A; " + name + " u2.A; " + name + ",n m"));
        design.netlist.CreateVhdlDummySignals();
        auto const *const compound =
            dynamic_cast<CompoundBus *>(design.netlist.GetSignal((name + ",n").c_str()));
        EXPECT_EQ(compound->GetAt(0), design.netlist.GetSignal((name + "_DUMMY").c_str())) << name;
    }
}

/// A compound with a backslash means the bus of its base name, and that bus has a dummy of the same
/// base name by then: the second dummy is one of the first.
TEST(NetlistPasses, TheSecondNameOfABusMeansItsDummy) {
    Design design(CellsAnd("port d_DUMMY(3:0) out; d_DUMMY(3:0) u1.B(3:0); d_DUMMY(3:0)\\n u2.A"));
    std::string const planned = Dummies(design.netlist, DummyPlan(design.netlist)).GetNames();
    int const before = design.netlist.GetSignals().GetSize();
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out d_DUMMY(3:0) <- d_DUMMY\nn <- n_DUMMY\n"
              "out d_DUMMY(3:0)\\n {d_DUMMY(3:0) n_DUMMY}: u2.A\n"
              "d_DUMMY <- d_DUMMY\nn_DUMMY\nd_DUMMY: u1.B(3:0)\n",
              Wiring(design.netlist));
    EXPECT_EQ(planned, SignalsFrom(design.netlist, before));
}

TEST(NetlistPasses, VerilogDummiesConcernInPortsAlone) {
    Design design(CellsAnd("port q out; q u1.A; q u1.Y; q u2.Y; port d in; d u3.Y"));
    design.netlist.CreateVerilogDummySignals();
    EXPECT_EQ("out q: u1.A u1.Y u2.Y\nin d\nd_DUMMY: u3.Y <- d\n", Wiring(design.netlist));
}

TEST(NetlistPasses, APortThatIsReadAgainGetsASecondDummy) {
    Design design(CellsAnd("port q out; port x out; q u1.A; x u1.IO; x,n m"));
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("", Refusal(design.model, Short("q u2.A")));
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out q <- q_DUMMY\nout x <- x_DUMMY\nn\nx,n {x_DUMMY n} <- m\nm\nq_DUMMY: u1.A\n"
              "x_DUMMY: u1.IO\nq_DUMMY: u2.A <- q_DUMMY\n",
              Wiring(design.netlist));
    EXPECT_EQ(design.netlist.GetSignal("q_DUMMY"), // the newer one
              design.model.GetInstance("u2")->GetPin("A")->GetSignal());
}

TEST(NetlistPasses, TheSliceOfAWidenedBusGetsADummyToo) {
    Design design(CellsAnd("D(3:0) u1.B(3:0); D(7:0) u1.W(7:0)"));
    design.model.GetSignal("D(7:0)")->SetPortPolarity(Polarity::OUTPUT);
    design.netlist.CreateVhdlDummySignals();
    EXPECT_EQ("out D(7:0) <- D_DUMMY(7:0)\nD_DUMMY(7:0): u1.W(7:0)\nD_DUMMY(3:0): u1.B(3:0)\n"
              "out [D(3:0)]\n",
              Wiring(design.netlist));
}

TEST(NetlistPasses, OpenInputPinsGetSignalsOfTheirOwn) {
    Design design(Short("ADD COMPONENT C; ADD PIN C b(+3:00) in; ADD PIN C a in; ADD PIN C s(2) in;"
                        "ADD PIN C y out; ADD PIN C z bi; ADD PIN C t in; ADD PIN C r[1:0] in;"
                        "ADD INSTANCE C u1; ADD INSTANCE C u2; n u1.t; u2.t = 0; n u2.a;"
                        "n u2.b(+3:00)"));
    for (int round = 0; round < 2; ++round) {
        design.netlist.ConnectOpenPinToDummy();
        EXPECT_EQ("n: u1.t u2.a u2.b(+3:00)\nu2_t_CONST_SIGNAL: (u2.t)\n"
                  "u1_b_openSignal(+3:00): (u1.b(+3:00))\nu1_a_openSignal: (u1.a)\n"
                  "u1_r(1:0)_openSignal: (u1.r(1:0))\nu2_r(1:0)_openSignal: (u2.r(1:0))\n",
                  Wiring(design.netlist));
    }
    EXPECT_TRUE(dynamic_cast<Bus *>(design.netlist.GetSignal("u1_b_openSignal(+3:00)")));
}

TEST(NetlistPasses, VendorCellsBecomeBlackBoxes) {
    Design design(Short("ADD COMPONENT C; ADD COMPONENT ATTRIBUTE C LEVEL orvane; ADD COMPONENT D;"
                        "ADD COMPONENT ATTRIBUTE D Level ORVANE2; ADD COMPONENT OWN;"
                        "ADD COMPONENT ATTRIBUTE OWN Level ORVANE;"
                        "ADD COMPONENT ATTRIBUTE OWN Box_Type WHITE"));
    for (int round = 0; round < 2; ++round)
        design.netlist.SetBoxTypeAttribute();
    for (auto const &[name, attributes] :
         {std::pair{"C", "LEVEL=orvane NONE NONE; BOX_TYPE=BLACK_BOX NONE ASSIGN"},
          {"D", "Level=ORVANE2 NONE NONE"},
          {"OWN", "Level=ORVANE NONE NONE; Box_Type=WHITE NONE NONE"}})
        EXPECT_EQ(attributes, AttrsOf(*design.model.GetComponent(name)));
}

} // namespace
