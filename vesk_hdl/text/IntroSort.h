#pragma once

#include <algorithm>
#include <bit>
#include <cstddef>
#include <utility>

namespace Vesk_Hdl {

/// The introspective sort of arrays, for items that are cheap to copy.
///
/// Its steps are fixed and must not be replaced by std::sort: the order that they leave equal items
/// in is visible in the written text, and another library or version would give another one. Every
/// cursor also stops at the ends of the range. So a `less` that is no strict order, which a client
/// may pass, gives some order and never an access outside.
template <class Item, class Less> class IntroSort {
public:
    static void Sort(Item *first, Item *last, Less less) {
        if (first == last)
            return;
        auto const count = static_cast<std::size_t>(last - first);
        IntroSort sort{less};
        sort.SortLoop(first, last, 2 * (std::bit_width(count) - 1));
        sort.InsertionSort(first, last);
    }

private:
    static constexpr std::ptrdiff_t SMALL =
        16; ///< ranges up to this size are left to InsertionSort

    explicit IntroSort(Less &l) : less(l) {}

    void SortLoop(Item *first, Item *last, std::size_t depthLimit) {
        while (last - first > SMALL) {
            // Bad pivots would make the time quadratic. Heap sort never takes more than n log n.
            if (depthLimit == 0)
                return HeapSort(first, last);
            --depthLimit;
            Item const pivot = Median(*first, first[(last - first) / 2], last[-1]);
            Item *const cut = Partition(first, last, pivot);
            SortLoop(cut, last, depthLimit);
            last = cut;
        }
    }

    /// Of first, middle and last item: a range that is in order already is halved.
    Item Median(Item a, Item b, Item c) {
        if (less(a, b))
            return less(b, c) ? b : less(a, c) ? c : a;
        return less(a, c) ? a : less(b, c) ? c : b;
    }

    Item *Partition(Item *first, Item *last, Item const &pivot) {
        Item *const begin = first;
        Item *const end = last;
        for (;; ++first) {
            while (first < end && less(*first, pivot))
                ++first;
            --last;
            while (last > begin && less(pivot, *last))
                --last;
            if (first >= last)
                return first;
            std::swap(*first, *last);
        }
    }

    void HeapSort(Item *first, Item *last) {
        std::ptrdiff_t const count = last - first;
        for (std::ptrdiff_t root = count / 2; root-- > 0;)
            SiftDown(first, root, count);
        for (std::ptrdiff_t end = count; end-- > 1;) {
            std::swap(first[0], first[end]);
            SiftDown(first, 0, end);
        }
    }

    void SiftDown(Item *heap, std::ptrdiff_t root, std::ptrdiff_t count) {
        for (std::ptrdiff_t child; (child = 2 * root + 1) < count; root = child) {
            if (child + 1 < count && less(heap[child], heap[child + 1]))
                ++child;
            if (!less(heap[root], heap[child]))
                return;
            std::swap(heap[root], heap[child]);
        }
    }

    /// One pass over the whole array: after SortLoop each item is near its place.
    void InsertionSort(Item *first, Item *last) {
        Item *const guarded = last - first > SMALL ? first + SMALL : last;
        for (Item *item = first + 1; item < guarded; ++item) {
            if (less(*item, *first))
                std::rotate(first, item, item + 1);
            else
                Insert(first, item);
        }
        for (Item *item = guarded; item < last; ++item)
            Insert(first, item);
    }

    void Insert(Item *first, Item *item) {
        Item const value = *item;
        for (; item > first && less(value, item[-1]); --item)
            *item = item[-1];
        *item = value;
    }

    Less &less;
};

} // namespace Vesk_Hdl
