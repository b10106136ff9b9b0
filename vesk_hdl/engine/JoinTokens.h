#pragma once

#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

/// The tokens from an index to the last one, with single blanks between them. Quotes and runs of
/// blanks, which the tokenizer removed, do not come back: required.
inline Basis::StringBase<char> JoinTokens(StringArray const &tokens, int first) {
    Basis::StringBase<char> joined;
    for (int i = first; i < tokens.GetSize(); ++i) {
        if (i > first)
            joined += ' ';
        joined += tokens.At(i);
    }
    return joined;
}

} // namespace Vesk_Hdl
