#pragma once

#include <string>
#include <string_view>

namespace Vesk_Hdl {

/// The index of the point that ends the holder in a token HOLDER.PIN, npos if there is none.
///
/// A pin on a command line is one token, and the holder is a component or an instance. The holder
/// ends at the first point after its first other character: points before that character belong to
/// the holder, further points belong to the pin. Nothing may follow the point, as in a line that is
/// still being typed.
constexpr std::size_t FindPinPoint(std::string_view token) {
    std::size_t const begin = token.find_first_not_of('.');
    return begin == token.npos ? begin : token.find('.', begin);
}

/// Splits a token that names a pin. A token without such a point, or with nothing after it, names
/// no pin: the result is false, and both texts are as they were. Whether the holder and the pin
/// exist is not checked.
inline bool SplitPinReference(std::string_view token, std::string &holder, std::string &pin) {
    std::size_t const point = FindPinPoint(token);
    if (point == token.npos || point + 1 == token.size())
        return false;
    holder = token.substr(0, point);
    pin = token.substr(point + 1);
    return true;
}

} // namespace Vesk_Hdl
