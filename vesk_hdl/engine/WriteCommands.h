#pragma once

#include "vesk_hdl/engine/CommandOf.h"
#include "vesk_hdl/engine/WriteArguments.h"

// The commands that write a file: they open it, set the option for the header, and pass netlist and
// options to a writer.

namespace Vesk_Hdl::Commands {

/// Writes Verilog.
struct WriteVerilog : WriteArguments {
    void Run(Model &model) const;
};
using WriteVerilogCommand = CommandOf<"WRITE VERILOG", WriteVerilog>;

/// Writes VHDL.
struct WriteVhdl : WriteArguments {
    void Run(Model &model) const;
};
using WriteVhdlCommand = CommandOf<"WRITE VHDL", WriteVhdl>;

} // namespace Vesk_Hdl::Commands
