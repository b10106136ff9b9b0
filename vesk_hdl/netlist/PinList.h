#pragma once

#include <string_view>

#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/storage/PinFamily.h"
#include "vesk_hdl/text/basis/Ascii.h"

// What components and instances do with their pins alike.

namespace Vesk_Hdl {

/// The first pin of that name, which is rewritten already. The place is where a family's index has
/// it, or PinFamily::ABSENT or UNKNOWN.
inline Pin *FindPin(PtrArray<Pin *> const &pins, std::string_view name, int place) {
    if (place != PinFamily::UNKNOWN)
        return pins.GetAt(place);
    for (int i = 0; i < pins.GetSize(); ++i) {
        Pin *const pin = pins.GetAt(i);
        if (pin && Basis::Ascii::EqualIgnoringCase(pin->GetNameRef().View(), name))
            return pin;
    }
    return nullptr;
}

} // namespace Vesk_Hdl
