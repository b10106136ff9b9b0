#pragma once

#include <cstddef>
#include <type_traits>

#include "vesk_hdl/Api.h"

namespace Vesk_Hdl {

/// The untyped array of pointers under PtrArray: its operations, public here or there, are the
/// same.
///
/// The array owns no element, and null elements are legal. Indices count from 0. An index outside
/// is no failure: reads return null and writes do nothing. An array that nothing was added to costs
/// no allocation. If memory runs out (std::bad_alloc), the array is as it was.
class VESK_HDL_API PtrArrayBase {
public:
    /// An empty array.
    PtrArrayBase();
    /// Frees the memory of the array and leaves the elements alone.
    virtual ~PtrArrayBase();
    PtrArrayBase(PtrArrayBase const &) = delete;
    PtrArrayBase &operator=(PtrArrayBase const &) = delete;

    /// The number of elements, null ones included.
    int GetSize() const { return block ? block->size : 0; }
    /// Whether there are no elements.
    bool IsEmpty() const { return GetSize() == 0; }
    /// Makes the size 0 and keeps the memory. No element is deleted, also in an OwnPtrArray.
    void Empty();
    /// Sorts in place by an introspective sort with fixed steps, so that the same input always
    /// gives the same order. It is not stable. `compare` returns whether its first argument comes
    /// strictly before its second, and gets `context` as its third; it sees null elements, too.
    void Sort(bool (*compare)(void *, void *, void *), void *context);

protected:
    /// Appends an element, also a duplicate, and returns its index.
    int Add(void *item);
    /// The element at an index, null outside.
    void *GetAt(int index) const {
        return index >= 0 && index < GetSize() ? Items()[index] : nullptr;
    }
    /// The last element, null when empty.
    void *GetTail() const { return GetAt(GetSize() - 1); }
    /// The index of the first equal pointer, -1 when absent. A walk from the front.
    int GetIndex(void *item) const;
    /// Whether an element is equal to the pointer. The same walk.
    bool Contains(void *item) const { return GetIndex(item) >= 0; }
    /// Removes the first equal pointer and keeps the order of the others. False when absent. The
    /// object is not deleted.
    bool Remove(void *item);
    /// Removes the element at an index that is in range, and keeps the order of the others.
    void RemoveAt(int index);
    /// Removes the last element. The array should not be empty; if it is, nothing happens.
    void RemoveTail();
    /// Puts an element before all others. On average it costs no more than Add.
    void Prepend(void *item);
    /// Exchanges the elements of two arrays. Neither may have its elements in borrowed memory.
    void ExchangeElements(PtrArrayBase &other);
    /// Stores an element at an index. An index past the end makes the array longer, with null in
    /// between. A negative index does nothing.
    void SetAt(int index, void *item);
    /// Exchanges two elements. Does nothing unless both indices are in range.
    void Swap(int first, int second);

    /// The elements side by side; meaningless for an array that nothing was added to.
    void **Items() const { return reinterpret_cast<void **>(block + 1); }

    /// The bytes that Borrow needs for so many elements.
    static constexpr std::size_t BytesFor(int count) {
        return sizeof(Block) + static_cast<std::size_t>(count) * sizeof(void *);
    }
    /// Gives an array without elements memory of its owner, aligned as a pointer is, for its first
    /// `count` elements. The memory must outlive the array, which never frees it.
    void Borrow(void *memory, int count);

private:
    /// The head of the elements, which follow it in the same memory. An array that nothing was ever
    /// added to has none: most arrays of a design stay empty.
    ///
    /// There may be a gap of free places before the head: removals at the front leave it, and
    /// additions at the front use it. So both are as cheap there as at the end. The last place of a
    /// gap holds the number of its places. See docs/architecture.md, "Storage and its invariants".
    struct Block {
        int size;
        unsigned int capacity; ///< places from the first element on, and the two marks below
    };
    static constexpr unsigned int BORROWED = 1U << 31;
    static constexpr unsigned int HAS_GAP = 1U << 30;
    static constexpr int MAX_CAPACITY = HAS_GAP - 1;

    int GetCapacity() const { return block ? static_cast<int>(block->capacity & MAX_CAPACITY) : 0; }
    bool IsBorrowed() const { return block && (block->capacity & BORROWED) != 0; }
    bool HasGap() const { return block && (block->capacity & HAS_GAP) != 0; }
    std::size_t GetGap() const;
    void SetGap(std::size_t places);
    void *GetMemory() const;
    void FreeMemory();
    void MoveHead(std::ptrdiff_t places, int elements);
    int GrownCapacity() const;
    void Reserve(int capacity, int gap = 0);

    Block *block;
};

/// An ordered array of pointers, in order of addition until it is sorted. `T` is a pointer type.
/// Each operation is that of PtrArrayBase with `T` in place of `void *`.
template <class T> class PtrArray : public PtrArrayBase {
public:
    /// Appends an element, also a duplicate, and returns its index. The array does not own it.
    int Add(T item) { return PtrArrayBase::Add(item); }
    /// The element at an index, null outside.
    T GetAt(int index) const { return static_cast<T>(PtrArrayBase::GetAt(index)); }
    /// The last element, null when empty.
    T GetTail() const { return static_cast<T>(PtrArrayBase::GetTail()); }
    /// The index of the first equal pointer, -1 when absent. A walk from the front.
    int GetIndex(T item) const { return PtrArrayBase::GetIndex(item); }
    /// Whether an element is equal to the pointer. A walk from the front.
    bool Contains(T item) const { return PtrArrayBase::Contains(item); }
    /// Removes the first equal pointer and keeps the order of the others. False when absent.
    bool Remove(T item) { return PtrArrayBase::Remove(item); }
    /// Removes the element at an index that is in range.
    void RemoveAt(int index) { PtrArrayBase::RemoveAt(index); }
    /// Removes the last element.
    void RemoveTail() { PtrArrayBase::RemoveTail(); }
    /// Puts an element before all others.
    void Prepend(T item) { PtrArrayBase::Prepend(item); }
    /// Exchanges the elements of two arrays.
    void ExchangeElements(PtrArray &other) { PtrArrayBase::ExchangeElements(other); }
    /// Stores an element at an index; past the end the array becomes longer, with null in between.
    void SetAt(int index, T item) { PtrArrayBase::SetAt(index, item); }
    /// Exchanges two elements. Does nothing unless both indices are in range.
    void Swap(int first, int second) { PtrArrayBase::Swap(first, second); }
};

/// A PtrArray that owns its elements: it deletes them when it ends. Elements that were removed, or
/// that Empty let go of, belong to the caller. `T` points to a class with a virtual destructor.
template <class T> class OwnPtrArray : public PtrArray<T> {
public:
    /// Deletes the elements, the last one first, and skips null ones.
    ~OwnPtrArray() override { DeleteAll(); }
    /// Deletes the elements, the last one first. The array is empty afterwards and can be used
    /// again.
    void DeleteAll() {
        static_assert(std::has_virtual_destructor_v<std::remove_pointer_t<T>>);
        for (int i = this->GetSize() - 1; i >= 0; --i)
            delete this->GetAt(i);
        this->Empty();
    }
};

/// A position in a PtrArray, which it points at and does not own. It sees later changes of the
/// array and is valid as long as the array. A copy begins at position 0, wherever its source was. A
/// walk is
///
///     for (it.Rewind(); it.HasMore(); it.Advance())
///         if (Signal *signal = it.Current()) ...
///
/// since elements may be null.
template <class T> class Iterator {
public:
    /// An iterator at position 0. A null array is one without elements.
    Iterator(PtrArray<T> const *walked = nullptr) : array(walked), position(0) {}
    /// An iterator over the same array, at position 0.
    Iterator(Iterator const &other) : array(other.array), position(0) {}
    /// Leaves the array alone.
    virtual ~Iterator() = default;
    /// Goes to position 0 of the other iterator's array. Assigning an iterator to itself changes
    /// nothing.
    Iterator &operator=(Iterator const &other) {
        if (this != &other) {
            array = other.array;
            position = 0;
        }
        return *this;
    }

    /// Goes to position 0.
    void Rewind() { position = 0; }
    /// Whether there is an element at the position, which may be null.
    bool HasMore() const { return array && position < array->GetSize(); }
    /// The element at the position; null if it is null or past the end.
    T Current() const { return array ? array->GetAt(position) : nullptr; }
    /// Goes one position further.
    void Advance() { ++position; }
    /// The array that is walked, null if there is none.
    PtrArray<T> const *GetArray() const { return array; }

private:
    PtrArray<T> const *array;
    int position;
};

/// Calls `act` with each element that is not null, in order. The array may grow meanwhile; what is
/// added is visited, too.
template <class T, class Act> void ForEach(PtrArray<T> const &array, Act act) {
    for (int i = 0; i < array.GetSize(); ++i)
        if (T const item = array.GetAt(i))
            act(item);
}
/// The same over the whole array of an iterator, whatever its position.
template <class T, class Act> void ForEach(Iterator<T> walk, Act act) {
    if (PtrArray<T> const *const array = walk.GetArray())
        ForEach(*array, act);
}

} // namespace Vesk_Hdl
