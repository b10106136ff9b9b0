#pragma once

#include <ctime>
#include <optional>

#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

/// How a netlist is written. Each model owns one; the option commands fill it, the writers read it.
/// Nothing resets it between writes but what the fields say. Copies are independent.
class VESK_HDL_API HdlOptions {
public:
    /// What concerns VHDL.
    struct VESK_HDL_API VhdlOption {
        VhdlOption();
        VhdlOption(VhdlOption &other);
        ~VhdlOption();
        VhdlOption &operator=(VhdlOption &other);

        bool suppressConfiguration; ///< no configuration unit; "SUPPRESS CONFIGURATION"; false
        bool flattenBus;            ///< kept and read by no writer; "FLATTEN BUS"; false
        bool useDefaultLibrary;     ///< the default library clauses; "USE DEFAULT LIBRARY"; true
        StringArray libraries;      ///< of library clauses; "ADD LIBRARY" appends
        StringArray useLibraries;   ///< of use clauses; "ADD USE LIBRARY" appends
        bool useAttrType;       ///< attributes are declared with their type; "Use AttrType"; false
        bool openPin;           ///< open input pins stay open; "Set Open Pin"; true
        bool suppressComponent; ///< no component declarations; "SUPPRESS COMPONENT"; false
    };

    /// What concerns Verilog.
    struct VESK_HDL_API VerilogOption {
        /// The tool whose syntax attributes are written in.
        enum SynthesisType {
            SYNTHESIS_QRT = 0,
            SYNTHESIS_EXEMPLAR = 1,
            SYNTHESIS_SYNPLICITY = 2,
            SYNTHESIS_SYNOPSYS = 3,
            SYNTHESIS_VERILOG2001 = 4,
            SYNTHESIS_PRECISION = 5
        };
        enum CaseType { CASE_DEFAULT = 10, CASE_UPPER = 11, CASE_LOWER = 12 };

        VerilogOption();
        VerilogOption(VerilogOption &other);
        ~VerilogOption();
        VerilogOption &operator=(VerilogOption &other);

        /// Takes "QRT", "EXEMPLAR", "SYNPLICITY", "SYNOPSYS", "VERILOG2001" or "PRECISION" in any
        /// case; any other word, null too, selects "QRT".
        void SetSynthesisType(char const *word);
        /// "DEFSULT" (the spelling is part of the interface), "UPPERCASE" or "LOWERCASE" in any
        /// case; any other word gives the default.
        CaseType GetCaseType(char const *word) const;
        /// Whether a statement's ";" stands before its attributes: true for all but "SYNPLICITY",
        /// whose attributes stand inside the statement.
        bool IsSemiColonWrittenBeforeAttr() const;

        SynthesisType synthesisType; ///< "SET SYNTHESIS"; "QRT"
        CaseType signalCase;         ///< "UPPERCASE", "LOWERCASE"; names stay as they are
        CaseType instanceCase;       ///< likewise
        CaseType componentCase;      ///< likewise
        StringArray includes;        ///< paths at the file's head; "ADD INCLUDE" appends
    };

    HdlOptions();
    HdlOptions(HdlOptions &other);
    ~HdlOptions();
    /// Copies all fields but macroNetlist.
    HdlOptions &operator=(HdlOptions &other);

    VhdlOption vhdlOption;
    VerilogOption verilogOption;
    bool writeHeader;                    ///< the file header; each write command sets it; true
    Basis::StringBase<char> application; ///< header field; "Set Application"
    Basis::StringBase<char> commandStr;  ///< header field; "Set Command"
    Basis::StringBase<char> device;      ///< header field; "Set Device"
    Basis::StringBase<char> purpose;     ///< header field; "Set Purpose"
    Basis::StringBase<char> reference;   ///< header field; "Set Reference"
    bool portOnePerLine;                 ///< ports go one a line; no command clears it; true
    /// The netlist is a macro that takes INIT as a generic of its own. Each write computes it, also
    /// through a const reference, and nobody copies it.
    mutable bool macroNetlist;
    /// The moment that the header shows, in UTC; without one it shows the local time of the write.
    std::optional<std::time_t> headerTime;
};

} // namespace Vesk_Hdl
