#pragma once

#include <string>
#include <string_view>

// A pin in a line is HOLDER.PIN: a first part that a point ends, and at least one more character.
// It is split at the first point behind the first other character. A bus form holds no point and so
// names a signal.

namespace Vesk_Hdl {

/// Where the first part ends, or npos if the token names no pin.
inline std::size_t FindPinPoint(std::string_view token) {
    std::size_t const begin = token.find_first_not_of('.');
    std::size_t const point = begin == token.npos ? begin : token.find('.', begin);
    return point == token.npos || point + 1 == token.size() ? token.npos : point;
}

inline bool IsPinReference(std::string_view token) { return FindPinPoint(token) != token.npos; }

/// If the token names no pin, nothing changes. Short names, as most are, take no memory of their
/// own.
inline bool SplitPinReference(std::string_view token, std::string &left, std::string &right) {
    std::size_t const point = FindPinPoint(token);
    if (point == token.npos)
        return false;
    left = token.substr(0, point);
    right = token.substr(point + 1);
    return true;
}

} // namespace Vesk_Hdl
