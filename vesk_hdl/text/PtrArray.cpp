#include "vesk_hdl/text/PtrArray.h"

#include <cstdlib>
#include <cstring>
#include <limits>
#include <new>

#include "vesk_hdl/text/IntroSort.h"

namespace Vesk_Hdl {

PtrArrayBase::PtrArrayBase() : block(nullptr) {}

PtrArrayBase::~PtrArrayBase() {
    if (!IsBorrowed())
        std::free(block);
}

void PtrArrayBase::Borrow(void *memory, int count) { block = new (memory) Block{0, ~count}; }

int PtrArrayBase::GetCapacity() const {
    return !block ? 0 : IsBorrowed() ? ~block->capacity : block->capacity;
}

void PtrArrayBase::Reserve(int capacity) {
    if (capacity <= 0)
        throw std::bad_alloc(); // the size would pass what an int can count
    int const size = GetSize();
    bool const wasBorrowed = IsBorrowed();
    void *const memory = std::realloc(wasBorrowed ? nullptr : block, BytesFor(capacity));
    if (!memory)
        throw std::bad_alloc();
    if (wasBorrowed)
        std::memcpy(memory, block, BytesFor(size));
    block = static_cast<Block *>(memory);
    block->size = size;
    block->capacity = capacity;
}

/// 1, 2, 4, 8 and on; 0 when an int cannot count it.
int PtrArrayBase::GrownCapacity() const {
    int const growth = std::max(GetSize(), 1);
    return GetSize() <= std::numeric_limits<int>::max() - growth ? GetSize() + growth : 0;
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
    auto const behind = static_cast<std::size_t>(GetSize() - index - 1);
    std::memmove(Items() + index, Items() + index + 1, behind * sizeof(void *));
    --block->size;
    return true;
}

void PtrArrayBase::RemoveTail() {
    if (!IsEmpty())
        --block->size;
}

void PtrArrayBase::SetAt(int index, void *item) {
    if (index < 0)
        return;
    if (index >= GetSize()) {
        if (index == std::numeric_limits<int>::max())
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
    void *const held = GetAt(first);
    SetAt(first, GetAt(second));
    SetAt(second, held);
}

} // namespace Vesk_Hdl
