#pragma once

#include "vesk_hdl/engine/CommandOf.h"

// The commands that write a file: they open it, set the option for the header, and pass netlist and
// options to a writer.

namespace Vesk_Hdl::Commands {

/// [option [option]] file
struct WriteArguments {
    Basis::StringBase<char> fileName;
    bool append = false;
    bool writeHeader = true;

    /// Required: the number of tokens alone decides which one is the file name, the second of two
    /// and the third of three. With four or more tokens none is an option, and the first one is the
    /// file name.
    bool Parse(StringArray const &tokens, int first);
};

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
