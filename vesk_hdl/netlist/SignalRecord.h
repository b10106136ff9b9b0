#pragma once

#include <cassert>

#include "vesk_hdl/netlist/ListIndex.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/text/LentPtrArray.h"

namespace Vesk_Hdl {

/// The two lists of a signal and its constant. See docs/architecture.md, "Storage and its
/// invariants".
///
/// Neither list holds an item twice: Connect searches first, and CloneConnection fills empty lists.
/// Items are compared by address and looked into only by operations that say so, since they may be
/// gone.
///
/// There is room for three pins in the record: one that drives and two that read, as most nets
/// have.
struct Signal::Record {
    BitVectorValue constantValue;
    InlinePtrArray<Pin *, 3> pins;
    PtrArray<Signal *> signals;
    std::unique_ptr<ListIndex> index; ///< of both lists; made when a long one is searched

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

    /// Removes an item, if it is listed. It searches from both ends, since clients mostly remove
    /// what came first or last: removing all items in either order then takes linear time.
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
