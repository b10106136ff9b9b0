#pragma once

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Netlist.h"

namespace Vesk_Hdl {

/// What the library does with a netlist and clients do not.
class NetlistEdit {
public:
    explicit NetlistEdit(Netlist &edited) : netlist(edited) {}

    // Lookups with a key that was made once. A bus is found by its base name.

    bool IsNameUsed(Names::Key const &key) const;
    Signal *FindSignal(Names::Key const &key) const;
    Instance *FindInstance(Names::Key const &key) const;
    Component *FindComponent(Names::Key const &key) const;
    Bus *FindBus(Names::Key const &key) const;

    /// Replaces a bus by a wider one that is called `name`, which is returned. The old slices
    /// become slices of the new bus. A further slice of it gets the old bus's name and connections,
    /// and its place in memory: whatever points at the old bus (assignments, compounds, pins tied
    /// to it, a caller's variable) points at that slice. The netlist owns the slice, but nobody
    /// finds it by name or by a walk. Polarity, comment, attributes and constant of the old bus are
    /// lost.
    Bus *Widen(Bus *bus, char const *name);

    /// From now on each change of the netlist's name adds 1 to a counter, which outlives it.
    void CountRenames(unsigned long &counter) { netlist.CountRenames(counter); }

private:
    static void TakeLists(Bus &bus, BusSlice &made);
    BusSlice *PutSliceInPlaceOf(Bus *bus, BusSlice &made);
    BusSlice *RepointToSlice(Bus *bus, std::unique_ptr<BusSlice> made);

    Netlist &netlist;
};

} // namespace Vesk_Hdl
