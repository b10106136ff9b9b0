// What a component and its instances share, see the header.

#include "vesk_hdl/netlist/storage/PinFamily.h"

#include <cassert>
#include <cstdint>
#include <new>
#include <unordered_map>

#include "vesk_hdl/netlist/NaturalOrder.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/text/basis/Counting.h"

namespace Vesk_Hdl {

namespace {

/// Whether neither pin comes before the other.
bool AreEqualInOrder(Pin const &a, Pin const &b) {
    return a.GetPolarity() == b.GetPolarity() &&
           NaturalCompare(a.GetNameRef(), b.GetNameRef()) == 0;
}

/// The sorted order of pins. Null if two of them are equal: then several orders are possible, and
/// which one a sort gives depends on the order that it begins with, so that each instance has to
/// sort its own.
std::unique_ptr<PinFamily::Order> MakeOrder(PtrArray<Pin *> const &pins) {
    PtrArray<Pin *> now;
    PtrArray<Pin *> sorted;
    std::unordered_map<Pin const *, int> places; // the index of each pin in `now`
    for (int i = 0; i < pins.GetSize(); ++i) {
        now.Add(pins.GetAt(i));
        sorted.Add(pins.GetAt(i));
        places[pins.GetAt(i)] = i;
    }
    SortPins(sorted);
    for (int i = 1; i < sorted.GetSize(); ++i)
        if (AreEqualInOrder(*sorted.GetAt(i - 1), *sorted.GetAt(i)))
            return nullptr;
    auto order = std::make_unique<PinFamily::Order>();
    order->places.resize(places.size());
    for (int i = 0; i < sorted.GetSize(); ++i)
        order->places[static_cast<std::size_t>(places[sorted.GetAt(i)])] = i;
    // Puts each pin where it belongs by one exchange, and records the exchange.
    for (int i = 0; i < sorted.GetSize(); ++i) {
        Pin const *const other = now.GetAt(i);
        if (other == sorted.GetAt(i))
            continue;
        int const place = places[sorted.GetAt(i)];
        order->swaps.emplace_back(i, place);
        now.Swap(i, place);
        places[other] = place;
    }
    return order;
}

} // namespace

void SortPins(PtrArray<Pin *> &pins) {
    SortNaturally(pins, [](Pin const *pin) { return pin->GetPolarity(); });
}

void PinFamily::AddPin(PtrArray<Pin *> const &pins) noexcept {
    int const size = pins.GetSize();
    if (size < MIN_INDEXED)
        return;
    try {
        int place = size - 1; // the earlier pins are in the index already
        if (!index) {
            index = std::make_unique<TextIndex>(TextIndex::CASE_IGNORED);
            place = 0;
        }
        for (; place < size; ++place)
            Index(pins, place);
    } catch (std::bad_alloc const &) {
        NoteChange(); // an index that lacks a pin would report it as absent
    }
}

void PinFamily::Index(PtrArray<Pin *> const &pins, int place) {
    Basis::StringBase<char> const &name = pins.GetAt(place)->GetNameRef();
    if (index->Find(name.View()))
        return; // required: the first pin of a name is found
    // NOLINTNEXTLINE(performance-no-int-to-ptr): a small number in the slot of a pointer
    index->Put(name, reinterpret_cast<void *>(static_cast<std::uintptr_t>(place)));
}

int PinFamily::Find(std::string_view name) const {
    if (!index || HasChanged())
        return UNKNOWN;
    TextIndex::Node const *const node = index->Find(name);
    return node ? static_cast<int>(reinterpret_cast<std::uintptr_t>(node->value)) : ABSENT;
}

PinFamily::Order const *PinFamily::GetOrder(PtrArray<Pin *> const &pins) {
    if (HasChanged())
        return nullptr;
    int const size = pins.GetSize();
    auto found = orders.find(size);
    if (found == orders.end())
        found = orders.emplace(size, MakeOrder(pins)).first;
    Order const *const order = found->second.get();
    assert((!order || order->places.size() == static_cast<std::size_t>(size)) &&
           "a sort by this order would move pins past the end");
    return order;
}

void PinFamilyPtr::Join() {
    if (family)
        Basis::Counting::Join(family->owners);
}

PinFamilyPtr::~PinFamilyPtr() {
    if (family && Basis::Counting::Leave(family->owners))
        delete family;
}

} // namespace Vesk_Hdl
