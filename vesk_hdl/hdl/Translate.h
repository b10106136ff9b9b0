#pragma once

/// Marks that keep a synthesis tool away from text for simulation only.
namespace Vesk_Hdl::Translate {

inline constexpr char VHDL_OFF[] = "-- synopsys translate_off";
inline constexpr char VHDL_ON[] = "-- synopsys translate_on";
inline constexpr char VERILOG_OFF[] = "// synopsys translate_off";
inline constexpr char VERILOG_ON[] = "// synopsys translate_on";

} // namespace Vesk_Hdl::Translate
