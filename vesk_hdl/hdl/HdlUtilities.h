#pragma once

#include <ctime>

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class HdlOptions;
class OutStream;

/// Static helpers that both writers use. A null text counts as empty.
class VESK_HDL_API HdlUtilities {
public:
    /// The present local date and time, MM/DD/YYYY hh:mm:ss.
    static Basis::StringBase<char> CurrentTimeString();
    /// The date and time of a moment in UTC, in the same form.
    static Basis::StringBase<char> TimeString(std::time_t moment);
    /// The base letter of a VHDL bit string literal (IEEE 1076-1993, 13.7): "b" for 2, "o" for 8,
    /// "x" for any other number.
    static Basis::StringBase<char> ConvertVhdlBase(int base);
    /// The base letter of a Verilog number (IEEE 1364-1995, 2.5.1): "b" for 2, "o" for 8, "h" for
    /// any other number.
    static Basis::StringBase<char> ConvertVerilogBase(int base);
    /// The version of the library, as Basis::Version gives it.
    static Basis::StringBase<char> GetVersion();
    /// The name of a dummy: "A(3:0)" gives "A_DUMMY(3:0)", "A" gives "A_DUMMY". What follows the
    /// first ")" is left out. Unlike Signal::GetDummySignalName it does not look for a mark that is
    /// there already.
    static Basis::StringBase<char> AddDummySuffix(char const *name);
    /// The text without its enclosing quotes. If it begins and ends with a double quote, all double
    /// quotes at both ends are left out; otherwise the same with single quotes. Quotes of one kind
    /// inside the other stay.
    static Basis::StringBase<char> RemoveQuotes(char const *text);
    /// The names of the instance's own attributes, in order. Those of its component are left out,
    /// also where the instance inherits them. Null gives an empty array.
    static StringArray GetAttrNames(Instance const *instance);
    /// Writes the file header, see NetlistHeader, with the fields of the options. The file name is
    /// that of the stream if it is a TextFileOutStream, otherwise empty. The time is `headerTime`
    /// of the options, otherwise the present local time. `isVhdl` chooses the comment mark.
    static void WriteHeader(Basis::StringBase<char> const &designName, bool isVhdl,
                            HdlOptions const &options, OutStream &stream);
};

} // namespace Vesk_Hdl
