#pragma once

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Netlist.h"

namespace Vesk_Hdl {

/// Operations on a netlist that are for the library alone: lookups with a key that is made once,
/// and the replacement of a bus. It keeps them out of the public class.
class NetlistEdit {
public:
    explicit NetlistEdit(Netlist &edited) : netlist(edited) {}

    // Lookups. Null when absent. A bus is found by its base name, the others by their full one.

    /// Whether a component, an instance or a signal has that name: the three share one space of
    /// names.
    bool IsNameUsed(Names::Key const &key) const;
    Signal *FindSignal(Names::Key const &key) const;
    Instance *FindInstance(Names::Key const &key) const;
    Component *FindComponent(Names::Key const &key) const;
    Bus *FindBus(Names::Key const &key) const;

    /// Replaces a bus by a wider one that is called `name`, and returns that one. The slices of the
    /// old bus become slices of the new one. A further slice gets the name and the connections of
    /// the old bus, and its address: all that pointed at the old bus (assignments, compounds, pins
    /// tied to it, a variable of the caller) then points at that slice. The netlist owns the slice,
    /// but neither a lookup nor a walk finds it: required. Polarity, comment, attributes and
    /// constant of the old bus are lost. If memory runs out (std::bad_alloc), the netlist is as it
    /// was. See docs/architecture.md, "Widening".
    Bus *Widen(Bus *bus, char const *name);

    /// From now on each change of the netlist's name adds 1 to a counter, which must outlive the
    /// netlist. An engine thereby notices that its index of model names is out of date.
    void CountRenames(unsigned long &counter) { netlist.CountRenames(counter); }

private:
    static void TakeLists(Bus &bus, BusSlice &made);
    BusSlice *PutSliceInPlaceOf(Bus *bus, BusSlice &made);
    BusSlice *RepointToSlice(Bus *bus, std::unique_ptr<BusSlice> made);

    Netlist &netlist;
};

} // namespace Vesk_Hdl
