#pragma once

#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

/// The reserved words of VHDL (IEEE 1076-1993, 13.9), made at the first call. VHDL ignores case:
/// ask IContains.
StringSet const &VhdlKeywords();

/// The keywords of Verilog (IEEE 1364-1995, annex B) without "force". Required: a signal of that
/// name is no keyword. Case counts in Verilog: ask Contains.
StringSet const &VerilogKeywords();

} // namespace Vesk_Hdl
