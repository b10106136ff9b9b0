#pragma once

#include "vesk_hdl/engine/CommandOf.h"

// The commands that write a file: they open it, say whether it gets a header, and hand netlist and
// options to a writer.

namespace Vesk_Hdl::Commands {

/// [option [option]] file
struct WriteArguments {
    Basis::StringBase<char> fileName;
    bool append = false;
    bool writeHeader = true;

    /// Required: the number of tokens alone tells where the file name is. With more than two
    /// options there are none, and the file is called after the first of them.
    bool Parse(StringArray const &tokens, int first);
};

struct WriteVerilog : WriteArguments {
    void Run(Model &model) const;
};
using WriteVerilogCommand = CommandOf<"WRITE VERILOG", WriteVerilog>;

struct WriteVhdl : WriteArguments {
    void Run(Model &model) const;
};
using WriteVhdlCommand = CommandOf<"WRITE VHDL", WriteVhdl>;

} // namespace Vesk_Hdl::Commands
