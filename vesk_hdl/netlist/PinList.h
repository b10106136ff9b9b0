#pragma once

#include <cassert>
#include <string_view>

#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/storage/PinFamily.h"
#include "vesk_hdl/text/basis/Ascii.h"

// What components and instances share in dealing with their pins.

namespace Vesk_Hdl {

/// The first pin of a name, which is rewritten already. `place` is the index of that pin as the
/// family knows it, or PinFamily::ABSENT; with PinFamily::UNKNOWN the pins are searched.
inline Pin *FindPin(PtrArray<Pin *> const &pins, std::string_view name, int place) {
    assert((place < 0 || !pins.GetAt(place) ||
            Basis::Ascii::EqualIgnoringCase(pins.GetAt(place)->GetNameRef().View(), name)) &&
           "the index of the family leads to another pin");
    if (place != PinFamily::UNKNOWN)
        return pins.GetAt(place); // null for ABSENT, which is no index of an array
    for (int i = 0; i < pins.GetSize(); ++i) {
        Pin *const pin = pins.GetAt(i);
        if (pin && Basis::Ascii::EqualIgnoringCase(pin->GetNameRef().View(), name))
            return pin;
    }
    return nullptr;
}

} // namespace Vesk_Hdl
