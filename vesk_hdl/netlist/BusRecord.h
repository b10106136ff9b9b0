#pragma once

#include <cassert>

#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// What a bus shares with its slices and indices, which find it here: one store gives all of them
/// another bus when a wider one takes over. See docs/architecture.md, "Widening".
struct Bus::Record {
    explicit Record(Bus *parent) : bus(parent) {}

    static Record *Join(Record *record) {
        ++record->owners;
        return record;
    }
    static void Leave(Record *record) {
        assert((!record || record->owners > 0) && "a part left a record that was freed");
        if (record && --record->owners == 0)
            delete record;
    }

    PtrArray<Signal *> busSlices; ///< slices and indices, not owned
    Polarity portPolarity;        ///< of the bus, or of an index without a bus
    unsigned int owners = 1;
    Bus *bus; ///< null after the end of the bus, and for an index without a bus
};

} // namespace Vesk_Hdl
