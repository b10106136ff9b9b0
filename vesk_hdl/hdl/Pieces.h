#pragma once

#include "vesk_hdl/text/OutStream.h"

namespace Vesk_Hdl {

/// The end of a line, as a piece.
inline constexpr OutStream::Operand EOL = OutStream::NEW_LINE;

/// Writes pieces, from left to right as in the file. Where pieces begin and end is part of the
/// required text: a file stream decides before each of them whether the line folds, so that two
/// must not become one. See docs/architecture.md, "The road of a write".
template <class... Piece> void Put(OutStream &stream, Piece const &...pieces) {
    (stream << ... << pieces);
}

} // namespace Vesk_Hdl
