#pragma once

/// Marks around text for simulation only. Simulators read them as comments; synthesis tools of
/// several vendors skip what is between them.
namespace Vesk_Hdl::Translate {

inline constexpr char VHDL_OFF[] = "-- synopsys translate_off";
inline constexpr char VHDL_ON[] = "-- synopsys translate_on";
inline constexpr char VERILOG_OFF[] = "// synopsys translate_off";
inline constexpr char VERILOG_ON[] = "// synopsys translate_on";

} // namespace Vesk_Hdl::Translate
