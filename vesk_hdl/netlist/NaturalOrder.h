#pragma once

#include <vector>

#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/text/IntroSort.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// The one order of names: case is ignored and runs of digits compare as numbers, so that A2 comes
/// before A10. -1, 0 or 1. A digit comes after any other character in its place; of two runs of
/// digits the longer one is greater, leading zeros counted.
int NaturalCompare(char const *a, char const *b);

/// Sorts objects by polarity, then by name. `polarityOf` gives an object's polarity; objects that
/// have none sort by name alone when it always gives the same. What the comparison needs is read
/// once for each object, not once for each comparison.
template <class T, class PolarityOf> void SortNaturally(PtrArray<T> &array, PolarityOf polarityOf) {
    struct Key {
        int polarity;
        char const *name;
        T item;
    };
    std::vector<Key> keys;
    keys.reserve(static_cast<std::size_t>(array.GetSize()));
    for (int i = 0; i < array.GetSize(); ++i) {
        T const item = array.GetAt(i);
        keys.push_back(item ? Key{polarityOf(item).GetValue(), item->GetNameRef(), item}
                            : Key{Polarity::INVALID, "", item});
    }
    auto less = [](Key const &a, Key const &b) {
        return a.polarity != b.polarity ? a.polarity < b.polarity
                                        : NaturalCompare(a.name, b.name) < 0;
    };
    IntroSort<Key, decltype(less)>::Sort(keys.data(), keys.data() + keys.size(), less);
    for (int i = 0; i < array.GetSize(); ++i)
        array.SetAt(i, keys[static_cast<std::size_t>(i)].item);
}

} // namespace Vesk_Hdl
