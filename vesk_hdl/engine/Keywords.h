#pragma once

#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

/// The reserved words of IEEE 1076-1993, filled at the first call. VHDL ignores case: IContains.
StringSet const &VhdlKeywords();

/// The keywords of IEEE 1364-1995 but for "force", which stays out, so that a signal of that name
/// passes as no keyword. Verilog minds case: Contains.
StringSet const &VerilogKeywords();

} // namespace Vesk_Hdl
