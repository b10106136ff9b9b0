#include "tool/diagnostics/LineTokens.h"

/// The library's own parser reports the places, so that a caret is never beside the token that was
/// refused.
void LineTokens::Read(std::string const &line) { tokens.ParseLine(line.c_str(), &places); }

std::string_view LineTokens::At(int index) const { return tokens.At(index).View(); }

unsigned LineTokens::GetColumn(int index) const {
    if (index < 0 || index >= GetSize())
        return 0;
    return places[static_cast<std::size_t>(index)].first + 1;
}

unsigned LineTokens::GetLength(int index) const {
    if (index < 0 || index >= GetSize())
        return 0;
    Basis_Range const &place = places[static_cast<std::size_t>(index)];
    return place.last + 1 - place.first;
}
