#pragma once

#include <ctime>

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class HdlOptions;
class OutStream;

/// Static helpers of both writers. Null counts as empty.
class VESK_HDL_API HdlUtilities {
public:
    /// Local date and time, MM/DD/YYYY hh:mm:ss.
    static Basis::StringBase<char> CurrentTimeString();
    /// The date and time of a moment in UTC, in the same form.
    static Basis::StringBase<char> TimeString(std::time_t moment);
    /// The letter of a bit string literal: "b" for 2, "o" for 8, otherwise "x" in VHDL and "h" in
    /// Verilog.
    static Basis::StringBase<char> ConvertVhdlBase(int base);
    static Basis::StringBase<char> ConvertVerilogBase(int base);
    /// The library's version.
    static Basis::StringBase<char> GetVersion();
    /// The name with "_DUMMY" in front of its brackets, or behind it; what follows ")" is dropped.
    static Basis::StringBase<char> AddDummySuffix(char const *name);
    /// The text without one kind of enclosing quotes: all double ones at both ends if it begins and
    /// ends with one, otherwise all single ones likewise.
    static Basis::StringBase<char> RemoveQuotes(char const *text);
    /// The names of the instance's own attributes, in order; those of its component are not
    /// reported. Null gives an empty array.
    static StringArray GetAttrNames(Instance const *instance);
    /// Writes the file header with the fields of the options, in the comment syntax of the
    /// language. The file name is that of a TextFileOutStream, otherwise empty. The time is that
    /// of the options, otherwise the present one.
    static void WriteHeader(Basis::StringBase<char> const &designName, bool isVhdl,
                            HdlOptions const &options, OutStream &stream);
};

} // namespace Vesk_Hdl
