// Helpers of both writers.

#include "vesk_hdl/hdl/HdlUtilities.h"

#include "vesk_hdl/hdl/NetlistHeader.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/text/OutStream.h"
#include "vesk_hdl/text/basis/Timestamp.h"
#include "vesk_hdl/text/basis/Version.h"

namespace Vesk_Hdl {

using Text = Basis::StringBase<char>;

namespace {

/// MM/DD/YYYY hh:mm:ss.
Text Join(TP_TIMESTAMP const &stamp) {
    Text text = stamp.getTimeStampMonthNumber();
    text += '/';
    text += stamp.getTimeStampMonthDay();
    text += '/';
    text += stamp.getTimeStampYear();
    text += ' ';
    text += stamp.getTimeStampHour();
    text += ':';
    text += stamp.getTimeStampMinute();
    text += ':';
    text += stamp.getTimeStampSecond();
    return text;
}

} // namespace

Text HdlUtilities::CurrentTimeString() { return Join(TP_TIMESTAMP()); }
Text HdlUtilities::TimeString(std::time_t moment) { return Join(TP_TIMESTAMP(moment)); }

Text HdlUtilities::ConvertVhdlBase(int base) { return base == 2 ? "b" : base == 8 ? "o" : "x"; }
Text HdlUtilities::ConvertVerilogBase(int base) { return base == 2 ? "b" : base == 8 ? "o" : "h"; }

Text HdlUtilities::GetVersion() { return Basis::Version::getValue("version"); }

Text HdlUtilities::AddDummySuffix(char const *name) {
    Text const whole(name);
    unsigned int const open = whole.GetIndexOfFirstChar('(', 0);
    unsigned int const close = whole.GetIndexOfFirstChar(')', 0);
    if (open == Basis::NOT_FOUND || close == Basis::NOT_FOUND) {
        Text suffixed = whole;
        return suffixed += "_DUMMY";
    }
    Text suffixed(whole.View().substr(0, open));
    suffixed += "_DUMMY";
    return suffixed += whole.Extract({open, close});
}

Text HdlUtilities::RemoveQuotes(char const *text) {
    Text bare(text);
    unsigned int const length = bare.GetLength();
    // Required: the length is that of the given text for both kinds. Once double quotes are gone it
    // is past the end, so that single quotes inside double ones stay.
    auto const enclosedIn = [&bare, length](char quote) {
        return length > 0 && length <= bare.GetLength() && bare.GetText()[0] == quote &&
               bare.GetText()[length - 1] == quote;
    };
    if (enclosedIn('"'))
        bare.Trim("\"", Text::TRIM_BOTH_ENDS);
    if (enclosedIn('\''))
        bare.Trim("'", Text::TRIM_BOTH_ENDS);
    return bare;
}

/// Required: the attributes of the component are not among them.
StringArray HdlUtilities::GetAttrNames(Instance const *instance) {
    StringArray names;
    if (instance && instance->HasAttrs())
        ForEach(instance->GetAttrIterator(),
                [&names](Attribute const *attribute) { names.Add(attribute->GetNameRef()); });
    return names;
}

void HdlUtilities::WriteHeader(Text const &designName, bool isVhdl, HdlOptions const &options,
                               OutStream &stream) {
    auto const *const file = dynamic_cast<TextFileOutStream const *>(&stream);
    NetlistHeader header(options.application, file ? file->GetFileName() : Text(),
                         options.commandStr, designName, options.device, options.purpose,
                         options.reference, isVhdl, stream);
    header.Write(options.headerTime ? TimeString(*options.headerTime) : CurrentTimeString());
}

} // namespace Vesk_Hdl
