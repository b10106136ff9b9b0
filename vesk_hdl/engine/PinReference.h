#pragma once

#include <string>
#include <string_view>

namespace Vesk_Hdl {

/// A pin's name in a line, HOLDER.PIN: a first part that a point ends, and at least one more
/// character. It is split at the first point behind the first other character. A bus form holds no
/// point and so names a signal.
class PinReference {
public:
    /// Whether the token names a pin. If not, nothing changes.
    bool Parse(std::string_view token);

    char const *GetHolder() const { return holder.c_str(); }
    char const *GetPin() const { return pin.c_str(); }

private:
    std::string holder; ///< short names need no memory besides the command's own
    std::string pin;
};

} // namespace Vesk_Hdl
