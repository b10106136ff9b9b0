#pragma once

#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

/// The tokens from an index to the last, with single blanks between them. What the tokenizer took
/// away, quotes and runs of blanks, does not come back.
Basis::StringBase<char> JoinTokens(StringArray const &tokens, int first);

} // namespace Vesk_Hdl
