#pragma once

#include <cassert>

#include "vesk_hdl/netlist/ListIndex.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/text/LentPtrArray.h"

namespace Vesk_Hdl {

/// Neither list holds an item twice: Connect looks first, and CloneConnection fills empty lists.
/// The items are compared and not looked into, but by operations that say so: they may be gone.
///
/// Three pins find room here: one that drives and two that read, as most nets of a design have.
struct Signal::Record {
    BitVectorValue constantValue;
    InlinePtrArray<Pin *, 3> pins;
    PtrArray<Signal *> signals;
    std::unique_ptr<ListIndex> index; ///< of both lists, once one of them was long when searched

    template <class T> bool Contains(PtrArray<T *> const &list, T *item) {
        if (list.GetSize() <= ListIndex::MAX_SCAN)
            return list.Contains(item);
        if (!index) {
            index = std::make_unique<ListIndex>();
            index->AddAll(pins);
            index->AddAll(signals);
        }
        return index->Contains(item);
    }

    template <class T> void Append(PtrArray<T *> &list, T *item) {
        list.Add(item);
        if (index)
            index->Add(item);
    }

    /// Looks from both ends: clients mostly take away what came first or last.
    template <class T> void Remove(PtrArray<T *> &list, T *item) {
        if (index && !index->Remove(item))
            return;
        for (int first = 0, last = list.GetSize() - 1; first <= last; ++first, --last)
            for (int const place : {first, last})
                if (list.GetAt(place) == item)
                    return list.RemoveAt(place);
        assert(!index && "an item that the index knows is in none of the lists");
    }
};

} // namespace Vesk_Hdl
