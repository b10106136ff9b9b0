#include "vesk_hdl/model/HdlOptions.h"

#include "vesk_hdl/text/basis/Functions.h"

namespace Vesk_Hdl {

namespace {

/// The index of a word, ignoring case; 0 if it is none of them.
template <std::size_t Count> int IndexOfWord(char const *const (&words)[Count], char const *word) {
    for (std::size_t i = 0; i < Count; ++i)
        if (Basis::stricmp(words[i], word) == 0)
            return static_cast<int>(i);
    return 0;
}

} // namespace

HdlOptions::VhdlOption::VhdlOption()
    : suppressConfiguration(false), flattenBus(false), useDefaultLibrary(true), useAttrType(false),
      openPin(true), suppressComponent(false) {}
HdlOptions::VhdlOption::VhdlOption(VhdlOption &other) = default;
HdlOptions::VhdlOption::~VhdlOption() = default;
HdlOptions::VhdlOption &HdlOptions::VhdlOption::operator=(VhdlOption &other) = default;

HdlOptions::VerilogOption::VerilogOption()
    : synthesisType(SYNTHESIS_QRT), signalCase(CASE_DEFAULT), instanceCase(CASE_DEFAULT),
      componentCase(CASE_DEFAULT) {}
HdlOptions::VerilogOption::VerilogOption(VerilogOption &other) = default;
HdlOptions::VerilogOption::~VerilogOption() = default;
HdlOptions::VerilogOption &HdlOptions::VerilogOption::operator=(VerilogOption &other) = default;

void HdlOptions::VerilogOption::SetSynthesisType(char const *word) {
    static char const *const WORDS[] = {"QRT",      "EXEMPLAR",    "SYNPLICITY",
                                        "SYNOPSYS", "VERILOG2001", "PRECISION"};
    synthesisType = static_cast<SynthesisType>(IndexOfWord(WORDS, word));
}

HdlOptions::VerilogOption::CaseType HdlOptions::VerilogOption::GetCaseType(char const *word) const {
    static char const *const WORDS[] = {"DEFSULT", "UPPERCASE", "LOWERCASE"};
    return static_cast<CaseType>(CASE_DEFAULT + IndexOfWord(WORDS, word));
}

bool HdlOptions::VerilogOption::IsSemiColonWrittenBeforeAttr() const {
    return synthesisType != SYNTHESIS_SYNPLICITY;
}

HdlOptions::HdlOptions() : writeHeader(true), portOnePerLine(true), macroNetlist(false) {}

HdlOptions::HdlOptions(HdlOptions &other)
    : vhdlOption(other.vhdlOption), verilogOption(other.verilogOption),
      writeHeader(other.writeHeader), application(other.application), commandStr(other.commandStr),
      device(other.device), purpose(other.purpose), reference(other.reference),
      portOnePerLine(other.portOnePerLine), macroNetlist(false), headerTime(other.headerTime) {}

HdlOptions::~HdlOptions() = default;

HdlOptions &HdlOptions::operator=(HdlOptions &other) {
    vhdlOption = other.vhdlOption;
    verilogOption = other.verilogOption;
    writeHeader = other.writeHeader;
    application = other.application;
    commandStr = other.commandStr;
    device = other.device;
    purpose = other.purpose;
    reference = other.reference;
    portOnePerLine = other.portOnePerLine;
    headerTime = other.headerTime;
    return *this;
}

} // namespace Vesk_Hdl
