#pragma once

#include <cstdint>
#include <unordered_set>

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// What a signal lists, pins and signals alike, for lists that are too long to be scanned: a net
/// with a hundred thousand pins answers whether it lists one as fast as a net with two. Items may
/// be gone; a signal may then lie where a pin was.
class ListIndex {
public:
    static constexpr int MAX_SCAN = 32;

    template <class T> void AddAll(PtrArray<T> const &list) {
        for (int i = 0; i < list.GetSize(); ++i)
            Add(list.GetAt(i));
    }
    template <class T> void Add(T *item) { items.insert(KeyOf(item)); }
    template <class T> bool Remove(T *item) { return items.erase(KeyOf(item)) > 0; }
    template <class T> bool Contains(T *item) const { return items.contains(KeyOf(item)); }

private:
    /// Objects lie at even addresses.
    static std::uintptr_t KeyOf(Pin *pin) { return reinterpret_cast<std::uintptr_t>(pin); }
    static std::uintptr_t KeyOf(Signal *signal) {
        return reinterpret_cast<std::uintptr_t>(signal) | 1;
    }

    std::unordered_set<std::uintptr_t> items;
};

} // namespace Vesk_Hdl
