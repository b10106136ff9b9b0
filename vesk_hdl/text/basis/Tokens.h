#pragma once

#include <algorithm>

#include "vesk_hdl/text/basis/StringBase.h"

namespace Basis {

/// The step of StringBase::NextTokenRange, for any text. Names are split with it as well as lines,
/// so that both agree about odd texts such as "A((3)".
inline bool NextToken(std::string_view text, Basis_Range &range, std::string_view separators,
                      bool skipEmpty) {
    // Where the last step ended is read off the range alone: (1, 0) before the first token, (i + 2,
    // i) after an empty one whose separator is at i.
    bool const starting = range.first == 1 && range.last == 0;
    bool const afterEmpty = !starting && range.first > range.last;
    std::size_t begin = starting ? 0 : static_cast<std::size_t>(range.last) + (afterEmpty ? 1 : 2);
    if (begin < text.size() && skipEmpty)
        begin = text.find_first_not_of(separators, begin);
    if (begin >= text.size())
        return false;
    // The standard library searches for one character, the common case, a block at a time.
    std::size_t end = separators.size() == 1 ? text.find(separators[0], begin)
                                             : text.find_first_of(separators, begin);
    end = std::min(end, text.size());
    if (begin == end)
        range = {static_cast<unsigned int>(end + 2), static_cast<unsigned int>(end)};
    else
        range = {static_cast<unsigned int>(begin), static_cast<unsigned int>(end - 1)};
    return true;
}

/// The characters of a range that NextToken gave; empty for an empty one.
inline std::string_view TokenIn(std::string_view text, Basis_Range const &range) {
    return range.first > range.last ? std::string_view()
                                    : text.substr(range.first, range.last + 1 - range.first);
}

} // namespace Basis
