// Widening replaces a bus by another object. These designs once left a pointer to the dead one.

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "vesk_hdl/netlist/Netlist.h"

using namespace Vesk_Hdl;

namespace {

struct Row {
    char const *name;
    std::vector<std::string> before; ///< the passes of a write
    std::vector<std::string> after;
    std::vector<std::string> slices; ///< what stands for the former buses, outside the netlist
};

Row const ROWS[] = {
    {"a compound of dummies lists the bus",
     {"ADD COMPONENT C", "ADD PIN C Q(0:7) out", "ADD INSTANCE C u", "ADD PORT s(6:7) in",
      "CONNECT SIGNAL s(3:3),x_DUMMY(2:2),t(8:5) u.Q(0:7)"},
     {"CONNECT SIGNAL t(9:4) x", "CONNECT SIGNAL t_DUMMY(9:4) x", "CONNECT SIGNAL s(9:0) x"},
     {"[t(8:5)]", "[t_DUMMY(8:5)]", "[s(6:7)]"}},
    {"a bus hands its links on, then is widened again",
     {"CONNECT SIGNAL a D(3:0)", "CONNECT SIGNAL D(3:0) E(1:0)", "CONNECT SIGNAL D(7:0) E(1:0)"},
     {"CONNECT SIGNAL E(2:0) a", "CONNECT SIGNAL E(3:0) D(9:0)", "CONNECT SIGNAL D(10:0) D(10:0)"},
     {"[D(3:0)]", "[D(7:0)]", "[E(1:0)]", "[E(2:0)]"}},
};

} // namespace

TEST(Widening, LeavesNoPointerToTheFormerBus) {
    for (Row const &row : ROWS) {
        Design design;
        EXPECT_EQ(Refusal(design.model, row.before), "") << row.name;
        design.netlist.CreateVhdlDummySignals();
        EXPECT_EQ(Refusal(design.model, row.after), "") << row.name;
        std::string const wiring = Wiring(design.netlist);
        for (std::string const &slice : row.slices)
            EXPECT_NE(wiring.find(slice), std::string::npos) << row.name << ": " << slice;
    }
}
