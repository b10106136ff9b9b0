// Cases that the designs under golden/ do not cover.

#include <array>
#include <string>
#include <tuple>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

/// A design written without header and without default libraries, its lists on one line.
struct Written {
    explicit Written(Design &design) {
        HdlOptions &options = *design.model.GetOptions();
        options.writeHeader = options.vhdlOption.useDefaultLibrary = false;
        options.portOnePerLine = false;
        TextMemOutStream stream;
        VhdlNetlister(stream).WriteNetlist(&design.netlist, &options);
        vhdl = stream.GetValue();
        stream.SetValue("");
        VerilogNetlister(stream).WriteNetlist(&design.netlist, options);
        verilog = stream.GetValue();
    }
    /// The associations of the first instance.
    std::string VhdlPins() const { return Between(vhdl, "port map (", ");\n"); }
    std::string VerilogPins() const { return Between(verilog, " u1 (", ");\n"); }

    static std::string Between(std::string const &text, std::string const &begin, char const *end) {
        std::size_t const from = text.find(begin) + begin.size();
        return text.substr(from, text.find(end, from) - from);
    }

    std::string vhdl, verilog;
};

TEST(Netlisters, PinsOnSignalsOfAnotherForm) {
    using Row = std::array<char const *, 4>; // pin, signal if any, what VHDL and Verilog get
    for (auto const &[pin, signal, vhdl, verilog] :
         {Row{"D(3:0)", "s", "D(3:0)=>s", ".D(s)"}, Row{"D(3:0)", "OPEN", "D(3:0)=>OPEN", ".D()"},
          Row{"D(3:0)", "B(2)", "D(3:0)=>B(2)", ".D(B[2])"},
          Row{"D(3:0)", "R(3:3)", "D(3 downto 0)=>R(3 downto 3)", ".D(R[3:3])"},
          Row{"D(3:0)", "B(0:1),B(7:6)", "D(3)=>B(0), D(2)=>B(1), D(1 downto 0)=>B(7 downto 6)",
              ".D({B[0:1], B[7:6]})"},
          Row{"D(3:0)", "B(7:0),s", "=>B(7 downto 0), =>s", ".D({B[7:0], s})"},
          Row{"D(3)", "B(7:0)", "D(3)=>B(7 downto 0)", ".D(B[7:0])"},
          Row{"D(3)", "B(0:1)", "D(3)=>B(0), D(3)=>B(1)", ".D(B[0:1])"},
          Row{"G(1:1)", "", "G=>open", ".G()"}, Row{"G(1:1)", "O(2:2)", "G(1)=>O(2)", ".G(O[2])"},
          Row{"S", "B(3:3)", "=>B(3)", ".S(B[3:3])"}, Row{"S", "s,t", "=>s, =>t", ".S({s, t})"},
          Row{"A[3:0]", "", "A(3:0)=>open", ".A(3:0)()"},
          Row{"A[3:0]", "R(0:3)", "A(3 downto 0)=>R(0 to 3)", ".A(3:0)(R[0:3])"}}) {
        std::string const cell = "ADD COMPONENT C; ADD PIN C " + std::string(pin) + " bi;";
        std::string const connection = *signal ? std::string(signal) + " u1." + pin : "";
        Design design(Short("sig B(7:0); sig R(0:7); sig O(2:2); " + cell + "ADD INSTANCE C u1; " +
                            connection));
        Written const written(design);
        EXPECT_EQ(vhdl, written.VhdlPins()) << pin << " on " << signal;
        EXPECT_EQ(verilog, written.VerilogPins()) << pin << " on " << signal;
    }
}

TEST(Netlisters, SignalsThatNoCommandMakes) {
    Design design(Short("ADD COMPONENT C; ADD PIN C D(3:0) bi; ADD INSTANCE C u1"));
    Bus up("P(0:3)"), nameless(""), open("Open"), rangeless("X");
    BusSlice namelessSlice("", &up), openSlice("oPEN", &up);
    BusIndex namelessIndex("", &up);
    CompoundBus empty("E");
    Pin *const pin = design.netlist.GetInstance("u1")->GetPin("D(3:0)");
    for (auto const &[signal, vhdl, verilog] :
         std::vector<std::tuple<Signal *, char const *, char const *>>{
             {&nameless, "D=>open", ".D()"},
             {&open, "D(3 downto 0)=>Open", ".D()"},
             {&rangeless, "D(3 downto 0)=>X", ".D(X)"},
             {&namelessSlice, "D(3 downto 0)=>open", ".D()"},
             {&openSlice, "D(3 downto 0)=>oPEN", ".D()"},
             {&namelessIndex, "D(3:0)=>open", ".D()"},
             {&empty, "", ".D()"}}) {
        pin->Connect(signal);
        Written const written(design);
        EXPECT_EQ(vhdl, written.VhdlPins());
        EXPECT_EQ(verilog, written.VerilogPins());
    }
}

TEST(Netlisters, ListsOnOneLine) {
    Design design(Short("SET NETLIST NAME top; ADD COMPONENT C; ADD PIN C I in; ADD PIN C O out;"
                        "ADD INSTANCE C u1; port A in; port Y out; A u1.I; Y u1.O"));
    Written const written(design);
    EXPECT_EQ("I=>A, O=>Y", written.VhdlPins());
    EXPECT_EQ(".I(A), .O(Y)", written.VerilogPins());
    EXPECT_EQ("A, Y", Written::Between(written.verilog, "module top(", ");\n\n input A;\n"));
    EXPECT_EQ("A : in    std_logic; \n       Y : out   std_logic", // never on one line
              Written::Between(written.vhdl, "port ( ", ");\n"));
}

TEST(Netlisters, NoPortsAndNoPins) {
    Design design(Short("SET NETLIST NAME m; ADD COMPONENT C; ADD COMPONENT UNUSED;"
                        "ADD INSTANCE C u2; ADD INSTANCE C u1"));
    Written const written(design);
    EXPECT_EQ("\nentity m is\nport ( );\nend m;\n\narchitecture BEHAVIORAL of m is\ncomponent C\n"
              "end component;\n\nbegin\nu1 : C\n;\n\nu2 : C\n;\n\nend BEHAVIORAL;\n\n"
              "-- synopsys translate_off\nconfiguration CFG_m of  m is\nfor BEHAVIORAL\n"
              "for u1, u2 : C\nuse configuration WORK.CFG_C;\nend for;\nend for;\nend CFG_m;\n"
              "-- synopsys translate_on\n\n",
              written.vhdl);
    EXPECT_EQ("`timescale 1ns / 1ps\n\nmodule m();\n\n\n\nC u1 ();\nC u2 ();\nendmodule\n",
              written.verilog);
}

/// An attribute of the instance hides the component's attribute of that name, even if the former is
/// not written.
TEST(VerilogNetlister, WritesAttributesOfTheComponentUnlessTheInstanceHasThem) {
    Design design(Short("ADD COMPONENT C; ADD COMPONENT ATTRIBUTE C KEEP v;"
                        "SET COMPONENT ATTRIBUTE OPTION C KEEP -SYNATTR=ASSIGN;"
                        "ADD COMPONENT ATTRIBUTE C SIZE 4;"
                        "SET COMPONENT ATTRIBUTE OPTION C SIZE -GENERIC=SYN;"
                        "ADD COMPONENT ATTRIBUTE C LATER w; ADD INSTANCE C u1; ADD INSTANCE C u2;"
                        "ADD INSTANCE C u3; ADD INSTANCE ATTRIBUTE u1 keep x;"
                        "SET INSTANCE ATTRIBUTE OPTION u1 keep -SYNATTR=NONE -GENERIC=NONE;"
                        "ADD INSTANCE ATTRIBUTE u2 size 5;"
                        "SET INSTANCE ATTRIBUTE OPTION u2 size -GENERIC=NONE;"
                        "SET COMPONENT ATTRIBUTE OPTION C LATER -SYNATTR=ASSIGN"));
    auto *const second = new AttributeString("keep", "second"); // of a name only the first counts
    second->SetSynAttr("ASSIGN");
    design.netlist.GetComponent("C")->AddAttr(second);
    std::string const text = Written(design).verilog;
    for (auto const &[line, isThere] : {std::pair{"attribute KEEP of u1", false},
                                        {"attribute LATER of u1", true},
                                        {"defparam u1.SIZE", true},
                                        {"attribute KEEP of u2", true},
                                        {"defparam u2.", false},
                                        {"attribute KEEP of u3", true},
                                        {"second", false},
                                        {"defparam u3.SIZE", true}})
        EXPECT_EQ(isThere, text.find(line) != std::string::npos) << line << " in\n" << text;
}

TEST(VhdlNetlister, DeclaresAttributesOnceInItsLife) {
    Design design(Short("sig N; ADD SIGNAL ATTRIBUTE N K V;"
                        "SET SIGNAL ATTRIBUTE OPTION N K -SYNATTR=ASSIGN"));
    TextMemOutStream stream;
    VhdlNetlister first(stream);
    first.WriteNetlist(nullptr, design.model.GetOptions());
    first.WriteNetlist(&design.netlist, nullptr);
    EXPECT_STREQ("", stream.GetValue());
    for (bool const declares : {true, false}) {
        stream.SetValue("");
        VhdlNetlister copy(first); // the set of what is declared is its own
        (declares ? first : copy).WriteNetlist(&design.netlist, design.model.GetOptions());
        std::string const text(stream.GetValue());
        EXPECT_EQ(declares, text.find("attribute K : string ;\n") != std::string::npos);
        EXPECT_NE(std::string::npos, text.find("attribute K of N : signal is \"V\";\n"));
    }
}

} // namespace
