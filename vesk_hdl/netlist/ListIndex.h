#pragma once

#include <cstdint>
#include <unordered_set>

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// The set of what a signal lists, pins and signals alike, for lists that are too long to be
/// searched: a net with a hundred thousand pins then refuses a second connection of a pin as fast
/// as one with two.
///
/// Items are compared by address and never looked into, since they may have been deleted. A signal
/// may then be at the address of a former pin, so that the two kinds have different keys.
class ListIndex {
public:
    static constexpr int MAX_SCAN = 32; ///< a list up to this length is searched from its beginning

    template <class T> void AddAll(PtrArray<T> const &list) {
        for (int i = 0; i < list.GetSize(); ++i)
            Add(list.GetAt(i));
    }
    template <class T> void Add(T *item) { items.insert(KeyOf(item)); }
    template <class T> bool Remove(T *item) { return items.erase(KeyOf(item)) > 0; }
    template <class T> bool Contains(T *item) const { return items.contains(KeyOf(item)); }

private:
    /// Objects are at even addresses, so that the lowest bit can mark signals.
    static std::uintptr_t KeyOf(Pin *pin) { return reinterpret_cast<std::uintptr_t>(pin); }
    static std::uintptr_t KeyOf(Signal *signal) {
        return reinterpret_cast<std::uintptr_t>(signal) | 1;
    }

    std::unordered_set<std::uintptr_t> items;
};

} // namespace Vesk_Hdl
