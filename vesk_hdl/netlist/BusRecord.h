#pragma once

#include <cassert>

#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// Where the slices and indices of a bus find it. They share the cell with the bus, so that one
/// store gives all of them another parent when a wider bus takes over. See docs/architecture.md,
/// "Widening".
struct ParentCell {
    explicit ParentCell(Bus *parent) : bus(parent) {}

    static ParentCell *Join(ParentCell *cell) {
        ++cell->owners;
        return cell;
    }
    static void Leave(ParentCell *cell) {
        assert((!cell || cell->owners > 0) && "a part left a cell that was freed");
        if (cell && --cell->owners == 0)
            delete cell;
    }

    Bus *bus;             ///< null after the end of the bus, and for a part without a bus
    Polarity ownPolarity; ///< that of an index without a bus, whose cell is its own
    unsigned int owners = 1;
};

/// Most buses have no parts and make no cell.
struct Bus::Record {
    PtrArray<Signal *> busSlices; ///< slices and indices, not owned
    Polarity portPolarity;
    ParentCell *cell = nullptr; ///< null while the bus has no parts
};

} // namespace Vesk_Hdl
