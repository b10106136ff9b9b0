#pragma once

#include "vesk_hdl/netlist/NameTable.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/netlist/storage/ObjectArray.h"

namespace Vesk_Hdl {

/// The contents of a netlist. The arrays own the objects and give the order of all output; the
/// tables only find them.
///
/// Members end in reverse order: the tables, then the signals, then the instances whose pins point
/// at signals, and last the components that instances point at. No destructor follows these
/// pointers.
struct Netlist::Record {
    ObjectArray<Component> components;
    ObjectArray<Instance> instances;
    OwnPtrArray<Signal *> widenedSlices; ///< slices at the addresses of buses that were widened
    ObjectArray<Signal> signals;
    NameTable<Component> componentMap;
    NameTable<Instance> instanceMap;
    NameTable<Signal> signalMap; ///< by full name
    NameTable<Signal> busMap;    ///< each Bus by its base name
    Basis::StringBase<char> sourceFileName;
};

} // namespace Vesk_Hdl
