#include "vesk_hdl/text/PtrArray.h"

#include <algorithm>
#include <bit>
#include <random>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "vesk_hdl/text/LentPtrArray.h"

using namespace Vesk_Hdl;

namespace {

struct Item {
    int key;
};
using Items = std::vector<Item *>;

Items In(PtrArray<Item *> const &array) {
    Items items;
    for (int i = 0; i < array.GetSize(); ++i)
        items.push_back(array.GetAt(i));
    return items;
}

TEST(PtrArray, IndexesOutsideAreHarmless) {
    Item a{1}, b{1}, absent{1};
    PtrArray<Item *> array;
    EXPECT_EQ(array.GetTail(), nullptr);
    array.RemoveTail();
    array.SetAt(-1, &a);
    EXPECT_TRUE(array.IsEmpty());
    array.SetAt(2, &b);
    array.SetAt(3, &a); // one past the room there is
    EXPECT_EQ(array.Add(&b), 4);
    array.SetAt(6, &b); // inside the room, past the size
    EXPECT_EQ(In(array), (Items{nullptr, nullptr, &b, &a, &b, nullptr, &b}));
    EXPECT_TRUE(array.GetAt(-1) == nullptr && array.GetAt(7) == nullptr);
    EXPECT_TRUE(array.GetIndex(&b) == 2 && array.Contains(nullptr) && !array.Contains(&absent));
    for (auto const &[first, second] : {std::pair{1, 1}, {0, 7}, {7, 0}, {-1, 0}, {0, -1}, {3, 0}})
        array.Swap(first, second);
    EXPECT_TRUE(array.Remove(&b) && !array.Remove(&absent));
    array.RemoveTail();
    EXPECT_EQ(In(array), (Items{&a, nullptr, nullptr, &b, nullptr}));
    array.Empty();
    EXPECT_EQ(array.GetAt(0), nullptr);
}

TEST(PtrArray, GrowsAndShrinksAtBothEnds) {
    std::vector<Item> pool(50);
    std::mt19937 random(7);
    PtrArray<Item *> array, other;
    for (int round = 0; round < 20; ++round) {
        array.Empty();
        InlinePtrArray<Item *, 3> lent;
        PtrArray<Item *> *const both[] = {&array, &lent};
        Items model;
        // A phase mostly adds, or mostly removes, at one of the ends.
        for (int step = 0; step < 1000; ++step) {
            unsigned const phase = static_cast<unsigned>(step / 200 + round) % 4;
            auto const act = static_cast<unsigned>(random() % 4 == 0 ? random() % 5 : phase);
            Item *const item = &pool[random() % pool.size()];
            auto const size = static_cast<int>(model.size());
            int const place = size == 0 || phase == 1 ? 0 : step % size;
            for (PtrArray<Item *> *const each : both)
                act == 0   ? each->Prepend(item)
                : act == 3 ? void(each->Add(item))
                : act == 4 ? each->SetAt(size + 1, item)
                : size > 0 ? each->RemoveAt(place)
                           : void();
            if (act == 0)
                model.insert(model.begin(), item);
            else if (act == 4)
                model.insert(model.end(), {nullptr, item});
            else if (act == 3)
                model.push_back(item);
            else if (size > 0)
                model.erase(model.begin() + place);
            ASSERT_EQ(In(array), model) << step;
            ASSERT_EQ(In(lent), model) << step;
        }
    }
    Items const last = In(array);
    other.Add(&pool[0]);
    array.ExchangeElements(other);
    EXPECT_TRUE(In(other) == last && In(array) == Items{&pool[0]});
}

struct Mortal {
    Mortal(std::string &d, char n) : deaths(d), name(n) {}
    virtual ~Mortal() { deaths += name; }
    std::string &deaths;
    char name;
};

TEST(OwnPtrArray, DeletesWhatItHoldsLastFirst) {
    std::string deaths;
    Mortal removed(deaths, 'r');
    {
        OwnPtrArray<Mortal *> array;
        for (char const name : {'a', 'b', 'c'})
            array.Add(new Mortal(deaths, name));
        array.SetAt(5, &removed);
        array.Remove(&removed);
    }
    EXPECT_EQ(deaths, "cba");
}

TEST(Iterator, WalksTheArrayAsItIsNowAndCopiesStartAnew) {
    Item a{1}, b{2};
    PtrArray<Item *> array;
    array.Add(&a);
    Iterator<Item *> walk(&array);
    walk.Advance();
    EXPECT_TRUE(!walk.HasMore() && walk.Current() == nullptr);
    array.Add(&b);
    EXPECT_TRUE(walk.HasMore() && walk.Current() == &b);
    Iterator<Item *> assigned(nullptr);
    EXPECT_TRUE(!assigned.HasMore() && assigned.Current() == nullptr);
    assigned = walk;
    walk = *&walk;
    EXPECT_TRUE(assigned.Current() == &a && Iterator<Item *>(walk).Current() == &a);
    EXPECT_EQ(walk.Current(), &b);
}

bool Less(Item const *a, Item const *b) { return a->key < b->key; }

bool CountingLess(void *a, void *b, void *calls) {
    ++*static_cast<std::size_t *>(calls);
    return Less(static_cast<Item *>(a), static_cast<Item *>(b));
}

/// Introspective sort as in textbooks: cut by the median of three down to 16 elements, then a pass
/// of insertion, which leaves equal elements in the order it finds them in.
struct NaiveSort {
    Items items;
    bool atDepthLimit = false;

    std::size_t Partition(std::size_t left, std::size_t right) {
        Items three = {items[left], items[left + (right - left) / 2], items[right - 1]};
        std::sort(three.begin(), three.end(), Less);
        for (;; std::swap(items[left++], items[right])) {
            while (Less(items[left], three[1]))
                ++left;
            while (Less(three[1], items[--right]))
                continue;
            if (left >= right)
                return left;
        }
    }
    void Cut(std::size_t first, std::size_t last, int depth) {
        while (last - first > 16 && !(atDepthLimit = atDepthLimit || depth == 0)) {
            std::size_t const middle = Partition(first, last);
            Cut(middle, last, --depth);
            last = middle;
        }
    }
    void Sort() {
        Cut(0, items.size(), 2 * (static_cast<int>(std::bit_width(items.size())) - 1));
        std::stable_sort(items.begin(), items.end(), Less);
    }
};

/// Sorts both ways and compares. Beyond the depth limit the order of equal elements is not fixed.
bool SortBothWays(std::vector<int> const &keys) {
    std::vector<Item> storage(keys.size());
    NaiveSort naive;
    PtrArray<Item *> array;
    for (std::size_t i = 0; i < keys.size(); ++i) {
        storage[i].key = keys[i];
        naive.items.push_back(&storage[i]);
        array.Add(&storage[i]);
    }
    naive.Sort();
    std::size_t calls = 0;
    array.Sort(CountingLess, &calls);
    EXPECT_LE(calls, keys.size() < 2 ? 0 : 100 * keys.size());
    Items sorted = In(array);
    EXPECT_TRUE(std::is_sorted(sorted.begin(), sorted.end(), Less));
    if (naive.atDepthLimit) {
        std::sort(sorted.begin(), sorted.end());
        std::sort(naive.items.begin(), naive.items.end());
    }
    EXPECT_EQ(sorted, naive.items);
    return naive.atDepthLimit;
}

TEST(PtrArraySort, LeavesEqualElementsWhereTheStepsPutThem) {
    std::mt19937 random(6);
    for (std::size_t round = 0; round < 1500; ++round) {
        std::vector<int> keys(round / 5);
        unsigned int const ranges[] = {1, 2, 5, 40, 100000};
        for (int &key : keys)
            key = static_cast<int>(random() % ranges[round % 5]);
        if (random() % 5 == 0)
            std::sort(keys.begin(), keys.end());
        SCOPED_TRACE(testing::Message() << "round " << round);
        SortBothWays(keys);
    }
}

/// Each cut of this order by the median of three splits off two elements only.
TEST(PtrArraySort, StaysFastOnTheWorstInput) {
    int const half = 10000;
    for (int const sharing : {1, 2, 3}) {
        std::vector<int> keys;
        for (int i = 1; i <= half; ++i)
            keys.push_back((i % 2 ? i : half + i - 1) / sharing);
        for (int i = 1; i <= half; ++i)
            keys.push_back(2 * i / sharing);
        EXPECT_TRUE(SortBothWays(keys) || sharing > 1) << "keys shared by " << sharing;
    }
}

} // namespace
