// Pins of all three classes.

#include "vesk_hdl/netlist/Pin.h"

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/netlist/storage/ObjectRecord.h"

namespace Vesk_Hdl {

// All but the signal is in the record that a pin shares with its copies: the pin of an instance is
// a copy of the component's and mostly stays one.

using Basis::StringBase;

Pin::Pin(char const *name, Polarity const &polarity) : signal(nullptr) {
    BeginPin(name, polarity.GetValue());
}

Pin::Pin(Pin const &other) : Object(other), AttributeHolder(other), signal(other.GetSignal()) {}

Pin::~Pin() = default;

Object::ObjectType Pin::GetObjectType() const { return OBJECT_PIN; }
void Pin::AcceptObject(ObjectVisitor &visitor) { visitor.VisitPin(this); }
void Pin::SetName(char const *name) { Object::SetName(name); }

Pin &Pin::operator=(Pin const &other) {
    if (this == &other)
        return *this;
    AttributeHolder::operator=(other);
    Share(other);
    Connect(other.GetSignal());
    return *this;
}

/// The mark of a pin that is on no signal but was on one: some signal may still list it. A pin that
/// is null was never on one, and Signal::Connect need not search. The address is compared and never
/// read.
Signal *Pin::Former() {
    alignas(Signal) static char place;
    return reinterpret_cast<Signal *>(&place);
}

/// The signal is stored and not read: a copied pin may name one that was removed since.
void Pin::Connect(Signal *newSignal) {
    if (newSignal)
        signal = newSignal;
    else
        Disconnect();
}

void Pin::Disconnect() {
    if (signal)
        signal = Former();
}

void Pin::Enter(PinFamilyPtr const &family) { OwnPinRecord().family = family; }

Signal *Pin::GetSignal() const { return signal == Former() ? nullptr : signal; }

void Pin::SetPolarity(Polarity const &polarity) {
    GetPinRecord().NoteChange(); // the sorted orders of the family are by polarity
    OwnPinRecord().polarity = polarity.GetValue();
}

Polarity Pin::GetPolarity() const { return GetPinRecord().polarity; }
StringBase<char> Pin::GetPolarityName() const { return GetPolarity().GetValueName(); }
void Pin::SetDefaultValue(BitVectorValue const &value) { OwnPinRecord().defaultValue = value; }
void Pin::SetDefaultValue(char const *text) { SetDefaultValue(BitVectorValue(text)); }
BitVectorValue Pin::GetDefaultValue() const { return GetPinRecord().defaultValue; }

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

} // namespace Vesk_Hdl
