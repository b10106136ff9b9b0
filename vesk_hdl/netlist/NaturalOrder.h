#pragma once

#include <array>
#include <cstdint>
#include <vector>

#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/text/IntroSort.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// The one order of names: case is ignored and runs of digits compare as numbers, so that A2 comes
/// before A10. -1, 0 or 1. A digit comes after any other character in its place; of two runs of
/// digits the longer one is greater, leading zeros counted.
int NaturalCompare(char const *a, char const *b);

/// The beginning of a name as numbers in that order: where two heads differ they compare as the
/// names do, where they are equal NaturalCompare decides. A sort so seldom touches the names, which
/// lie all over the memory.
using NaturalHead = std::array<std::uint64_t, 2>;
NaturalHead HeadOf(char const *name);

/// Sorts objects by polarity, then by name. `polarityOf` gives an object's polarity; objects that
/// have none sort by name alone when it always gives the same. An array in strictly ascending order
/// has no other and stays as it is.
template <class T, class PolarityOf> void SortNaturally(PtrArray<T> &array, PolarityOf polarityOf) {
    struct Key {
        int polarity;
        char const *name;
        T item;
        NaturalHead head;
    };
    auto const keyOf = [&polarityOf](T item) {
        return item ? Key{polarityOf(item).GetValue(), item->GetNameRef(), item, {}}
                    : Key{Polarity::INVALID, "", item, {}};
    };
    auto less = [](Key const &a, Key const &b) {
        if (a.polarity != b.polarity)
            return a.polarity < b.polarity;
        return a.head != b.head ? a.head < b.head : NaturalCompare(a.name, b.name) < 0;
    };
    int ascending = 1;
    while (ascending < array.GetSize() &&
           less(keyOf(array.GetAt(ascending - 1)), keyOf(array.GetAt(ascending))))
        ++ascending;
    if (ascending >= array.GetSize())
        return;

    std::vector<Key> keys;
    keys.reserve(static_cast<std::size_t>(array.GetSize()));
    for (int i = 0; i < array.GetSize(); ++i) {
        keys.push_back(keyOf(array.GetAt(i)));
        keys.back().head = HeadOf(keys.back().name);
    }
    IntroSort<Key, decltype(less)>::Sort(keys.data(), keys.data() + keys.size(), less);
    for (int i = 0; i < array.GetSize(); ++i)
        array.SetAt(i, keys[static_cast<std::size_t>(i)].item);
}

} // namespace Vesk_Hdl
