#include "vesk_hdl/netlist/Pin.h"

#include <cstdint>
#include <optional>
#include <unordered_map>
#include <utility>
#include <vector>

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/NaturalOrder.h"
#include "vesk_hdl/netlist/ObjectRecord.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/text/LentPtrArray.h"
#include "vesk_hdl/text/TextIndex.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

bool IsCalled(Pin const *pin, std::string_view name) {
    return pin && Basis::Ascii::EqualIgnoringCase(pin->GetNameRef().View(), name);
}

/// The first pin of that name.
Pin *FindPin(PtrArray<Pin *> const &pins, std::string_view name) {
    for (int i = 0; i < pins.GetSize(); ++i)
        if (IsCalled(pins.GetAt(i), name))
            return pins.GetAt(i);
    return nullptr;
}

void SortByName(PtrArray<Pin *> &pins) {
    SortNaturally(pins, [](Pin const *pin) { return pin->GetPolarity(); });
}

/// Where the pins of a large component stand, by name, in place of FindPin's walk. It answers as
/// long as no two pins share a name and none was renamed.
class PinPositions {
public:
    static constexpr int FEWEST_PINS = 16;

    void Add(StringBase<char> const &name, int position) {
        isUnique = isUnique && !table.Find(name.View());
        // NOLINTNEXTLINE(performance-no-int-to-ptr): a small number in the slot of a pointer
        void *const value = reinterpret_cast<void *>(static_cast<std::uintptr_t>(position));
        if (isUnique)
            table.Put(name, value);
    }
    bool IsUsable() const { return isUnique && !somePinHasChanged; }
    /// -1 when absent.
    int Find(std::string_view name) const {
        TextIndex::Node const *const node = table.Find(name);
        return node ? static_cast<int>(reinterpret_cast<std::uintptr_t>(node->value)) : -1;
    }

private:
    TextIndex table{TextIndex::CASE_IGNORED};
    bool isUnique = true;
};

std::unique_ptr<Pin> MakePin(char const *name, Polarity const &polarity) {
    std::string_view const text(name ? name : "");
    std::string_view base;
    std::string_view index;
    if (Names::IsBusName(text))
        return std::make_unique<BusPin>(name, polarity);
    if (Names::SplitBusIndexName(text, base, index))
        return std::make_unique<BusIndexPin>(name, polarity);
    return std::make_unique<ScalarPin>(name, polarity);
}

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

} // namespace

Pin::Pin(char const *name, Polarity const &polarity) : signal(nullptr) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_PIN);
    Object::Own().polarity = static_cast<short>(polarity.GetValue());
}

Pin::Pin(Pin const &other) : Object(other), AttributeHolder(other), signal(other.GetSignal()) {
    if (signal)
        signal->NoteTie();
}

Pin::~Pin() = default;

Object::ObjectType Pin::GetObjectType() const { return OBJECT_PIN; }
void Pin::AcceptObject(ObjectVisitor &visitor) { visitor.VisitPin(this); }
void Pin::SetName(char const *name) { Object::SetName(name); }

Pin &Pin::operator=(Pin const &other) {
    if (this == &other)
        return *this;
    if (Object::record != other.Object::record)
        Object::record->NoteChange();
    AttributeHolder::operator=(other);
    Share(other);
    Connect(other.GetSignal());
    return *this;
}

/// What a pin points at that is on no signal but was on one. It is compared and never looked into.
Signal *Pin::Former() {
    alignas(Signal) static char place;
    return reinterpret_cast<Signal *>(&place);
}

void Pin::Connect(Signal *newSignal) {
    if (!newSignal)
        return Disconnect();
    signal = newSignal;
    signal->NoteTie();
}

void Pin::Disconnect() {
    if (signal)
        signal = Former();
}

Signal *Pin::GetSignal() const { return signal == Former() ? nullptr : signal; }
void Pin::SetPolarity(Polarity const &polarity) {
    Object::record->NoteChange();
    Object::Own().polarity = static_cast<short>(polarity.GetValue());
}
Polarity Pin::GetPolarity() const { return static_cast<Polarity::Value>(Object::record->polarity); }
StringBase<char> Pin::GetPolarityName() const { return GetPolarity().GetValueName(); }
void Pin::SetDefaultValue(BitVectorValue const &value) { OwnRare().defaultValue = value; }
void Pin::SetDefaultValue(char const *text) { SetDefaultValue(BitVectorValue(text)); }
BitVectorValue Pin::GetDefaultValue() const { return Object::record->GetDefaultValue(); }

ScalarPin::ScalarPin(char const *name, Polarity const &polarity) : Pin(name, polarity) {}
ScalarPin::ScalarPin(ScalarPin const &other) = default;
ScalarPin &ScalarPin::operator=(ScalarPin const &other) = default;
Pin::PinType ScalarPin::GetPinType() const { return PIN_SCALAR; }
Pin *ScalarPin::ClonePin() const { return new ScalarPin(*this); }
void ScalarPin::AcceptPin(PinVisitor &visitor) { visitor.VisitScalarPin(this); }
StringBase<char> ScalarPin::GetBaseName() const { return GetNameRef(); }

BusPin::BusPin(char const *name, Polarity const &polarity) : Pin(name, polarity) {}
BusPin::BusPin(BusPin const &other) = default;
BusPin &BusPin::operator=(BusPin const &other) = default;
Pin::PinType BusPin::GetPinType() const { return PIN_BUS; }
Pin *BusPin::ClonePin() const { return new BusPin(*this); }
void BusPin::AcceptPin(PinVisitor &visitor) { visitor.VisitBusPin(this); }
StringBase<char> BusPin::GetBaseName() const { return Object::GetBaseName(GetNameRef()); }

void BusPin::GetIndex(StringBase<char> &left, StringBase<char> &right) const {
    StringBase<char> base;
    Bus::ParseBusName(GetNameRef(), base, left, right);
}

bool BusPin::IsDownTo() const {
    Names::Bounds bounds;
    return Names::ParseBounds(GetNameRef().View(), bounds) && bounds.IsDownTo();
}

int BusPin::GetWidth() const { return Names::BusWidth(GetNameRef().View()); }

BusIndexPin::BusIndexPin(char const *name, Polarity const &polarity) : Pin(name, polarity) {}
BusIndexPin::BusIndexPin(BusIndexPin const &other) = default;
BusIndexPin &BusIndexPin::operator=(BusIndexPin const &other) = default;
Pin::PinType BusIndexPin::GetPinType() const { return PIN_BUS_INDEX; }
Pin *BusIndexPin::ClonePin() const { return new BusIndexPin(*this); }
void BusIndexPin::AcceptPin(PinVisitor &visitor) { visitor.VisitBusIndexPin(this); }
StringBase<char> BusIndexPin::GetBaseName() const { return Object::GetBaseName(GetNameRef()); }

StringBase<char> BusIndexPin::GetIndex() const {
    StringBase<char> base;
    StringBase<char> index;
    BusIndex::ParseBusIndexName(GetNameRef(), base, index);
    return index;
}

PinVisitor::~PinVisitor() = default;

struct Component::Record {
    /// How the pins are sorted.
    struct Order {
        bool isUnique = true; ///< no two pins are equal in it, so that it is the only one
        std::vector<std::pair<int, int>> swaps; ///< exchanges of places, one after the other
    };

    OwnPtrArray<Pin *> pins;
    std::unique_ptr<PinPositions> positions; ///< null while there are few pins
    std::optional<Order> order;              ///< none until asked for, and after a change

    Order const &GetOrder() {
        if (order)
            return *order;
        PtrArray<Pin *> now;
        PtrArray<Pin *> sorted;
        for (PtrArray<Pin *> *const copy : {&now, &sorted})
            ForEach(pins, [copy](Pin *pin) { copy->Add(pin); });
        SortByName(sorted);
        std::unordered_map<Pin const *, int> places; // in `now`
        for (int i = 0; i < now.GetSize(); ++i)
            places[now.GetAt(i)] = i;
        Order found;
        for (int i = 0; i < now.GetSize(); ++i) {
            Pin *const pin = sorted.GetAt(i);
            Pin const *const last = sorted.GetAt(i - 1);
            if (last && last->GetPolarity() == pin->GetPolarity() &&
                NaturalCompare(last->GetNameRef(), pin->GetNameRef()) == 0)
                found.isUnique = false;
            if (Pin const *const other = now.GetAt(i); other != pin) {
                int const place = places[pin];
                found.swaps.emplace_back(i, place);
                now.Swap(i, place);
                places[other] = place;
            }
        }
        return order.emplace(std::move(found));
    }

    void AddPosition() {
        int const size = pins.GetSize();
        if (size < PinPositions::FEWEST_PINS)
            return;
        int position = size - 1;
        if (!positions) {
            positions = std::make_unique<PinPositions>();
            position = 0;
        }
        for (; position < size; ++position)
            positions->Add(pins.GetAt(position)->GetNameRef(), position);
    }

    /// The place of a pin if the index knows it, else -1.
    int GetPosition(std::string_view name) const {
        return positions && positions->IsUsable() ? positions->Find(name) : -1;
    }
};

Component::Component(char const *name) : record(std::make_unique<Record>()) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_COMPONENT);
}

Component::~Component() = default;

Object::ObjectType Component::GetObjectType() const { return GetStoredObjectType(); }
void Component::AcceptObject(ObjectVisitor &visitor) { visitor.VisitComponent(this); }
void Component::SetName(char const *name) { Object::SetName(name); }

void Component::AddPin(char const *name, Polarity const &polarity,
                       BitVectorValue const &defaultValue) {
    std::unique_ptr<Pin> pin = MakePin(name, polarity);
    if (!defaultValue.IsEmpty())
        pin->SetDefaultValue(defaultValue);
    record->pins.Add(pin.get());
    pin.release();
    record->order.reset();
    record->AddPosition();
}

void Component::AddPin(char const *name, Polarity const &polarity, char const *defaultValue) {
    AddPin(name, polarity, BitVectorValue(defaultValue));
}

void Component::AddPin(Pin const &pin) {
    AddPin(pin.GetName(), pin.GetPolarity(), pin.GetDefaultValue());
}

Pin *Component::GetPin(char const *name) const {
    Names::NormalName const normal(name);
    bool const isIndexed = record->positions && record->positions->IsUsable();
    return isIndexed ? record->pins.GetAt(record->GetPosition(normal.View()))
                     : FindPin(record->pins, normal.View());
}

Iterator<Pin *> Component::GetPinIterator() const { return Iterator<Pin *>(&record->pins); }

/// An instance's pins stand in one block with this record, behind it, each in a room of its own:
/// nobody adds or removes one.
struct Instance::Record {
    static Record *Make(Component *component);
    static void Delete(Record *record);

    explicit Record(Component *placed) : component(placed) {}

    /// As SortByName, by what sorts the component's pins, found but once. False, and nothing is
    /// done, if it does not hold for these pins.
    bool SortAsComponent();

    Component *const component;
    LentPtrArray<Pin *> pins;
    bool isSorted = false;
};

namespace {

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

Instance::Record *Instance::Record::Make(Component *component) {
    int const count = component ? component->record->pins.GetSize() : 0;
    auto const size = static_cast<std::size_t>(count);
    std::size_t const arrayBytes = LentPtrArray<Pin *>::BytesFor(count);
    void *const memory = ::operator new(sizeof(Record) + arrayBytes + size * sizeof(PinRoom));
    auto *const made = new (memory) Record(component);
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

Instance::Instance(char const *name, Component *component) : record(nullptr) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_INSTANCE);
    record = Record::Make(component);
}

Instance::~Instance() { Record::Delete(record); }

Object::ObjectType Instance::GetObjectType() const { return GetStoredObjectType(); }
void Instance::AcceptObject(ObjectVisitor &visitor) { visitor.VisitInstance(this); }
void Instance::SetName(char const *name) { Object::SetName(name); }

Component *Instance::GetComponent() const { return record->component; }

StringBase<char> Instance::GetComponentName() const {
    return record->component ? record->component->GetName() : StringBase<char>();
}

Attribute *Instance::GetComponentAttr(char const *name) const {
    return record->component ? record->component->GetAttr(name) : nullptr;
}

/// A pin stands where the component's does until somebody sorts.
Pin *Instance::GetPin(char const *name) const {
    Names::NormalName const normal(name);
    Component const *const component = record->component;
    Pin *const guess =
        component ? record->pins.GetAt(component->record->GetPosition(normal.View())) : nullptr;
    return IsCalled(guess, normal.View()) ? guess : FindPin(record->pins, normal.View());
}

Iterator<Pin *> Instance::GetPinIterator() const { return Iterator<Pin *>(&record->pins); }

bool Instance::Record::SortAsComponent() {
    if (somePinHasChanged || pins.GetSize() != component->record->pins.GetSize())
        return false;
    if (isSorted)
        return true;
    Component::Record::Order const &order = component->record->GetOrder();
    if (!order.isUnique)
        return false;
    for (auto const &[place, other] : order.swaps)
        pins.Swap(place, other);
    isSorted = true;
    return true;
}

void Instance::SortPinName() {
    if (!record->pins.IsEmpty() && !record->SortAsComponent())
        SortByName(record->pins);
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
