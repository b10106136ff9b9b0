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

/// What a component shares with its instances: where a pin of a name is, and how pins are sorted.
/// The pins of an instance are copies of the component's in the same order, so that one index and
/// one sorted order serve a million instances.
///
/// The component, each instance and the data of each pin own the family together: an instance
/// answers for its pins when its component is gone.
///
/// Index and orders hold as long as no pin of the family gets another name or polarity. A pin that
/// changes says so (NoteChange), and from then on every question is answered by a walk.
class PinFamily {
public:
    /// How the first `places.size()` pins of a component are sorted. No two of them are equal.
    struct Order {
        std::vector<std::pair<int, int>> swaps; ///< exchanges of places that sort, in this order
        std::vector<int> places;                ///< the sorted place of each pin
    };
    static constexpr int ABSENT = -1;
    static constexpr int UNKNOWN = -2;

    explicit PinFamily(Component *owner) : component(owner) {}
    PinFamily(PinFamily const &) = delete;
    PinFamily &operator=(PinFamily const &) = delete;

    /// The component as it was when the family began: one that is gone must not be used.
    Component *GetComponent() const { return component; }

    /// The component got a pin, its last one. Does not throw: without memory for the index it is
    /// given up.
    void AddPin(PtrArray<Pin *> const &pins) noexcept;
    void NoteChange() { hasChanged.store(true, std::memory_order_relaxed); }
    bool HasChanged() const { return hasChanged.load(std::memory_order_relaxed); }

    /// The place of the first pin of that name among the component's pins, or ABSENT. UNKNOWN if
    /// only a walk can say.
    int Find(std::string_view name) const;
    /// How these pins of an instance, which nobody sorted yet, are sorted. The order lives as long
    /// as the family. Null if the pins have to be sorted for themselves.
    Order const *GetOrder(PtrArray<Pin *> const &pins);

private:
    friend class PinFamilyPtr;
    static constexpr int MIN_INDEXED = 16; ///< a walk over fewer pins is as fast

    void Index(PtrArray<Pin *> const &pins, int place);

    Component *const component;
    std::unique_ptr<TextIndex> index; ///< from a name to a place; null while there are few pins
    /// By the number of pins: instances that are older than a pin of the component go without it.
    /// Null for pins of which some are equal.
    std::map<int, std::unique_ptr<Order>> orders;
    std::atomic<bool> hasChanged{false};
    std::atomic<unsigned int> owners{0};
};

/// One of the owners of a family, or of none.
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

/// The one order of pins: by polarity, then by name.
void SortPins(PtrArray<Pin *> &pins);

} // namespace Vesk_Hdl
