// A range as wide as a bus or wider takes the bus's place, and the bus becomes a slice of it.

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

TEST(Widening, KeepsEverythingThatLedToTheFormerBus) {
    using Row = std::pair<char const *, char const *>;
    for (auto const &[lines, wiring] : std::vector<Row>{
             {"D(3:0) u1.B(3:0); D(7:0) u1.W(7:0)", "D(7:0): u1.W(7:0)\n[D(3:0)]: u1.B(3:0)\n"},
             {"n D(3:0); D(7:0) m", "n <- D(3:0)\nD(7:0) <- m\nm\n[D(3:0)]\n"},
             {"D(3:0) D(3:0); D(7:0) m", "D(7:0) <- m\nm\n[D(3:0)] <- D(3:0)\n"},
             // The left side of the line itself is widened, then members of the compound that is
             // being made.
             {"D(3:0) D(7:0)", "D(7:0)\n[D(3:0)] <- D(7:0)\n"},
             {"D(3:0) n,D(7:0)", "n\nD(7:0)\nn,D(7:0) {n D(7:0)}\n[D(3:0)] <- n,D(7:0)\n"},
             {"X(0:0),X(3:0),X(7:0) X(9:0)",
              "X(0:0),X(3:0),X(7:0) {X(0:0) X(3:0) X(7:0)} <- X(9:0)\nX(9:0)\n"
              "[X(0:0)]\n[X(3:0)]\n[X(7:0)]\n"},
             {"X(7:0),X(3:0) n", "X(7:0)\nX(3:0)\nX(7:0),X(3:0) {X(7:0) X(3:0)} <- n\nn\n"},
             {"A,D(3:0) n; D(7:0) n", "A\nA,D(3:0) {A D(3:0)} <- n\nn\nD(7:0) <- n\n[D(3:0)]\n"},
             {"u1.B(3:0) = 0; u1_B_CONST_SIGNAL(7:0) n",
              "u1_B_CONST_SIGNAL(7:0) <- n\nn\n[u1_B_CONST_SIGNAL(3:0)]: (u1.B(3:0))\n"},
             {"D(1:0) u1.B(3:0); n D(1:0); D(3:0) u1.Q(3:0); m,D(3:0) n; D(7:0) u1.W(7:0)",
              "n <- D(1:0)\nm\nm,D(3:0) {m D(3:0)} <- n\nD(7:0): u1.W(7:0)\n[D(1:0)]: u1.B(3:0)\n"
              "[D(3:0)]: u1.Q(3:0)\n"},
             {"D(1:0) E(1:0); D(3:0) n; E(3:0) n",
              "D(3:0) <- n\nn\nE(3:0) <- n\n[D(1:0)] <- E(1:0)\n[E(1:0)]\n"},
             {"D(7:0) u1.W(7:0); D(0:7) n", "D(0:7) <- n\nn\n[D(7:0)]: u1.W(7:0)\n"},
             // The former name again, now a slice.
             {"D(3:0) u1.B(3:0); D(7:0) n; D(3:0) u2.B(3:0)",
              "D(7:0) <- n\nn\nD(3:0): u2.B(3:0)\n[D(3:0)]: u1.B(3:0)\n"},
             {"D(7:0) u1.W(7:0); D(12:10) u1.B(3:0)", "D(7:0): u1.W(7:0)\nD(12:10): u1.B(3:0)\n"},
             {"sig D(7:0); D(2147483647:2147483648) n", // 4294967296 bits, which no int counts
              "D(2147483647:2147483648) <- n\nn\n[D(7:0)]\n"},
             {"sig D(3:0); n D[3:0]", "D(3:0)\nn <- D(3:0)\n"}}) {
        Design design(CellsAnd(lines));
        EXPECT_EQ(wiring, Wiring(design.netlist)) << lines;
    }
    Design design(Short("sig D(3:0)")); // a typed bracket does not widen
    EXPECT_EQ("Signal \"D[7:0]\" already declared.\n", Refusal(design.model, Short("n D[7:0]")));
    // The name on the right may be that of the bus that gives way.
    EXPECT_TRUE(
        design.model.ConnectSignals("D(7:0)", design.netlist.GetSignal("D(3:0)")->GetNameRef()));
    EXPECT_EQ("n\nD(7:0) <- D(3:0)\nD(3:0)\n[D(3:0)]\n", Wiring(design.netlist));
}

TEST(Widening, GivesPartsTheNewParent) {
    Design design(CellsAnd("port D(3:0) out; D(2) u1.A; D(1:0) u1.B(3:0); D(3:0) = 1"));
    design.model.GetSignal("D(3:0)")->AddComment("c");
    EXPECT_EQ("", Refusal(design.model, Short("D(7:0) u1.W(7:0)")));
    EXPECT_EQ(nullptr, design.model.GetSignal("D(3:0)"));
    Bus *const wide = design.netlist.GetParentBus("D");
    ASSERT_EQ(wide, design.model.GetSignal("D(7:0)"));
    EXPECT_EQ("D(3:0) D(2) D(1:0)", NamesOf(wide->GetBusSliceIterator()));
    EXPECT_TRUE(!wide->IsPort() && !wide->HasComment() && !wide->HasConstantValue());
    for (char const *const part : {"D(2)", "D(1:0)"}) {
        design.model.GetSignal(part)->SetPortPolarity(Polarity::INPUT);
        EXPECT_EQ(Polarity::INPUT, wide->GetPortPolarity().GetValue()) << part;
        wide->SetPortPolarity(Polarity());
        EXPECT_EQ(Polarity::INVALID, design.model.GetSignal(part)->GetPortPolarity().GetValue());
    }
}

/// Pointers that a client made through the objects and not through Model.
TEST(Widening, LeavesNoPointerThatAClientMade) {
    struct Row {
        char const *name;
        void (*make)(Netlist &);
        char const *wiring;
    };
    static auto const at = [](Netlist &netlist, char const *name) {
        return netlist.GetSignal(name);
    };
    for (Row const &row : std::vector<Row>{
             {"a link", [](Netlist &n) { at(n, "t")->Connect(at(n, "b(3:0)")); }, "t <- b(3:0)"},
             {"a moved link", [](Netlist &n) { at(n, "t")->CloneConnection(at(n, "s")); },
              "t <- b(3:0)"},
             {"a link moved twice",
              [](Netlist &n) {
                  at(n, "x")->CloneConnection(at(n, "s"));
                  at(n, "t")->CloneConnection(at(n, "x"));
              },
              "t <- b(3:0)"},
             {"a moved link beside one to a signal that is gone",
              [](Netlist &n) {
                  at(n, "s")->Connect(at(n, "x"));
                  at(n, "t")->CloneConnection(at(n, "s"));
                  Signal *const gone = at(n, "x");
                  n.Remove(gone);
                  at(n, "s")->CloneConnection(at(n, "t"));
                  at(n, "t")->CloneConnection(at(n, "s"));
                  at(n, "t")->Disconnect(gone);
              },
              "t <- b(3:0)"},
             {"a member",
              [](Netlist &n) {
                  auto *const compound = new CompoundBus("k,b(3:0)");
                  n.Add(compound);
                  compound->AddBusMember(at(n, "t"));
                  compound->AddBusMember(at(n, "b(3:0)"));
              },
              "k,b(3:0) {t b(3:0)}"},
             {"a pin",
              [](Netlist &n) { n.GetInstance("u1")->GetPin("A")->Connect(at(n, "b(3:0)")); },
              "(u1.A)"},
             {"a copied pin",
              [](Netlist &n) {
                  ScalarPin tied("A", Polarity::INPUT);
                  tied.Connect(at(n, "b(3:0)"));
                  static_cast<ScalarPin &>(*n.GetInstance("u1")->GetPin("A")) = tied;
              },
              "(u1.A)"}}) {
        SCOPED_TRACE(row.name);
        Design design(CellsAnd("sig b(3:0); sig t; sig x; s b(3:0)"));
        row.make(design.netlist);
        EXPECT_TRUE(design.model.AssignConstantToSignal("b(7:0)", "1"));
        EXPECT_NE(Wiring(design.netlist).find(row.wiring), std::string::npos)
            << Wiring(design.netlist);
        TextMemOutStream text("");
        VhdlNetlister(text).WriteNetlist(&design.netlist, design.model.GetOptions());
        EXPECT_NE(text.GetValue().View().find("end CFG_"), std::string::npos);
    }
}

} // namespace
