#pragma once

#include "vesk_hdl/Api.h"
#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

class StringArray;

/// The arguments of WRITE VHDL and WRITE VERILOG: [option [option]] file.
struct VESK_HDL_API WriteArguments {
    Basis::StringBase<char> fileName; ///< as it was typed
    bool append = false;              ///< -APPEND: the text goes to the end of the file
    bool writeHeader = true;          ///< false after -NOHEADER
    int fileToken = 0;                ///< the index of the token that is the file name

    /// Reads the tokens of a line from the index of the first argument on. False if there is no
    /// file name. Call it once for each object: options of an earlier call stay set.
    ///
    /// Required: the number of tokens alone decides which one is the file name, the second of two
    /// and the third of three. With four or more tokens none is an option, and the first one is the
    /// file name.
    bool Parse(StringArray const &tokens, int first);
};

} // namespace Vesk_Hdl
