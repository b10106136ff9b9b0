// Each operation of the two vocabularies, told by the text it writes.

#include <array>
#include <string>
#include <tuple>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

/// Statements on a stream in memory.
template <class Statements> class Page : public testing::Test {
protected:
    /// What was written since the last call.
    std::string Take() {
        std::string text(stream.GetValue());
        stream.SetValue("");
        return text;
    }

    TextMemOutStream stream;
    Statements statements{stream};
};
class InVhdl : public Page<VhdlStatements> {};
class InVerilog : public Page<VerilogStatements> {};

#define EXPECT_WRITTEN(text, call)                                                                 \
    do {                                                                                           \
        statements.call;                                                                           \
        EXPECT_EQ(text, Take());                                                                   \
    } while (false)

/// A signal with an attribute of each type and each synthesis option.
struct Owner : ScalarSignal {
    Owner() : ScalarSignal("N") {
        for (auto const &[type, name, value, option] :
             std::vector<std::array<char const *, 4>>{{"String", "S", "\"a b\"", "ASSIGN"},
                                                      {"Integer", "I", "07", "ASSIGNNODEC"},
                                                      {"Float", "F", "2.50", "NONE"},
                                                      {"Bit", "B", "1", "ASSIGN"},
                                                      {"BitVector", "V", "8:o:17", "ASSIGN"},
                                                      {"BitVector", "W", "0101", "NONE"},
                                                      {"Boolean", "T", "true", "ASSIGN"},
                                                      {"User", "U", "'m'", "ASSIGN"},
                                                      {"User", "E", "", "NONE"}}) {
            AddAttr(AttributeFactory::GetInstance().CreateAttribute(type, name, value));
            GetAttr(name)->SetSynAttr(option);
            if (auto *const user = dynamic_cast<AttributeUser *>(GetAttr(name)))
                user->SetUserType("mode_t");
        }
        AddComment("a\n\nb");
    }
};

TEST_F(InVhdl, Fragments) {
    EXPECT_WRITTEN("-- synopsys translate_off\nlibrary KORBAL;\nuse KORBAL.Kelements.ALL;\n"
                   "-- synopsys translate_on\n",
                   WriteKorbalLibrary(true));
    EXPECT_WRITTEN("std_logic", WriteStdLogic());
    EXPECT_WRITTEN("(3 downto 3)", WriteBusIndex(3, 3));
    EXPECT_WRITTEN("(-1 to 7)", WriteBusIndex(-1, 7));
    EXPECT_WRITTEN("std_logic_vector (7 downto 0)", WriteStdLogicVector(7, 0));
    EXPECT_WRITTEN("D(0 to 7)", WriteBus("D(00:+7)"));
    EXPECT_WRITTEN("D(3)", WriteBus("D(3)"));
}

TEST_F(InVhdl, SignalsAndPorts) {
    EXPECT_WRITTEN("signal A     : std_logic;\n", WriteSignalStatement("A", 5));
    EXPECT_WRITTEN("signal ABCDEF : std_logic;\n", WriteSignalStatement("ABCDEF", 5));
    EXPECT_WRITTEN("signal DATA : std_logic_vector (7 downto 0);\n",
                   WriteSignalVectorStatement("DATA(7:0)", 4));
    EXPECT_WRITTEN("A   : in    std_logic", WritePortStatement("A", Polarity::INPUT, 3));
    EXPECT_WRITTEN("D   : inout std_logic_vector (0 to 1)",
                   WritePortStatement("D(0:1)", Polarity::BIDIRECTIONAL, 3));
    EXPECT_WRITTEN("D(1) : out   std_logic", WritePortStatement("D(1)", Polarity::OUTPUT, -1));
    EXPECT_WRITTEN("A : out   std_logic", WritePortStatement("A", Polarity(), 0));
}

TEST_F(InVhdl, Assignments) {
    EXPECT_WRITTEN("A <= D(3);\n", WriteSignalAssignment("A", "D(3)"));
    EXPECT_WRITTEN("D(0 to 1) <= E(1 downto 0);\n", WriteSignalAssignment("D(0:1)", "E(1:0)"));
    for (auto const &[name, isScalar, value, text] :
         std::vector<std::tuple<char const *, bool, char const *, std::string>>{
             {"D(3:0)", false, "4:b:1010", "D(3 downto 0) <= b\"1010\";\n"},
             {"D(3:0)", false, "1010", "D(3 downto 0) <= \"1010\";\n"},
             {"D(7:0)", false, "8:H:2A", "D(7 downto 0) <= x\"2A\";\n"},
             {"D(3)", true, "0", "D(3) <= '0';\n"},
             {"S", true, "3:b:110", "S <= '0';\n"},
             {"S", true, "10", "S <= '1';\n"},
             {"S", true, "9:b:0", "S <= '1';\n"},
             {"S", true, "x:b:0", "S <= '1';\n"}})
        EXPECT_WRITTEN(text, WriteConstantSignalAssignment(name, isScalar, value));
}

TEST_F(InVhdl, Attributes) {
    Owner const owner;
    for (auto const &[name, text] :
         std::vector<std::pair<char const *, std::string>>{{"S", "S : string :=  \"a b\""},
                                                           {"I", "I : integer :=  7"},
                                                           {"F", "F : real :=  2.50"},
                                                           {"B", "B : bit :=  '1'"},
                                                           {"V", "V : bit_vector :=  o\"17\""},
                                                           {"W", "W : bit_vector :=  \"0101\""},
                                                           {"T", "T : boolean :=  TRUE"},
                                                           {"U", "U : mode_t :=  'm'"},
                                                           {"E", "E : mode_t :=  \"\""}}) {
        EXPECT_WRITTEN(text, WriteGenericMapAttrType(owner.GetAttr(name)));
        EXPECT_WRITTEN(name + (" => " + text.substr(text.find("=  ") + 3)),
                       WriteGenericMapAttr(owner.GetAttr(name)));
    }
    EXPECT_WRITTEN("I => I", WriteGenericMapInitAttr(owner.GetAttr("I")));
    EXPECT_WRITTEN("attribute I    : string ;\n",
                   WriteAttrDeclaration(owner.GetAttr("I"), false, 4));
    EXPECT_WRITTEN("attribute I : integer ;\n", WriteAttrDeclaration(owner.GetAttr("I"), true, 0));

    StringSet declared;
    declared.Add("u");
    EXPECT_WRITTEN("attribute S  : string ;\nattribute B  : bit ;\nattribute V  : bit_vector ;\n"
                   "attribute T  : boolean ;\n",
                   WriteAttrDeclaration(&owner, declared, true, 2));
    EXPECT_WRITTEN("", WriteAttrDeclaration(&owner, declared, true, 2));
}

TEST_F(InVerilog, StatementsAndNames) {
    EXPECT_WRITTEN(" input [7:0] D", WritePortDeclaration("D(7:0)", Polarity::INPUT));
    EXPECT_WRITTEN(" inout A", WritePortDeclaration("A", Polarity::BIDIRECTIONAL));
    EXPECT_WRITTEN("output [0:7] D", WritePortDeclaration("D(0:7)", Polarity::OUTPUT));
    EXPECT_WRITTEN("output D(3)", WritePortDeclaration("D(3)", Polarity()));
    EXPECT_WRITTEN("", WritePortDeclaration("", Polarity::INPUT));
    EXPECT_WRITTEN("wire N", WriteSignalDeclaration("N"));
    EXPECT_WRITTEN("wire [3:0] D", WriteSignalDeclaration("D(3:00)"));
    EXPECT_WRITTEN("D[3:0]", WriteSignalName("D(3:0)"));
    EXPECT_WRITTEN("D(3)", WriteSignalName("D(3)"));
    EXPECT_WRITTEN("assign A[3:0] = B[3:0]", WriteSignalAssignment("A(3:0)", "B(3:0)"));
    EXPECT_WRITTEN("assign D = 4'b10", WriteConstantSignalAssignment("D(3:0)", false, "4:b:10"));
    EXPECT_WRITTEN("assign D = 12", WriteConstantSignalAssignment("D(3:0)", false, "12"));
    EXPECT_WRITTEN("assign D = 1", WriteConstantSignalAssignment("D(3)", true, "2:h:0F"));
    EXPECT_WRITTEN("assign S = 0", WriteConstantSignalAssignment("S", true, "2:b:10"));
    Basis::StringBase<char> name("D(3:0)");
    EXPECT_WRITTEN("", NormalizeBusName(name));
    EXPECT_STREQ("D[3:0]", name);
}

TEST_F(InVerilog, Attributes) {
    Owner const owner;
    for (auto const &[name, text] :
         std::vector<std::pair<char const *, std::string>>{{"S", "S = \"a b\""},
                                                           {"I", "I = 7"},
                                                           {"F", "F = 2.50"},
                                                           {"B", "B = 1'b1"},
                                                           {"V", "V = 8'o17"},
                                                           {"W", "W = 0101"},
                                                           {"T", "T = \"TRUE\""},
                                                           {"U", "U = \"'m'\""},
                                                           {"E", "E = \"\""}}) {
        EXPECT_WRITTEN("parameter " + text, WriteParameterStatement(owner.GetAttr(name)));
        EXPECT_WRITTEN("defparam u1." + text, WriteDefParamStatement(owner.GetAttr(name), "u1"));
    }
    EXPECT_WRITTEN("defparam u1.I = I", WriteDefParamInitStatement(owner.GetAttr("I"), "u1"));
}

TEST(Statements, NothingOfNothing) {
    TextMemOutStream stream;
    StringSet declared;
    VhdlStatements vhdl(stream);
    vhdl.WriteGenericMapAttrType(nullptr);
    vhdl.WriteGenericMapAttr(nullptr);
    vhdl.WriteGenericMapInitAttr(nullptr);
    vhdl.WriteAttrDeclaration(static_cast<AttributeHolder const *>(nullptr), declared, true, 9);
    vhdl.WriteAttrAssignment(static_cast<AttributeHolder const *>(nullptr), "N", "signal", true);
    VerilogStatements verilog(stream);
    verilog.WriteParameterStatement(nullptr);
    verilog.WriteDefParamStatement(nullptr, "u1");
    verilog.WriteDefParamInitStatement(nullptr, "u1");
    ScalarSignal bare("X");
    bare.AddAttr(new AttributeString("K", "V")); // of option "NONE"
    verilog.WriteQRTAttr(bare.GetAttrIterator(), "X");
    verilog.WriteExemplarAttr(bare.GetAttrIterator(), "X");
    verilog.WritePrecisionAttr(bare.GetAttrIterator(), "X");
    verilog.WriteSynplicityAttr(bare.GetAttrIterator());
    verilog.WriteSynopsysAttr(bare.GetAttrIterator());
    EXPECT_STREQ("", stream.GetValue());
}

TEST(Statements, CommentsAndTimeStamps) {
    Owner const owner;
    TextMemOutStream stream;
    VhdlStatements vhdl(stream);
    VerilogStatements verilog(stream);
    vhdl.WriteComment(&owner);
    verilog.WriteComment(&owner);
    EXPECT_STREQ("-- a\n-- b\n// a\n// b\n", stream.GetValue());
    auto const headOf = [&stream](auto &statements, char const *file) {
        stream.SetValue("");
        statements.WriteTimeStamp(file);
        std::string const text(stream.GetValue());
        return text.substr(0, text.size() - 20);
    };
    EXPECT_EQ("-- VHDL model created from a.sch - ", headOf(vhdl, "a.sch"));
    EXPECT_EQ("-- VHDL model - ", headOf(vhdl, ""));
    EXPECT_EQ("// Verilog model created from a.sch - ", headOf(verilog, "a.sch"));
    EXPECT_EQ("// Verilog model  - ", headOf(verilog, ""));
}

} // namespace
