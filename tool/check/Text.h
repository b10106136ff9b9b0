#pragma once

#include <algorithm>
#include <string>
#include <string_view>

#include "tool/diagnostics/Words.h"
#include "vesk_hdl/Vesk_Hdl.h"

// Names as the checks compare and show them.

namespace Checks {

using Text = Basis::StringBase<char>;

/// A net's name up to its brackets, if it has any; no copy.
inline std::string_view BaseOf(std::string_view name) {
    std::size_t const open = name.find('(');
    bool const plain = open == std::string_view::npos || name.find(')') == std::string_view::npos ||
                       name.find(',') != std::string_view::npos;
    return plain ? name : name.substr(0, open);
}
inline std::string_view BaseOf(Vesk_Hdl::Object const &object) {
    return BaseOf(object.GetNameRef().View());
}

/// A name as Verilog has it after UPPERCASE and LOWERCASE lines.
inline std::string Cased(std::string_view name,
                         Vesk_Hdl::HdlOptions::VerilogOption::CaseType nameCase) {
    Text text(name);
    if (nameCase == Vesk_Hdl::HdlOptions::VerilogOption::CASE_UPPER)
        text.MakeUpper();
    else if (nameCase == Vesk_Hdl::HdlOptions::VerilogOption::CASE_LOWER)
        text.MakeLower();
    return text.GetText();
}

/// How an object is spelled in Verilog, where names in two cases are two names.
inline std::string NameInVerilog(Vesk_Hdl::Object const &object,
                                 Vesk_Hdl::HdlOptions const &options) {
    using namespace Vesk_Hdl;
    HdlOptions::VerilogOption const &verilog = options.verilogOption;
    Object::ObjectType const type = object.GetObjectType();
    return Cased(BaseOf(object), type == Object::OBJECT_SIGNAL      ? verilog.signalCase
                                 : type == Object::OBJECT_INSTANCE  ? verilog.instanceCase
                                 : type == Object::OBJECT_COMPONENT ? verilog.componentCase
                                                                    : verilog.CASE_DEFAULT);
}

/// The bits of a bus, a slice or one bit, as its name says.
struct Range {
    long long left = 0;
    long long right = 0;

    long long Low() const { return std::min(left, right); }
    long long High() const { return std::max(left, right); }
    long long Width() const { return High() - Low() + 1; }
    bool IsDown() const { return left > right; }
    bool Holds(Range const &other) const { return Low() <= other.Low() && other.High() <= High(); }
};

/// Whether the name has bounds or an index; a scalar's is the one bit 0.
inline bool GetRange(Text const &name, Range &range) {
    Text base;
    int left = 0;
    int right = 0;
    if (Vesk_Hdl::Bus::ParseBusName(name, base, left, right)) {
        range = {left, right};
        return true;
    }
    if (Vesk_Hdl::BusIndex::ParseBusIndexName(name, base, left)) {
        range = {left, left};
        return true;
    }
    range = {};
    return false;
}

inline std::string Normal(std::string_view name) {
    Text text(name);
    Vesk_Hdl::Object::NormalizeName(text);
    return std::string(text.View());
}

inline std::string PinName(Vesk_Hdl::Object const &owner, Vesk_Hdl::Pin const &pin) {
    return "pin " +
           Quoted(Shortened(owner.GetNameRef().View()) + "." + Shortened(pin.GetNameRef().View()));
}

inline std::string NetName(Vesk_Hdl::Signal const &signal) {
    return (signal.IsPort() ? "port " : "net ") + Quoted(signal.GetNameRef().View());
}

} // namespace Checks
