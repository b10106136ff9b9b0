// The options of the writers: defaults, copies, and the words that commands pass on.

#include "vesk_hdl/model/HdlOptions.h"

#include <algorithm>

#include "vesk_hdl/netlist/Vocabulary.h"

namespace Vesk_Hdl {

// Required: the copy operations take a reference that is not const.

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
    int const tool = Vocabulary::IndexOf(Vocabulary::SYNTHESIS_TOOLS, word);
    // Required: any other word is QRT.
    synthesisType = static_cast<SynthesisType>(std::max(tool, 0));
}

HdlOptions::VerilogOption::CaseType HdlOptions::VerilogOption::GetCaseType(char const *word) const {
    int const nameCase = Vocabulary::IndexOf(Vocabulary::NAME_CASES, word);
    return static_cast<CaseType>(CASE_DEFAULT + std::max(nameCase, 0));
}

bool HdlOptions::VerilogOption::IsSemiColonWrittenBeforeAttr() const {
    return synthesisType != SYNTHESIS_SYNPLICITY;
}

HdlOptions::HdlOptions() : writeHeader(true), portOnePerLine(true), macroNetlist(false) {}

/// Required: macroNetlist is not copied. It is a result of the last write and no setting.
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
