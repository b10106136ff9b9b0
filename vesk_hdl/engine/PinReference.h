#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// Whether a token names a pin, HOLDER.PIN: a first part that a point ends, and at least one more
/// character. A bus form holds no point and so names a signal.
bool IsPinReference(Basis::StringBase<char> const &text);

/// The two parts of a pin's name, split at the first point behind the first other character. On
/// false they stay as they were.
bool SplitPinReference(Basis::StringBase<char> const &text, Basis::StringBase<char> &left,
                       Basis::StringBase<char> &right);

} // namespace Vesk_Hdl
