#include "vesk_hdl/model/HdlOptions.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

using namespace Vesk_Hdl;

namespace {

using Verilog = HdlOptions::VerilogOption;

TEST(HdlOptions, Defaults) {
    HdlOptions const o;
    EXPECT_TRUE(o.writeHeader && o.portOnePerLine && !o.macroNetlist);
    EXPECT_TRUE(o.vhdlOption.useDefaultLibrary && o.vhdlOption.openPin);
    EXPECT_FALSE(o.vhdlOption.suppressConfiguration || o.vhdlOption.flattenBus ||
                 o.vhdlOption.useAttrType || o.vhdlOption.suppressComponent);
    EXPECT_EQ(0, o.verilogOption.synthesisType);
    EXPECT_EQ(10, o.verilogOption.signalCase);
    EXPECT_EQ(10, o.verilogOption.instanceCase);
    EXPECT_EQ(10, o.verilogOption.componentCase);
    EXPECT_TRUE(o.vhdlOption.libraries.IsEmpty() && o.vhdlOption.useLibraries.IsEmpty() &&
                o.verilogOption.includes.IsEmpty());
}

TEST(HdlOptions, SynthesisWords) {
    struct Row {
        char const *word;
        int type;
    };
    for (Row const &row : std::vector<Row>{{"qrt", 0},
                                           {"EXEMPLAR", 1},
                                           {"synplicity", 2},
                                           {"SYNOPSYS", 3},
                                           {"Verilog2001", 4},
                                           {"PRECISION", 5},
                                           {"", 0},
                                           {"XYZ", 0},
                                           {"SYNPLICIT", 0},
                                           {nullptr, 0}}) {
        Verilog option;
        option.SetSynthesisType("PRECISION");
        option.SetSynthesisType(row.word);
        EXPECT_EQ(row.type, option.synthesisType) << row.type;
        EXPECT_EQ(row.type != 2, option.IsSemiColonWrittenBeforeAttr()) << row.type;
    }
}

TEST(HdlOptions, CaseWords) {
    struct Row {
        char const *word;
        int type;
    };
    for (Row const &row : std::vector<Row>{{"DEFSULT", 10},
                                           {"default", 10},
                                           {"uppercase", 11},
                                           {"LowerCase", 12},
                                           {"", 10},
                                           {"UPPER", 10}})
        EXPECT_EQ(row.type, Verilog().GetCaseType(row.word)) << row.word;
}

/// All fields but macroNetlist, as text.
std::string Text(HdlOptions const &o) {
    HdlOptions::VhdlOption const &v = o.vhdlOption;
    Verilog const &w = o.verilogOption;
    std::string text;
    for (int const value :
         {int{v.suppressConfiguration}, int{v.flattenBus}, int{v.useDefaultLibrary},
          int{v.useAttrType}, int{v.openPin}, int{v.suppressComponent}, int{o.writeHeader},
          int{o.portOnePerLine}, int{w.synthesisType}, int{w.signalCase}, int{w.instanceCase},
          int{w.componentCase}})
        text += std::to_string(value) + " ";
    for (StringArray const *const list : {&v.libraries, &v.useLibraries, &w.includes})
        text += list->Concatenate(",").GetText();
    for (auto const *const field :
         {&o.application, &o.commandStr, &o.device, &o.purpose, &o.reference})
        text += std::string(" ") + field->GetText();
    return text;
}

TEST(HdlOptions, CopiesTakeAllButTheMacroFlag) {
    HdlOptions o;
    HdlOptions::VhdlOption &v = o.vhdlOption;
    v.suppressConfiguration = v.flattenBus = v.useAttrType = v.suppressComponent = true;
    v.useDefaultLibrary = v.openPin = o.writeHeader = o.portOnePerLine = false;
    v.libraries.Add("l");
    v.useLibraries.Add("u");
    o.verilogOption.includes.Add("i");
    o.verilogOption.SetSynthesisType("SYNOPSYS");
    o.verilogOption.signalCase = Verilog::CASE_UPPER;
    o.verilogOption.instanceCase = o.verilogOption.componentCase = Verilog::CASE_LOWER;
    o.application = "a";
    o.commandStr = "c";
    o.device = "d";
    o.purpose = "p";
    o.reference = "r";
    o.macroNetlist = true;
    std::string const expected = "1 1 0 1 0 1 0 0 3 11 12 12 lui a c d p r";
    HdlOptions const copy(o);
    HdlOptions assigned;
    assigned = o;
    o = *&o;
    EXPECT_EQ(expected, Text(copy));
    EXPECT_EQ(expected, Text(assigned));
    EXPECT_EQ(expected, Text(o));
    EXPECT_TRUE(o.macroNetlist && !copy.macroNetlist && !assigned.macroNetlist);
    o.vhdlOption.libraries.Add("more");
    EXPECT_EQ(1, copy.vhdlOption.libraries.GetSize());
}

} // namespace
