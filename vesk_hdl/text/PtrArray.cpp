// The untyped pointer array. Most arrays of a design are empty or short, and some are used as
// queues: see docs/architecture.md, "Storage and its invariants", for the gap and for borrowed
// memory.

#include "vesk_hdl/text/PtrArray.h"

#include <algorithm>
#include <cassert>
#include <cstdlib>
#include <cstring>
#include <new>
#include <utility>

#include "vesk_hdl/text/IntroSort.h"

namespace Vesk_Hdl {

PtrArrayBase::PtrArrayBase() : block(nullptr) {}

PtrArrayBase::~PtrArrayBase() { FreeMemory(); }

/// The mark keeps FreeMemory and Reserve from freeing memory that belongs to the owner.
void PtrArrayBase::Borrow(void *memory, int count) {
    assert(!block && "a block that is replaced here is never freed");
    block = new (memory) Block{0, static_cast<unsigned int>(count) | BORROWED};
}

std::size_t PtrArrayBase::GetGap() const {
    return HasGap() ? reinterpret_cast<std::size_t const *>(block)[-1] : 0;
}

void PtrArrayBase::SetGap(std::size_t places) {
    block->capacity &= ~HAS_GAP;
    if (places == 0)
        return;
    block->capacity |= HAS_GAP;
    reinterpret_cast<std::size_t *>(block)[-1] = places;
}

/// The address that malloc returned: before the gap.
void *PtrArrayBase::GetMemory() const { return reinterpret_cast<void **>(block) - GetGap(); }

void PtrArrayBase::FreeMemory() {
    if (block && !IsBorrowed())
        std::free(GetMemory());
}

/// Moves the head and the first `elements` by some places, towards lower addresses if that is
/// negative. The places that the head leaves become gap, and those that it takes stop being gap;
/// the capacity changes by as many. So neither end of an array costs a move of all elements.
void PtrArrayBase::MoveHead(std::ptrdiff_t places, int elements) {
    auto const gap = static_cast<std::ptrdiff_t>(GetGap()) + places;
    assert(gap >= 0 && !IsBorrowed() && "the head would leave its memory");
    void **const to = reinterpret_cast<void **>(block) + places;
    std::memmove(to, block, BytesFor(elements));
    block = reinterpret_cast<Block *>(to);
    block->capacity = static_cast<unsigned int>(GetCapacity() - static_cast<int>(places));
    SetGap(static_cast<std::size_t>(gap));
}

/// Moves the elements into memory for `capacity` elements after a gap of `gap` places. If the
/// present gap is at least as large as the array, the elements move down into it instead: an array
/// that is filled at one end and emptied at the other then never grows.
void PtrArrayBase::Reserve(int capacity, int gap) {
    if (capacity <= 0 || capacity > MAX_CAPACITY || gap > MAX_CAPACITY)
        throw std::bad_alloc(); // more elements than a block can count
    int const size = GetSize();
    std::size_t const free = GetGap();
    if (gap == 0 && free > 0 && free >= static_cast<std::size_t>(size) &&
        free + static_cast<std::size_t>(GetCapacity()) >= static_cast<std::size_t>(capacity)) {
        MoveHead(-static_cast<std::ptrdiff_t>(free), size);
        return;
    }
    std::size_t const bytes = static_cast<std::size_t>(gap) * sizeof(void *) + BytesFor(capacity);
    // realloc can grow a block without copying it, but only if the block begins at the head.
    bool const inPlace = !IsBorrowed() && free == 0 && gap == 0;
    void *const memory = inPlace ? std::realloc(block, bytes) : std::malloc(bytes);
    if (!memory)
        throw std::bad_alloc();
    auto *const moved = reinterpret_cast<Block *>(static_cast<void **>(memory) + gap);
    if (!inPlace && block) {
        std::memcpy(moved, block, BytesFor(size));
        FreeMemory();
    }
    block = moved;
    *block = {size, static_cast<unsigned int>(capacity)};
    SetGap(static_cast<std::size_t>(gap));
}

/// Double the size: 1, 2, 4, 8 and so on up to the greatest capacity; 0 when the array has that.
int PtrArrayBase::GrownCapacity() const {
    int const size = GetSize();
    return size < MAX_CAPACITY ? std::min(size + std::max(size, 1), MAX_CAPACITY) : 0;
}

void PtrArrayBase::Empty() {
    if (block)
        block->size = 0;
}

void PtrArrayBase::Sort(bool (*compare)(void *, void *, void *), void *context) {
    if (!block)
        return;
    auto less = [compare, context](void *a, void *b) { return compare(a, b, context); };
    IntroSort<void *, decltype(less)>::Sort(Items(), Items() + GetSize(), less);
}

int PtrArrayBase::Add(void *item) {
    int const size = GetSize();
    if (size == GetCapacity())
        Reserve(GrownCapacity());
    Items()[size] = item;
    block->size = size + 1;
    return size;
}

int PtrArrayBase::GetIndex(void *item) const {
    for (int i = 0; i < GetSize(); ++i)
        if (Items()[i] == item)
            return i;
    return -1;
}

bool PtrArrayBase::Remove(void *item) {
    int const index = GetIndex(item);
    if (index < 0)
        return false;
    RemoveAt(index);
    return true;
}

/// The shorter side moves. In borrowed memory there can be no gap, and the later elements move.
void PtrArrayBase::RemoveAt(int index) {
    assert(index >= 0 && index < GetSize() && "elements outside the array would move");
    int const after = GetSize() - index - 1;
    if (index < after && !IsBorrowed())
        MoveHead(1, index);
    else
        std::memmove(Items() + index, Items() + index + 1,
                     static_cast<std::size_t>(after) * sizeof(void *));
    --block->size;
}

void PtrArrayBase::RemoveTail() {
    if (!IsEmpty())
        --block->size;
}

/// A new gap is as large as the array, so that the additions that follow do not move it again.
void PtrArrayBase::Prepend(void *item) {
    if (GetGap() == 0)
        Reserve(std::max(GetCapacity(), 1), std::max(GetSize(), 1));
    MoveHead(-1, 0);
    Items()[0] = item;
    ++block->size;
}

void PtrArrayBase::ExchangeElements(PtrArrayBase &other) {
    assert(!IsBorrowed() && !other.IsBorrowed() && "borrowed memory stays with its owner");
    std::swap(block, other.block);
}

void PtrArrayBase::SetAt(int index, void *item) {
    if (index < 0)
        return;
    if (index >= GetSize()) {
        if (index >= MAX_CAPACITY)
            throw std::bad_alloc();
        if (index >= GetCapacity())
            Reserve(std::max(index + 1, GrownCapacity()));
        std::fill(Items() + GetSize(), Items() + index + 1, nullptr);
        block->size = index + 1;
    }
    Items()[index] = item;
}

void PtrArrayBase::Swap(int first, int second) {
    int const size = GetSize();
    if (first < 0 || second < 0 || first >= size || second >= size || first == second)
        return;
    assert(block && "an array of two elements has a block");
    void *const held = GetAt(first);
    SetAt(first, GetAt(second));
    SetAt(second, held);
}

} // namespace Vesk_Hdl
