#pragma once

#include <ctime>
#include <optional>

#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

/// How a netlist is written. Each model owns one; the option commands set it, and the writers read
/// it.
///
/// A value type with public fields, whose copies are independent. Each field is described with the
/// command that sets it and its default. A setting stays for all later writes of the model, apart
/// from `writeHeader` and `macroNetlist`.
class VESK_HDL_API HdlOptions {
public:
    /// The options for VHDL.
    struct VESK_HDL_API VhdlOption {
        /// All fields at their defaults.
        VhdlOption();
        /// An independent copy. Its argument is not const: that is part of the interface.
        VhdlOption(VhdlOption &other);
        /// Frees the lists.
        ~VhdlOption();
        /// Copies all fields.
        VhdlOption &operator=(VhdlOption &other);

        /// Whether the configuration unit is left out. "SUPPRESS CONFIGURATION"; false.
        bool suppressConfiguration;
        /// Kept for clients; no writer reads it. "FLATTEN BUS"; false.
        bool flattenBus;
        /// Whether the default library clauses are written. "USE DEFAULT LIBRARY"; true.
        bool useDefaultLibrary;
        /// The names of library clauses, in order. "ADD LIBRARY" appends; empty.
        StringArray libraries;
        /// The names of use clauses, in order. "ADD USE LIBRARY" appends; empty.
        StringArray useLibraries;
        /// Whether attributes are declared with their own types, not as strings. "Use AttrType";
        /// false.
        bool useAttrType;
        /// Whether open input pins stay open; with false each gets a signal. "Set Open Pin"; true.
        bool openPin;
        /// Whether component declarations are left out. "SUPPRESS COMPONENT"; false.
        bool suppressComponent;
    };

    /// The options for Verilog.
    struct VESK_HDL_API VerilogOption {
        /// The synthesis tool in whose syntax attributes are written.
        enum SynthesisType {
            SYNTHESIS_QRT = 0,         ///< "QRT"
            SYNTHESIS_EXEMPLAR = 1,    ///< "EXEMPLAR"
            SYNTHESIS_SYNPLICITY = 2,  ///< "SYNPLICITY"
            SYNTHESIS_SYNOPSYS = 3,    ///< "SYNOPSYS"
            SYNTHESIS_VERILOG2001 = 4, ///< "VERILOG2001": attributes are not written
            SYNTHESIS_PRECISION = 5    ///< "PRECISION"
        };
        /// The case that names are written in.
        enum CaseType {
            CASE_DEFAULT = 10, ///< as they are
            CASE_UPPER = 11,   ///< upper case
            CASE_LOWER = 12    ///< lower case
        };

        /// All fields at their defaults.
        VerilogOption();
        /// An independent copy. Its argument is not const: that is part of the interface.
        VerilogOption(VerilogOption &other);
        /// Frees the list.
        ~VerilogOption();
        /// Copies all fields.
        VerilogOption &operator=(VerilogOption &other);

        /// Sets the tool by its word, in any case. Any other word, also null, selects "QRT".
        void SetSynthesisType(char const *word);
        /// The case that a word means: "DEFSULT" (the spelling is part of the interface),
        /// "UPPERCASE" or "LOWERCASE", in any case. Any other word, also null, gives CASE_DEFAULT.
        CaseType GetCaseType(char const *word) const;
        /// Whether the ";" of a statement comes before its attributes. True except for
        /// "SYNPLICITY", whose attributes are inside the statement.
        bool IsSemiColonWrittenBeforeAttr() const;

        /// The tool. "SET SYNTHESIS"; SYNTHESIS_QRT.
        SynthesisType synthesisType;
        /// The case of signals. "UPPERCASE", "LOWERCASE"; CASE_DEFAULT. A write renames the signals
        /// of the netlist for good, and so for the other two kinds.
        CaseType signalCase;
        /// The case of instances.
        CaseType instanceCase;
        /// The case of components.
        CaseType componentCase;
        /// The paths of include lines at the head of the file, in order. "ADD INCLUDE" appends;
        /// empty.
        StringArray includes;
    };

    /// All fields at their defaults.
    HdlOptions();
    /// An independent copy of all fields but macroNetlist. Its argument is not const: that is part
    /// of the interface.
    HdlOptions(HdlOptions &other);
    /// Frees the texts and lists.
    ~HdlOptions();
    /// Copies all fields but macroNetlist.
    HdlOptions &operator=(HdlOptions &other);

    /// The options for VHDL.
    VhdlOption vhdlOption;
    /// The options for Verilog.
    VerilogOption verilogOption;
    /// Whether a file begins with a header. Each write command sets it; true unless it has
    /// "-NOHEADER".
    bool writeHeader;
    Basis::StringBase<char> application; ///< a field of the header; "Set Application"; empty
    Basis::StringBase<char> commandStr;  ///< a field of the header; "Set Command"; empty
    Basis::StringBase<char> device;      ///< a field of the header; "Set Device"; empty
    Basis::StringBase<char> purpose;     ///< a field of the header; "Set Purpose"; empty
    Basis::StringBase<char> reference;   ///< a field of the header; "Set Reference"; empty
    /// Whether ports and port maps have one item on each line. "SET PORT ONEPERLINE"; true, and no
    /// command clears it.
    bool portOnePerLine;
    /// Whether the netlist is a macro that takes INIT as a generic of its own. Each write computes
    /// it, also through a const reference, and copies do not take it over; false.
    mutable bool macroNetlist;
    /// The moment that the header shows, in UTC, so that the text is the same each time. Without
    /// one the header shows the local time of the write. No command sets it.
    std::optional<std::time_t> headerTime;
};

} // namespace Vesk_Hdl
