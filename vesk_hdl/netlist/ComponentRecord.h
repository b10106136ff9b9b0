#pragma once

#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/storage/PinFamily.h"

namespace Vesk_Hdl {

/// What a component has besides its name. Instances read it when they are made.
struct Component::Record {
    explicit Record(Component *owner) : family(new PinFamily(owner)) {}

    OwnPtrArray<Pin *> pins;
    PinFamilyPtr family; ///< shared with the pins and with instances that may live longer
};

} // namespace Vesk_Hdl
