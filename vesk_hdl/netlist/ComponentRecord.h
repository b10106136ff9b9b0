#pragma once

#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/storage/PinFamily.h"

namespace Vesk_Hdl {

struct Component::Record {
    explicit Record(Component *owner) : family(new PinFamily(owner)) {}

    OwnPtrArray<Pin *> pins;
    PinFamilyPtr family; ///< shared with the pins and the instances
};

} // namespace Vesk_Hdl
