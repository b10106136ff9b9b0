#pragma once

#include <string>
#include <string_view>

namespace Vesk_Hdl {

/// A pin on a command line is one token, HOLDER.PIN. The holder ends at the first point behind its
/// first other character: points in front of it belong to it, further ones to the pin. This is the
/// index of that point, npos if there is none. The pin behind it may be empty, as in a line that is
/// still being typed.
constexpr std::size_t FindPinPoint(std::string_view token) {
    std::size_t const begin = token.find_first_not_of('.');
    return begin == token.npos ? begin : token.find('.', begin);
}

/// Splits a token that names a pin. If it names none, since there is no such point or nothing
/// behind it, the answer is false and both texts stay as they were.
inline bool SplitPinReference(std::string_view token, std::string &holder, std::string &pin) {
    std::size_t const point = FindPinPoint(token);
    if (point == token.npos || point + 1 == token.size())
        return false;
    holder = token.substr(0, point);
    pin = token.substr(point + 1);
    return true;
}

} // namespace Vesk_Hdl
