#pragma once

#include <array>
#include <cstdint>
#include <vector>

#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/text/IntroSort.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// The one order of names in all written text: case is ignored, and runs of digits compare as
/// numbers, so that A2 comes before A10. The result is -1, 0 or 1. A digit comes after any other
/// character in its place. Of two runs of digits the longer one is greater, leading zeros counted:
/// A007 comes after A7.
int NaturalCompare(char const *a, char const *b);

/// The beginning of a name as two numbers in that order. Heads that differ compare as the names do;
/// if they are equal, NaturalCompare decides. So a sort seldom reads the names, which are scattered
/// over the memory.
using NaturalHead = std::array<std::uint64_t, 2>;
/// The head of a name.
NaturalHead HeadOf(char const *name);

/// Sorts objects by polarity, then by name. `polarityOf` returns the polarity of an object; for
/// objects without one it returns the same for all, which then sort by name alone.
///
/// If the names of each polarity are in strictly ascending order already, only one order is
/// possible, and separating the polarities makes it. Otherwise all are sorted by IntroSort, whose
/// order of equal items is required.
template <class T, class PolarityOf> class NaturalSort {
public:
    static void Sort(PtrArray<T> &array, PolarityOf polarityOf) {
        NaturalSort sort{array, polarityOf};
        if (sort.GetSize() > 1 && !sort.Part())
            sort.SortAll();
    }

private:
    struct Key {
        int polarity;
        char const *name;
        T item;
        NaturalHead head;
    };
    static constexpr int PARTS = 4; ///< INVALID, INPUT, OUTPUT, BIDIRECTIONAL

    NaturalSort(PtrArray<T> &sorted, PolarityOf &polarity) : array(sorted), polarityOf(polarity) {}

    int GetSize() const { return array.GetSize(); }
    int PolarityAt(int i) const {
        T const item = array.GetAt(i);
        return item ? polarityOf(item).GetValue() : Polarity::INVALID;
    }
    char const *NameAt(int i) const {
        T const item = array.GetAt(i);
        return item ? item->GetNameRef().GetText() : "";
    }

    /// Separates the polarities if the names of each ascend. Otherwise it returns false and changes
    /// nothing.
    bool Part() {
        char const *last[PARTS] = {};
        int highest = 0;
        bool isParted = true;
        for (int i = 0; i < GetSize(); ++i) {
            int const part = PolarityAt(i) - Polarity::INVALID;
            if (part < 0 || part >= PARTS)
                return false;
            char const *const name = NameAt(i);
            if (last[part] && NaturalCompare(last[part], name) >= 0)
                return false;
            last[part] = name;
            isParted = isParted && part >= highest;
            highest = std::max(highest, part);
        }
        if (!isParted)
            MoveParts();
        return true;
    }

    /// The signals without a polarity, by far the largest part in most designs, move within the
    /// array; only the others are copied.
    void MoveParts() {
        std::vector<T> others[PARTS];
        int size = 0;
        for (int i = 0; i < GetSize(); ++i) {
            int const part = PolarityAt(i) - Polarity::INVALID;
            if (part == 0)
                array.SetAt(size++, array.GetAt(i));
            else
                others[part].push_back(array.GetAt(i));
        }
        for (std::vector<T> const &part : others)
            for (T const item : part)
                array.SetAt(size++, item);
    }

    void SortAll() {
        auto less = [](Key const &a, Key const &b) {
            if (a.polarity != b.polarity)
                return a.polarity < b.polarity;
            return a.head != b.head ? a.head < b.head : NaturalCompare(a.name, b.name) < 0;
        };
        std::vector<Key> keys;
        keys.reserve(static_cast<std::size_t>(GetSize()));
        for (int i = 0; i < GetSize(); ++i)
            keys.push_back({PolarityAt(i), NameAt(i), array.GetAt(i), HeadOf(NameAt(i))});
        IntroSort<Key, decltype(less)>::Sort(keys.data(), keys.data() + keys.size(), less);
        for (int i = 0; i < GetSize(); ++i)
            array.SetAt(i, keys[static_cast<std::size_t>(i)].item);
    }

    PtrArray<T> &array;
    PolarityOf &polarityOf;
};

/// One such sort.
template <class T, class PolarityOf> void SortNaturally(PtrArray<T> &array, PolarityOf polarityOf) {
    NaturalSort<T, PolarityOf>::Sort(array, polarityOf);
}

} // namespace Vesk_Hdl
