#pragma once

#include "vesk_hdl/netlist/Values.h"

namespace Vesk_Hdl {

/// What a scalar takes of a constant: the digit at the end of the declared length. Whatever is not
/// 0 counts as 1, also a place behind the digits or before them.
inline char const *ScalarDigit(BitVectorValue const &value) {
    Basis::StringBase<char> const digits = value.GetValue();
    auto const place = static_cast<unsigned int>(value.GetLength()) - 1;
    return place < digits.GetLength() && digits.GetText()[place] == '0' ? "0" : "1";
}

} // namespace Vesk_Hdl
