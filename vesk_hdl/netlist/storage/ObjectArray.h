#pragma once

#include <atomic>
#include <cassert>
#include <memory>
#include <mutex>
#include <unordered_map>

#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// The objects of one kind in a netlist, in their order, which it owns.
///
/// A design may widen a hundred thousand buses, and each time one is removed from anywhere in the
/// order. Moving all later objects each time would cost the square. So a removal leaves a hole
/// (null), and the holes are closed when the array is asked for. A client that ever got an iterator
/// may still have it and has to see a removal at once: from then on each removal moves the later
/// objects.
///
/// Invariant: whenever a caller sees the array it has no holes. See docs/architecture.md, "Storage
/// and its invariants".
template <class T> class ObjectArray {
public:
    void Add(T *object) {
        objects.Add(object);
        if (places) {
            try {
                places->insert_or_assign(object, objects.GetSize() - 1);
            } catch (...) { // without memory for the index: the object is added all the same
                places.reset();
            }
        }
    }
    void RemoveTail() {
        if (places)
            places->erase(objects.GetTail());
        objects.RemoveTail();
    }

    /// Takes an object out without deleting it; false if it is not here.
    bool Remove(T *object) {
        if (objects.GetTail() == object) {
            RemoveTail();
            return true;
        }
        if (isWatched.load(std::memory_order_relaxed)) {
            places.reset();
            return objects.Remove(object);
        }
        int const place = Find(object);
        if (place < 0)
            return false;
        assert(objects.GetAt(place) == object && "the index leads to another object");
        objects.SetAt(place, nullptr);
        if (holes.fetch_add(1, std::memory_order_relaxed) + 1 > MIN_HOLES + objects.GetSize() / 2)
            Close();
        return true;
    }

    /// The array without holes, for a walk that ends before the next removal. It is not watched: a
    /// later removal may leave a hole in it.
    PtrArray<T *> const &Get() const {
        Close();
        return objects;
    }
    /// The same for changing the order.
    PtrArray<T *> &GetForSort() {
        Close();
        places.reset();
        return objects;
    }
    /// An iterator for a client, who may keep it.
    Iterator<T *> GetIterator() const {
        Close();
        if (!isWatched.load(std::memory_order_relaxed))
            isWatched.store(true, std::memory_order_relaxed);
        return Iterator<T *>(&objects);
    }

private:
    static constexpr int MIN_HOLES = 32; ///< fewer holes than that are not closed by a removal

    /// The place of an object, -1 if it is not here. It is taken out of the index, since the caller
    /// is about to remove the object.
    int Find(T *object) {
        try {
            if (!places) {
                places = std::make_unique<std::unordered_map<T *, int>>();
                for (int i = 0; i < objects.GetSize(); ++i)
                    if (T *const other = objects.GetAt(i))
                        places->try_emplace(other, i);
            }
        } catch (...) { // without memory for an index the array is searched
            places.reset();
            return objects.GetIndex(object);
        }
        auto const found = places->find(object);
        if (found == places->end())
            return -1;
        int const place = found->second;
        places->erase(found);
        return place;
    }

    /// Moves the objects together. It is const, and several threads may read a netlist at once: the
    /// first of them closes the holes, and the lock makes the others wait for it.
    void Close() const {
        if (holes.load(std::memory_order_acquire) == 0)
            return;
        static std::mutex mutex;
        std::lock_guard<std::mutex> const lock(mutex);
        if (holes.load(std::memory_order_relaxed) == 0)
            return;
        int kept = 0;
        for (int i = 0; i < objects.GetSize(); ++i)
            if (T *const object = objects.GetAt(i))
                objects.SetAt(kept++, object);
        while (objects.GetSize() > kept)
            objects.RemoveTail();
        places.reset();
        holes.store(0, std::memory_order_release);
    }

    mutable OwnPtrArray<T *> objects;
    mutable std::unique_ptr<std::unordered_map<T *, int>> places; ///< null until a removal needs it
    mutable std::atomic<int> holes{0};                            ///< how many elements are null
    mutable std::atomic<bool> isWatched{false};                   ///< a client may have an iterator
};

} // namespace Vesk_Hdl
