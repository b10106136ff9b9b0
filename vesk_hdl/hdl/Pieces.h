#pragma once

#include "vesk_hdl/text/OutStream.h"

namespace Vesk_Hdl {

/// The end-of-line operand, as a piece.
inline constexpr OutStream::Operand EOL = OutStream::NEW_LINE;

/// Writes pieces, left to right as in the file. Where the pieces end is part of the text: a file
/// stream decides at each of them whether the line folds, so that two must not become one.
template <class... Piece> void Put(OutStream &stream, Piece const &...pieces) {
    (stream << ... << pieces);
}

} // namespace Vesk_Hdl
