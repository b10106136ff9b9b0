// Statements of both languages with arguments that do not occur in the designs under golden/.

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

TEST_F(InVhdl, NamesAndPorts) {
    EXPECT_WRITTEN("-- synopsys translate_off\nlibrary KORBAL;\nuse KORBAL.Kelements.ALL;\n"
                   "-- synopsys translate_on\n",
                   WriteKorbalLibrary(true));
    EXPECT_WRITTEN("(3 downto 3)", WriteBusIndex(3, 3));
    EXPECT_WRITTEN("(-1 to 7)", WriteBusIndex(-1, 7));
    EXPECT_WRITTEN("D(0 to 7)", WriteBus("D(00:+7)"));
    EXPECT_WRITTEN("D(3)", WriteBus("D(3)"));
    EXPECT_WRITTEN("D   : inout std_logic_vector (0 to 1)",
                   WritePortStatement("D(0:1)", Polarity::BIDIRECTIONAL, 3));
    EXPECT_WRITTEN("D(1) : out   std_logic", WritePortStatement("D(1)", Polarity(), -1));
    EXPECT_WRITTEN("A <= D(3);\n", WriteSignalAssignment("A", "D(3)"));
}

TEST_F(InVhdl, Constants) {
    using Row = std::tuple<char const *, bool, char const *, char const *>;
    for (auto const &[name, isScalar, value, text] :
         {Row{"D(3:0)", false, "4:b:1010", "D(3 downto 0) <= b\"1010\";\n"},
          Row{"D(3:0)", false, "1010", "D(3 downto 0) <= \"1010\";\n"},
          Row{"S", true, "3:b:110", "S <= '0';\n"}, Row{"S", true, "10", "S <= '1';\n"},
          Row{"S", true, "9:b:0", "S <= '1';\n"}, Row{"S", true, "x:b:0", "S <= '1';\n"}})
        EXPECT_WRITTEN(text, WriteConstantSignalAssignment(name, isScalar, value));
}

TEST_F(InVerilog, NamesAndConstants) {
    EXPECT_WRITTEN("output D(3)", WritePortDeclaration("D(3)", Polarity()));
    EXPECT_WRITTEN("", WritePortDeclaration("", Polarity::INPUT));
    EXPECT_WRITTEN("wire [3:0] D", WriteSignalDeclaration("D(3:00)"));
    EXPECT_WRITTEN("D(3)", WriteSignalName("D(3)"));
    EXPECT_WRITTEN("assign D = 12", WriteConstantSignalAssignment("D(3:0)", false, "12"));
    EXPECT_WRITTEN("assign D = 1", WriteConstantSignalAssignment("D(3)", true, "2:h:0F"));
    EXPECT_WRITTEN("assign S = 0", WriteConstantSignalAssignment("S", true, "2:b:10"));
}

TEST(Statements, NothingOfNothing) {
    TextMemOutStream stream;
    StringSet declared;
    AttributeHolder const *const nobody = nullptr;
    VhdlStatements vhdl(stream);
    vhdl.WriteGenericMapAttrType(nullptr);
    vhdl.WriteGenericMapAttr(nullptr);
    vhdl.WriteGenericMapInitAttr(nullptr);
    vhdl.WriteAttrDeclaration(nobody, declared, true, 9);
    vhdl.WriteAttrAssignment(nobody, "N", "signal", true);
    VerilogStatements verilog(stream);
    verilog.WriteParameterStatement(nullptr);
    verilog.WriteDefParamStatement(nullptr, "u1");
    verilog.WriteDefParamInitStatement(nullptr, "u1");
    EXPECT_STREQ("", stream.GetValue());
}

TEST(Statements, TimeStamps) {
    auto const headOf = [](auto statements, TextMemOutStream &stream, char const *file) {
        stream.SetValue("");
        statements.WriteTimeStamp(file);
        std::string const text(stream.GetValue());
        return text.substr(0, text.size() - 20);
    };
    TextMemOutStream out;
    EXPECT_EQ("-- VHDL model created from a.sch - ", headOf(VhdlStatements(out), out, "a.sch"));
    EXPECT_EQ("-- VHDL model - ", headOf(VhdlStatements(out), out, ""));
    EXPECT_EQ("// Verilog model created from a.sch - ",
              headOf(VerilogStatements(out), out, "a.sch"));
    EXPECT_EQ("// Verilog model  - ", headOf(VerilogStatements(out), out, ""));
}

} // namespace
