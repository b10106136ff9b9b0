#pragma once

#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// A PtrArray whose first elements are in memory of its owner, which must outlive the array. Nearly
/// every array of a design has only a few elements, and these then need no allocation. An array
/// that outgrows that memory moves to memory of its own.
template <class T> class LentPtrArray : public PtrArray<T> {
public:
    /// The bytes that Borrow needs for so many elements.
    static constexpr std::size_t BytesFor(int count) { return PtrArrayBase::BytesFor(count); }
    /// Called before the first element is added. The memory is aligned as a pointer is.
    void Borrow(void *memory, int count) { PtrArrayBase::Borrow(memory, count); }
};

/// The same with memory for COUNT elements inside the object.
template <class T, int COUNT> class InlinePtrArray : public LentPtrArray<T> {
public:
    InlinePtrArray() { this->Borrow(room, COUNT); }

private:
    alignas(void *) char room[LentPtrArray<T>::BytesFor(COUNT)];
};

} // namespace Vesk_Hdl
