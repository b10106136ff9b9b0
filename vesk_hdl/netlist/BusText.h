#pragma once

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Object.h"

// What a bus and its parts read off their own names.

namespace Vesk_Hdl {

/// The bounds; both as they were if the name is no bus name.
inline void GetBounds(Object const &bus, Basis::StringBase<char> &left,
                      Basis::StringBase<char> &right) {
    Names::BusParts parts;
    if (Names::SplitBusName(bus.GetNameRef().View(), parts)) {
        left = Basis::StringBase<char>(parts.left);
        right = Basis::StringBase<char>(parts.right);
    }
}

inline bool RunsDown(Object const &bus) {
    Names::Bounds bounds;
    return Names::ParseBounds(bus.GetNameRef().View(), bounds) && bounds.IsDownTo();
}

/// BASE_DUMMY(LEFT:RIGHT).
inline Basis::StringBase<char> GetDummyBusName(Object const &bus) {
    Basis::StringBase<char> left;
    Basis::StringBase<char> right;
    GetBounds(bus, left, right);
    Basis::StringBase<char> base = Object::GetBaseName(bus.GetNameRef());
    base += Names::DUMMY_TAG;
    return Names::BusName(base.View(), left.View(), right.View());
}

} // namespace Vesk_Hdl
