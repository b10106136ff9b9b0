#pragma once

#include <cstddef>
#include <type_traits>

#include "vesk_hdl/Api.h"

namespace Vesk_Hdl {

/// The untyped array of pointers under PtrArray. It owns no element; null elements are legal.
/// Indexes count from 0. An index fault is no failure: reads give null, writes do nothing.
class VESK_HDL_API PtrArrayBase {
public:
    PtrArrayBase();
    virtual ~PtrArrayBase();
    PtrArrayBase(PtrArrayBase const &) = delete;
    PtrArrayBase &operator=(PtrArrayBase const &) = delete;

    int GetSize() const { return block ? block->size : 0; }
    bool IsEmpty() const { return GetSize() == 0; }
    /// The size becomes 0. No element is deleted, also in an OwnPtrArray.
    void Empty();
    /// Sorts in place, not stable, by an introspective sort with fixed steps. `compare` answers
    /// whether its first argument stands strictly before its second; `context` is handed through.
    void Sort(bool (*compare)(void *, void *, void *), void *context);

protected:
    /// Appends, also a duplicate, and returns the index of the element.
    int Add(void *item);
    void *GetAt(int index) const {
        return index >= 0 && index < GetSize() ? Items()[index] : nullptr;
    }
    /// The last element, null when empty.
    void *GetTail() const { return GetAt(GetSize() - 1); }
    /// The index of the first equal pointer, -1 when absent. A scan from the front.
    int GetIndex(void *item) const;
    bool Contains(void *item) const { return GetIndex(item) >= 0; }
    /// Removes the first equal pointer and keeps the order of the others; false when absent.
    bool Remove(void *item);
    /// Drops the last element. The array must not be empty.
    void RemoveTail();
    /// Stores at `index`; an index past the end makes the array longer, with null in between. A
    /// negative index does nothing.
    void SetAt(int index, void *item);
    /// Exchanges two elements, if both indexes are in range.
    void Swap(int first, int second);

    void **Items() const { return reinterpret_cast<void **>(block + 1); }

    static constexpr std::size_t BytesFor(int count) {
        return sizeof(Block) + static_cast<std::size_t>(count) * sizeof(void *);
    }
    /// Has an array without a block begin in memory that is not its own, for `count` elements.
    void Borrow(void *memory, int count);

private:
    /// Stands in front of the elements, in one block with them. There is none while nothing was
    /// ever added: most arrays of a design stay empty.
    struct Block {
        int size;
        int capacity; ///< of borrowed memory its complement, below 0
    };

    int GetCapacity() const;
    bool IsBorrowed() const { return block && block->capacity < 0; }
    int GrownCapacity() const;
    void Reserve(int capacity);

    Block *block;
};

/// An ordered array of pointers, in order of addition until somebody sorts. `T` is a pointer type.
template <class T> class PtrArray : public PtrArrayBase {
public:
    int Add(T item) { return PtrArrayBase::Add(item); }
    T GetAt(int index) const { return static_cast<T>(PtrArrayBase::GetAt(index)); }
    T GetTail() const { return static_cast<T>(PtrArrayBase::GetTail()); }
    int GetIndex(T item) const { return PtrArrayBase::GetIndex(item); }
    bool Contains(T item) const { return PtrArrayBase::Contains(item); }
    bool Remove(T item) { return PtrArrayBase::Remove(item); }
    void RemoveTail() { PtrArrayBase::RemoveTail(); }
    void SetAt(int index, T item) { PtrArrayBase::SetAt(index, item); }
    void Swap(int first, int second) { PtrArrayBase::Swap(first, second); }
};

/// A PtrArray that deletes what it holds when it dies, the last element first. Elements that were
/// removed or emptied out are the caller's.
template <class T> class OwnPtrArray : public PtrArray<T> {
public:
    ~OwnPtrArray() override { DeleteAll(); }
    /// The last one first.
    void DeleteAll() {
        static_assert(std::has_virtual_destructor_v<std::remove_pointer_t<T>>);
        for (int i = this->GetSize() - 1; i >= 0; --i)
            delete this->GetAt(i);
        this->Empty();
    }
};

/// A cursor over a PtrArray that it points at and does not own; changes of the array show through.
/// A copy starts from 0 wherever its source stood. A walk is
///
///     for (it.Rewind(); it.HasMore(); it.Advance())
///         if (Signal *signal = it.Current()) ...
///
/// since elements may be null.
template <class T> class Iterator {
public:
    /// A null array is one without elements.
    Iterator(PtrArray<T> const *walked = nullptr) : array(walked), position(0) {}
    Iterator(Iterator const &other) : array(other.array), position(0) {}
    virtual ~Iterator() = default;
    Iterator &operator=(Iterator const &other) {
        if (this != &other) {
            array = other.array;
            position = 0;
        }
        return *this;
    }

    void Rewind() { position = 0; }
    bool HasMore() const { return array && position < array->GetSize(); }
    T Current() const { return array ? array->GetAt(position) : nullptr; }
    void Advance() { ++position; }
    /// What is walked over, null for nothing.
    PtrArray<T> const *GetArray() const { return array; }

private:
    PtrArray<T> const *array;
    int position;
};

/// Calls `act` with each element that is not null, in order. The array may grow meanwhile.
template <class T, class Act> void ForEach(PtrArray<T> const &array, Act act) {
    constexpr int AHEAD = 12; // far enough for the memory to bring an object of a large design
    for (int i = 0; i < array.GetSize(); ++i) {
        __builtin_prefetch(array.GetAt(i + AHEAD));
        if (T const item = array.GetAt(i))
            act(item);
    }
}
template <class T, class Act> void ForEach(Iterator<T> walk, Act act) {
    if (PtrArray<T> const *const array = walk.GetArray())
        ForEach(*array, act);
}

} // namespace Vesk_Hdl
