#pragma once

#include <memory>
#include <unordered_set>

#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// An array that refuses what it holds already. A short one is scanned; a long one keeps an index,
/// so that a net with a hundred thousand pins takes the next one as fast as the first.
template <class T> class ListedOnce {
public:
    PtrArray<T> const &Items() const { return items; }

    bool Contains(T item) {
        if (items.GetSize() <= LONGEST_SCAN)
            return items.Contains(item);
        if (!index) {
            index = std::make_unique<std::unordered_set<T>>();
            for (int i = 0; i < items.GetSize(); ++i)
                index->insert(items.GetAt(i));
        }
        return index->contains(item);
    }

    /// Appends without asking.
    void Append(T item) {
        items.Add(item);
        if (index)
            index->insert(item);
    }

    bool Remove(T item) {
        bool const removed = items.Remove(item);
        if (removed && index && !items.Contains(item))
            index->erase(item);
        return removed;
    }

    /// Puts `now` in every place of `former`.
    void Replace(T former, T now) {
        for (int i = 0; i < items.GetSize(); ++i)
            if (items.GetAt(i) == former)
                items.SetAt(i, now);
        if (index && index->erase(former) > 0)
            index->insert(now);
    }

    void Empty() {
        items.Empty();
        index.reset();
    }

private:
    static constexpr int LONGEST_SCAN = 32;

    PtrArray<T> items;
    std::unique_ptr<std::unordered_set<T>> index;
};

} // namespace Vesk_Hdl
