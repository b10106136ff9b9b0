#pragma once

#include <algorithm>
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
/// The head of a name. Further heads, counted from 0, hold what comes after it, in the same manner.
NaturalHead HeadOf(char const *name, unsigned int head = 0);

/// Sorts objects by polarity, then by name. `polarityOf` returns the polarity of an object; for
/// objects without one it returns the same for all, which then sort by name alone.
///
/// If no two objects are equal only one order is possible, and any way may lead there. Names mostly
/// come in ascending order for each polarity, or in a few series that take turns (a1, d1(7:0), a2,
/// d2(7:0), ...). So the polarities are separated or the series merged, in a time that is linear in
/// the number of objects. Everything else is sorted by IntroSort, whose order of equal items is
/// required.
template <class T, class PolarityOf> class NaturalSort {
public:
    static void Sort(PtrArray<T> &array, PolarityOf polarityOf) {
        NaturalSort sort{array, polarityOf};
        if (sort.GetSize() > 1 && !sort.Part())
            sort.SortAll();
    }

private:
    /// What a comparison of an object mostly wants, side by side in memory.
    struct Key {
        NaturalHead head;
        int polarity;
        int place; ///< of the object in the array; while series are merged, of the next in its
                   ///< series
    };
    /// Objects that ascend, by their places in the array.
    struct Series {
        int first;
        int last;
    };
    static constexpr int PARTS = 4; ///< INVALID, INPUT, OUTPUT, BIDIRECTIONAL
    static constexpr std::size_t MAX_SERIES = 8;
    static constexpr unsigned int MAX_HEADS = 4;
    static constexpr int NONE = -1;

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
        int sizes[PARTS] = {};
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
            ++sizes[part];
            isParted = isParted && part >= highest;
            highest = std::max(highest, part);
        }
        if (!isParted)
            MoveParts(sizes);
        return true;
    }

    /// The signals without a polarity, by far the largest part in most designs, move within the
    /// array; only the others are copied. All memory is taken first: without it (std::bad_alloc)
    /// the array is as it was.
    void MoveParts(int const (&sizes)[PARTS]) {
        std::vector<T> others[PARTS];
        for (int part = 1; part < PARTS; ++part)
            others[part].reserve(static_cast<std::size_t>(sizes[part]));
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

    void MakeKeys() {
        keys.clear();
        keys.reserve(static_cast<std::size_t>(GetSize()));
        for (int i = 0; i < GetSize(); ++i)
            keys.push_back({HeadOf(NameAt(i)), PolarityAt(i), i});
    }

    void SortAll() {
        MakeKeys();
        std::vector<T> sorted;
        sorted.reserve(keys.size());
        if (!Merge(sorted)) {
            sorted.clear();
            for (int i = 0; i < GetSize(); ++i)
                KeyAt(i).place = i;
            if (!SortByHeads(keys.data(), keys.data() + keys.size(), 0)) {
                MakeKeys(); // the steps for equal objects begin with the order of the array
                SortKeys(
                    keys.data(), keys.data() + keys.size(),
                    [this](Key const &a, Key const &b) { return IsLess(a, a.place, b, b.place); });
            }
            for (Key const &key : keys)
                sorted.push_back(array.GetAt(key.place));
        }
        for (int i = 0; i < GetSize(); ++i)
            array.SetAt(i, sorted[static_cast<std::size_t>(i)]);
    }

    template <class Less> static void SortKeys(Key *first, Key *last, Less less) {
        IntroSort<Key, Less>::Sort(first, last, less);
    }

    /// Sorts keys by their heads, then those with one head by their next heads: so each name is
    /// read a few times and not once for each comparison, of which most wait for the memory if the
    /// names share a long beginning. False if two objects are equal.
    bool SortByHeads(Key *first, Key *const last, unsigned int head) {
        SortKeys(first, last, [](Key const &a, Key const &b) {
            return a.polarity != b.polarity ? a.polarity < b.polarity : a.head < b.head;
        });
        while (first != last) {
            Key *end = first + 1;
            while (end != last && end->polarity == first->polarity && end->head == first->head)
                ++end;
            if (end - first > 1 && !SortAfterHead(first, end, head))
                return false;
            first = end;
        }
        return true;
    }

    /// The same for keys with one polarity and head.
    bool SortAfterHead(Key *first, Key *last, unsigned int head) {
        if (head + 1 < MAX_HEADS) {
            for (Key *key = first; key != last; ++key)
                key->head = HeadOf(NameAt(key->place), head + 1);
            return SortByHeads(first, last, head + 1);
        }
        auto const compare = [this](Key const &a, Key const &b) {
            return NaturalCompare(NameAt(a.place), NameAt(b.place));
        };
        SortKeys(first, last, [&](Key const &a, Key const &b) { return compare(a, b) < 0; });
        return std::adjacent_find(first, last, [&](Key const &a, Key const &b) {
                   return compare(a, b) == 0;
               }) == last;
    }

    /// False if there are too many series, or two objects are equal.
    bool Merge(std::vector<T> &sorted) {
        std::vector<Series> series;
        if (!Split(series))
            return false;
        std::sort(series.begin(), series.end(),
                  [this](Series const &a, Series const &b) { return IsLessAt(a.first, b.first); });
        for (int last = NONE; !series.empty();) {
            int const least = series.front().first; // the series are in the order of their firsts
            if (last != NONE && !IsLessAt(last, least))
                return false;
            last = least;
            sorted.push_back(array.GetAt(least));
            TakeFirst(series);
        }
        return true;
    }

    /// Puts each object at the end of the series with the greatest last object that is less. So the
    /// last objects of the series descend, and there are as few series as can be.
    bool Split(std::vector<Series> &series) {
        for (int i = 0; i < GetSize(); ++i) {
            auto const found = std::find_if(series.begin(), series.end(), [&](Series const &each) {
                return IsLessAt(each.last, i);
            });
            KeyAt(i).place = NONE;
            if (found != series.end()) {
                KeyAt(found->last).place = i;
                found->last = i;
            } else if (series.size() < MAX_SERIES) {
                series.push_back({i, i});
            } else {
                return false;
            }
        }
        return true;
    }

    /// Takes the first object out of the first series, and puts the series where it belongs now.
    void TakeFirst(std::vector<Series> &series) {
        auto place = series.begin();
        Series const moved = {KeyAt(place->first).place, place->last};
        if (moved.first == NONE) {
            series.erase(place);
            return;
        }
        for (; place + 1 != series.end() && IsLessAt(place[1].first, moved.first); ++place)
            *place = place[1];
        *place = moved;
    }

    Key &KeyAt(int place) { return keys[static_cast<std::size_t>(place)]; }
    Key const &KeyAt(int place) const { return keys[static_cast<std::size_t>(place)]; }

    bool IsLessAt(int a, int b) const { return IsLess(KeyAt(a), a, KeyAt(b), b); }

    bool IsLess(Key const &a, int placeOfA, Key const &b, int placeOfB) const {
        if (a.polarity != b.polarity)
            return a.polarity < b.polarity;
        if (a.head != b.head)
            return a.head < b.head;
        return NaturalCompare(NameAt(placeOfA), NameAt(placeOfB)) < 0;
    }

    PtrArray<T> &array;
    PolarityOf &polarityOf;
    std::vector<Key> keys;
};

/// One such sort.
template <class T, class PolarityOf> void SortNaturally(PtrArray<T> &array, PolarityOf polarityOf) {
    NaturalSort<T, PolarityOf>::Sort(array, polarityOf);
}

} // namespace Vesk_Hdl
