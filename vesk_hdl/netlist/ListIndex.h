#pragma once

#include <unordered_set>

#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// What a signal lists, pins and signals alike, for lists that are too long to be scanned: a net
/// with a hundred thousand pins answers whether it lists one as fast as a net with two.
class ListIndex {
public:
    static constexpr int LONGEST_SCAN = 32;

    template <class T> void AddAll(PtrArray<T> const &list) {
        for (int i = 0; i < list.GetSize(); ++i)
            Add(list.GetAt(i));
    }
    void Add(void const *item) { items.insert(item); }
    bool Remove(void const *item) { return items.erase(item) > 0; }
    bool Contains(void const *item) const { return items.contains(item); }

private:
    std::unordered_set<void const *> items;
};

} // namespace Vesk_Hdl
