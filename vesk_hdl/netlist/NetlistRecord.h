#pragma once

#include "vesk_hdl/netlist/NameTable.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/netlist/storage/ObjectArray.h"

namespace Vesk_Hdl {

/// Members are destroyed in reverse order: the maps first, then the signals, the instances whose
/// pins point at them, and last the components that the instances point at.
struct Netlist::Record {
    ObjectArray<Component> components;
    ObjectArray<Instance> instances;
    OwnPtrArray<Signal *> widenedSlices; ///< slices in the place of buses that a wider one replaced
    ObjectArray<Signal> signals;
    NameTable<Component> componentMap;
    NameTable<Instance> instanceMap;
    NameTable<Signal> signalMap; ///< by full name
    NameTable<Signal> busMap;    ///< each Bus by its base name
    Basis::StringBase<char> sourceFileName;
};

} // namespace Vesk_Hdl
