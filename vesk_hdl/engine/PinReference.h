#pragma once

#include <string>
#include <string_view>

namespace Vesk_Hdl {

/// Whether a token names a pin, HOLDER.PIN: a first part that a point ends, and at least one more
/// character. It is split at the first point behind the first other character. A bus form holds no
/// point and so names a signal.
bool IsPinReference(std::string_view text);
/// Splits it; if it is none, nothing changes. Short names, as most are, need no memory of their
/// own.
bool SplitPinReference(std::string_view text, std::string &left, std::string &right);

} // namespace Vesk_Hdl
