#pragma once

#include "vesk_hdl/netlist/NameTable.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/netlist/Referrers.h"

namespace Vesk_Hdl {

/// Members die in reverse order: the maps first, then the signals, the instances whose pins point
/// at them, and last the components that the instances point at.
struct Netlist::Record {
    OwnPtrArray<Component *> components;
    OwnPtrArray<Instance *> instances;
    OwnPtrArray<Signal *> widenedSlices; ///< what stands for buses that a wider one replaced
    OwnPtrArray<Signal *> signals;
    NameTable<Component> componentMap;
    NameTable<Instance> instanceMap;
    NameTable<Signal> signalMap; ///< by full name
    NameTable<Signal> busMap;    ///< each Bus by its base name
    Basis::StringBase<char> sourceFileName;
    Referrers referrers; ///< links and compounds that list a bus
};

} // namespace Vesk_Hdl
