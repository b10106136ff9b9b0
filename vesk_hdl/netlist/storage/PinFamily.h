#pragma once

#include <atomic>
#include <map>
#include <memory>
#include <string_view>
#include <utility>
#include <vector>

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"
#include "vesk_hdl/text/TextIndex.h"

namespace Vesk_Hdl {

/// What a component shares with its instances: the index of pins by name, and the sorted orders of
/// pins. The pins of an instance are copies of the component's pins in the same order, so that one
/// index and one sorted order serve a million instances.
///
/// The component, each instance and the record of each pin own the family together, so that an
/// instance can find and sort its pins after its component is gone.
///
/// Invariant: index and orders hold as long as no pin of the family gets another name or polarity.
/// A pin that changes reports it (NoteChange), and from then on each question is answered by a
/// walk. See docs/architecture.md, "Storage and its invariants".
class PinFamily {
public:
    /// How the first `places.size()` pins of a component are sorted. No two of them are equal, so
    /// that only one order is possible.
    struct Order {
        std::vector<std::pair<int, int>> swaps; ///< exchanges that sort, one after the other
        std::vector<int> places;                ///< the sorted place of each pin
    };
    static constexpr int ABSENT = -1;  ///< no pin has that name
    static constexpr int UNKNOWN = -2; ///< only a walk can answer

    explicit PinFamily(Component *owner) : component(owner) {}
    PinFamily(PinFamily const &) = delete;
    PinFamily &operator=(PinFamily const &) = delete;

    /// The component that began the family. It may be gone: a caller of Instance::GetComponent has
    /// to know.
    Component *GetComponent() const { return component; }

    /// Called when the component got a pin, the last of `pins`. It does not throw: if memory runs
    /// out, the index is given up.
    void AddPin(PtrArray<Pin *> const &pins) noexcept;
    /// Called before a pin gets another name or polarity.
    void NoteChange() { hasChanged.store(true, std::memory_order_relaxed); }
    bool HasChanged() const { return hasChanged.load(std::memory_order_relaxed); }

    /// The place of the first pin of a name among the component's pins, or ABSENT, or UNKNOWN.
    int Find(std::string_view name) const;
    /// The sorted order of the pins of an instance, which are not sorted yet. It is valid as long
    /// as the family. Null if these pins have to be sorted by themselves.
    Order const *GetOrder(PtrArray<Pin *> const &pins);

private:
    friend class PinFamilyPtr;
    static constexpr int MIN_INDEXED = 16; ///< a walk over fewer pins is as fast

    void Index(PtrArray<Pin *> const &pins, int place);

    Component *const component;
    std::unique_ptr<TextIndex> index; ///< from a name to a place; null while there are few pins
    /// The orders by number of pins: an instance that was made before the component got a pin does
    /// not have it. Null for pins of which two are equal in the order.
    std::map<int, std::unique_ptr<Order>> orders;
    std::atomic<bool> hasChanged{false};
    std::atomic<unsigned int> owners{0};
};

/// One owner of a family, or of none. Counting is that of strings, without a lock in a process of
/// one thread; std::shared_ptr would be twice as large in each pin.
class PinFamilyPtr {
public:
    PinFamilyPtr() = default;
    explicit PinFamilyPtr(PinFamily *owned) : family(owned) { Join(); }
    PinFamilyPtr(PinFamilyPtr const &other) : PinFamilyPtr(other.family) {}
    PinFamilyPtr &operator=(PinFamilyPtr const &other) {
        PinFamilyPtr copy(other);
        std::swap(family, copy.family);
        return *this;
    }
    ~PinFamilyPtr();

    PinFamily *operator->() const { return family; }
    explicit operator bool() const { return family != nullptr; }

private:
    void Join();
    PinFamily *family = nullptr;
};

/// Sorts pins by polarity, then by name in natural order.
void SortPins(PtrArray<Pin *> &pins);

} // namespace Vesk_Hdl
