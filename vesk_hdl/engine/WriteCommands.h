#pragma once

#include "vesk_hdl/engine/CommandOf.h"
#include "vesk_hdl/engine/WriteArguments.h"

// The commands that write a file: they open it, say whether it gets a header, and hand netlist and
// options to a writer.

namespace Vesk_Hdl::Commands {

struct WriteVerilog : WriteArguments {
    void Run(Model &model) const;
};
using WriteVerilogCommand = CommandOf<"WRITE VERILOG", WriteVerilog>;

struct WriteVhdl : WriteArguments {
    void Run(Model &model) const;
};
using WriteVhdlCommand = CommandOf<"WRITE VHDL", WriteVhdl>;

} // namespace Vesk_Hdl::Commands
