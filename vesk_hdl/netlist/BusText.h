#pragma once

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Object.h"

// What buses, slices and bus pins read off their own names. No class stores a bound: a name may
// change at any time, and a million signals would each carry two numbers that are seldom asked for.

namespace Vesk_Hdl {

/// The bounds as text; both are as they were if the name is no bus name.
inline void GetBounds(Object const &bus, Basis::StringBase<char> &left,
                      Basis::StringBase<char> &right) {
    Names::BusParts parts;
    if (Names::SplitBusName(bus.GetNameRef().View(), parts)) {
        left = Basis::StringBase<char>(parts.left);
        right = Basis::StringBase<char>(parts.right);
    }
}

/// Whether the left bound is the greater one; false if the name is no bus name.
inline bool RunsDown(Object const &bus) {
    Names::Bounds bounds;
    return Names::ParseBounds(bus.GetNameRef().View(), bounds) && bounds.IsDownTo();
}

/// BASE_DUMMY(LEFT:RIGHT), the bounds as they are typed: D(07:0) gives D_DUMMY(07:0).
inline Basis::StringBase<char> GetDummyBusName(Object const &bus) {
    Basis::StringBase<char> left;
    Basis::StringBase<char> right;
    GetBounds(bus, left, right);
    Basis::StringBase<char> base = Object::GetBaseName(bus.GetNameRef());
    base += Names::DUMMY_TAG;
    return Names::BusName(base.View(), left.View(), right.View());
}

} // namespace Vesk_Hdl
