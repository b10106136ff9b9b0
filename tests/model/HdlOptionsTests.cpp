#include "vesk_hdl/model/HdlOptions.h"

#include <string>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/Options.h"

using namespace Vesk_Hdl;

namespace {

TEST(HdlOptions, Defaults) {
    std::string values;
    for (auto const &[name, value] : Fields(HdlOptions()))
        values += value + " ";
    EXPECT_EQ("0 0 1 0 1 0 0 10 10 10 1 1         ", values);
    EXPECT_FALSE(HdlOptions().macroNetlist);
}

TEST(HdlOptions, Words) {
    HdlOptions::VerilogOption option;
    for (auto const &[word, type] : Pairs("qrt=0; EXEMPLAR=1; synplicity=2; SYNOPSYS=3;"
                                          "Verilog2001=4; PRECISION=5; SYNPLICIT=0; =0")) {
        option.SetSynthesisType("PRECISION");
        option.SetSynthesisType(word.c_str());
        EXPECT_EQ(type, std::to_string(option.synthesisType)) << word;
        EXPECT_EQ(type != "2", option.IsSemiColonWrittenBeforeAttr()) << word;
    }
    for (auto const &[word, type] :
         Pairs("DEFSULT=10; default=10; uppercase=11; LowerCase=12; =10; UPPER=10"))
        EXPECT_EQ(type, std::to_string(option.GetCaseType(word.c_str()))) << word;
}

TEST(HdlOptions, CopiesTakeAllButTheMacroFlag) {
    Design design(Pieces(
        "SUPPRESS CONFIGURATION; FLATTEN BUS; USE ATTRTYPE; SUPPRESS COMPONENT; Set Device d;"
        "USE DEFAULT LIBRARY false; Set Open Pin false; ADD LIBRARY l; ADD USE LIBRARY u;"
        "ADD INCLUDE i; SET SYNTHESIS SYNOPSYS; UPPERCASE siganl; LOWERCASE instance;"
        "LOWERCASE component; Set Application a; Set Command c; Set Purpose p; Set Reference r"));
    HdlOptions &o = *design.model.GetOptions();
    o.writeHeader = o.portOnePerLine = false;
    o.macroNetlist = true;
    o.headerTime = 1;
    HdlOptions const copy(o);
    HdlOptions assigned;
    assigned = o;
    o = *&o;
    o.vhdlOption.libraries.Add("more");
    for (HdlOptions const *const each : std::vector<HdlOptions const *>{&copy, &assigned}) {
        EXPECT_EQ("noconfig=1 flat=1 default=0 type=1 open=0 nocomp=1 syn=3 signal=11 instance=12 "
                  "component=12 header=0 oneperline=0 lib=l use=u include=i app=a command=c "
                  "device=d purpose=p reference=r",
                  Changed(*each));
        EXPECT_FALSE(each->macroNetlist);
        EXPECT_EQ(each->headerTime, 1);
    }
    EXPECT_TRUE(o.macroNetlist && o.vhdlOption.libraries.GetSize() == 2);
}

} // namespace
