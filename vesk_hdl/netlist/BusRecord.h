#pragma once

#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// Where the slices and indexes of a bus look for it. They share it with the bus, so that all of
/// them get another bus at one stroke when a wider one takes over.
struct ParentCell {
    explicit ParentCell(Bus *parent) : bus(parent) {}

    static ParentCell *Join(ParentCell *cell) {
        ++cell->owners;
        return cell;
    }
    static void Leave(ParentCell *cell) {
        if (cell && --cell->owners == 0)
            delete cell;
    }

    Bus *bus;             ///< null when it is gone, and in the cell of a part without a bus
    Polarity ownPolarity; ///< of an index without a bus, which shares its cell with nobody
    unsigned int owners = 1;
};

struct Bus::Record {
    PtrArray<Signal *> busSlices;
    Polarity portPolarity;
    ParentCell *cell = nullptr; ///< null while the bus has no parts
};

} // namespace Vesk_Hdl
