#include "vesk_hdl/netlist/ComponentRecord.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/PinList.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/text/LentPtrArray.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// For pins that were sorted by themselves: their places tell nothing about those of the family.
PinFamily::Order const OWN_ORDER;

/// Appends the pins of one of two polarities that are on a port of another.
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

/// Memory for a pin of any class.
union PinRoom {
    ScalarPin scalar;
    BusPin bus;
    BusIndexPin index;
};

/// Pin::ClonePin into a room.
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

/// The record and the pins, each in a room of its own, are one memory block: an instance never gets
/// or loses a pin.
struct Instance::Record {
    static Record *Make(Component *component);
    static void Delete(Record *record);

    Component *GetComponent() const { return family ? family->GetComponent() : nullptr; }
    /// Where the family's index has a pin of that name, as FindPin takes it.
    int GetPlace(std::string_view name) const;
    void Sort();

    PinFamilyPtr family; ///< of the component; none without a component
    LentPtrArray<Pin *> pins;
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
    void *const array = made + 1;
    made->pins.Borrow(array, count);
    auto *room = reinterpret_cast<PinRoom *>(static_cast<char *>(array) + arrayBytes);
    try {
        for (int i = 0; i < count; ++i)
            made->pins.Add(ClonePinInto(room++, *component->record->pins.GetAt(i)));
    } catch (...) {
        Delete(made);
        throw;
    }
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
    if (place >= pins.GetSize())
        return PinFamily::ABSENT; // the component got the pin after this instance was made
    return place < 0 || !order ? place : order->places[static_cast<std::size_t>(place)];
}

void Instance::Record::Sort() {
    if (order && order != &OWN_ORDER && !family->HasChanged())
        return; // sorted already, and no two pins are equal
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
