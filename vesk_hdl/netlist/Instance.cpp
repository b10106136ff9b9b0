// The class Instance. A design has far more instances than anything else, so that their pins are
// kept small: see docs/architecture.md, "Storage and its invariants", PinFamily and Object::Record.

#include <cassert>

#include "vesk_hdl/netlist/ComponentRecord.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/PinList.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/text/LentPtrArray.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// Marks pins that were sorted by themselves: where a pin is does not follow from the index of the
/// family.
PinFamily::Order const OWN_ORDER;

/// Appends the pins that are on a port of polarity `portPolarity` and read or drive it: those of
/// polarity `pinPolarity` and bidirectional ones.
void FindOnPorts(PtrArray<Pin *> const &pins, Polarity::Value pinPolarity,
                 Polarity::Value portPolarity, PtrArray<Pin *> &found) {
    ForEach(pins, [&](Pin *pin) {
        Polarity::Value const own = pin->GetPolarity().GetValue();
        Signal const *const signal = pin->GetSignal();
        if (signal && (own == pinPolarity || own == Polarity::BIDIRECTIONAL) &&
            signal->GetPortPolarity() == portPolarity)
            found.Add(pin);
    });
}

/// Memory for a pin of any class, so that all pins of an instance can be in one block.
union PinRoom {
    ScalarPin scalar;
    BusPin bus;
    BusIndexPin index;
};

/// Pin::ClonePin into given memory.
Pin *ClonePinInto(PinRoom *room, Pin const &pin) {
    switch (pin.GetPinType()) {
    case Pin::PIN_BUS:
        return new (room) BusPin(static_cast<BusPin const &>(pin));
    case Pin::PIN_BUS_INDEX:
        return new (room) BusIndexPin(static_cast<BusIndexPin const &>(pin));
    case Pin::PIN_SCALAR:
        break;
    }
    return new (room) ScalarPin(static_cast<ScalarPin const &>(pin));
}

} // namespace

/// The record, the array of pins and the pins themselves are one block of memory: an instance never
/// gets or loses a pin, and with a million instances three allocations each would be felt.
struct Instance::Record {
    static Record *Make(Component *component);
    static void Delete(Record *record);

    Component *GetComponent() const { return family ? family->GetComponent() : nullptr; }
    /// The place of the pin of that name, in the form that FindPin takes.
    int GetPlace(std::string_view name) const;
    void Sort();

    PinFamilyPtr family;                     ///< that of the component; null without a component
    LentPtrArray<Pin *> pins;                ///< not owned: Delete ends the pins
    PinFamily::Order const *order = nullptr; ///< by which the pins are sorted; null if they are not
};

Instance::Record *Instance::Record::Make(Component *component) {
    int const count = component ? component->record->pins.GetSize() : 0;
    auto const size = static_cast<std::size_t>(count);
    std::size_t const arrayBytes = LentPtrArray<Pin *>::BytesFor(count);
    void *const memory = ::operator new(sizeof(Record) + arrayBytes + size * sizeof(PinRoom));
    auto *const made = new (memory) Record;
    if (component)
        made->family = component->record->family;
    if (count == 0)
        return made;
    static_assert(sizeof(Record) % alignof(void *) == 0 && alignof(PinRoom) <= alignof(void *),
                  "the array and the pins follow the record without a gap");
    void *const array = made + 1;
    made->pins.Borrow(array, count);
    auto *room = reinterpret_cast<PinRoom *>(static_cast<char *>(array) + arrayBytes);
    try {
        for (int i = 0; i < count; ++i)
            made->pins.Add(ClonePinInto(room++, *component->record->pins.GetAt(i)));
    } catch (...) { // pins that were made until then are in the array
        Delete(made);
        throw;
    }
    assert(made->pins.GetSize() == count && "the array would outgrow its part of the block");
    return made;
}

void Instance::Record::Delete(Record *record) {
    for (int i = record->pins.GetSize() - 1; i >= 0; --i)
        record->pins.GetAt(i)->~Pin();
    record->~Record();
    ::operator delete(record);
}

int Instance::Record::GetPlace(std::string_view name) const {
    if (!family || order == &OWN_ORDER)
        return PinFamily::UNKNOWN;
    int const place = family->Find(name);
    assert((!order || place < 0 || pins.GetSize() == static_cast<int>(order->places.size())) &&
           "the order is one of another number of pins");
    if (place >= pins.GetSize())
        return PinFamily::ABSENT; // the component got the pin after this instance was made
    return place < 0 || !order ? place : order->places[static_cast<std::size_t>(place)];
}

void Instance::Record::Sort() {
    if (order && order != &OWN_ORDER && !family->HasChanged())
        return; // sorted already; as no two pins are equal, another sort would change nothing
    // The order of the family is one for pins as they were added. Pins in another order, and those
    // of a family in which a pin changed, are sorted by themselves.
    PinFamily::Order const *const found = family && !order ? family->GetOrder(pins) : nullptr;
    if (found)
        for (auto const &[place, other] : found->swaps)
            pins.Swap(place, other);
    else
        SortPins(pins);
    order = found ? found : &OWN_ORDER;
}

Instance::Instance(char const *name, Component *component) : record(nullptr) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_INSTANCE);
    record = Record::Make(component);
}

Instance::~Instance() { Record::Delete(record); }

Object::ObjectType Instance::GetObjectType() const { return GetStoredObjectType(); }
void Instance::AcceptObject(ObjectVisitor &visitor) { visitor.VisitInstance(this); }
void Instance::SetName(char const *name) { Object::SetName(name); }

Component *Instance::GetComponent() const { return record->GetComponent(); }

StringBase<char> Instance::GetComponentName() const {
    Component const *const component = GetComponent();
    return component ? component->GetName() : StringBase<char>();
}

Attribute *Instance::GetComponentAttr(char const *name) const {
    Component const *const component = GetComponent();
    return component ? component->GetAttr(name) : nullptr;
}

Pin *Instance::GetPin(char const *name) const {
    Names::NormalName const normal(name);
    return FindPin(record->pins, normal.View(), record->GetPlace(normal.View()));
}

Iterator<Pin *> Instance::GetPinIterator() const { return Iterator<Pin *>(&record->pins); }

void Instance::SortPinName() {
    if (!record->pins.IsEmpty())
        record->Sort();
}

void Instance::GetOutPortConnectedToInPin(PtrArray<Pin *> &found) const {
    FindOnPorts(record->pins, Polarity::INPUT, Polarity::OUTPUT, found);
}

void Instance::GetInPortConnectedToOutPin(PtrArray<Pin *> &found) const {
    FindOnPorts(record->pins, Polarity::OUTPUT, Polarity::INPUT, found);
}

bool Instance::GetOpenPin(PtrArray<Pin *> &found, bool onlyInputs) const {
    ForEach(record->pins, [&](Pin *pin) {
        if (!pin->GetSignal() && (!onlyInputs || pin->GetPolarity() == Polarity::INPUT))
            found.Add(pin);
    });
    return !found.IsEmpty();
}

} // namespace Vesk_Hdl
