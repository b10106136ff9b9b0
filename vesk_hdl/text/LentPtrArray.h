#pragma once

#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// A PtrArray whose elements stand in memory of its owner, which outlives it, as long as they find
/// room there: no allocation for the few that nearly every array of a design has.
template <class T> class LentPtrArray : public PtrArray<T> {
public:
    /// What Borrow wants for so many elements.
    static constexpr std::size_t BytesFor(int count) { return PtrArrayBase::BytesFor(count); }
    /// Before the first element. The memory is aligned as a pointer is.
    void Borrow(void *memory, int count) { PtrArrayBase::Borrow(memory, count); }
};

/// The same with the memory at hand, for COUNT elements.
template <class T, int COUNT> class InlinePtrArray : public LentPtrArray<T> {
public:
    InlinePtrArray() { this->Borrow(room, COUNT); }

private:
    alignas(void *) char room[LentPtrArray<T>::BytesFor(COUNT)];
};

} // namespace Vesk_Hdl
