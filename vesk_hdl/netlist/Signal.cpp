// What all classes of signals share: connections, the constant and the names to be declared.

#include "vesk_hdl/netlist/Signal.h"

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/SignalRecord.h"
#include "vesk_hdl/netlist/storage/LazyRecord.h"

namespace Vesk_Hdl {

using Basis::StringBase;

Signal::Signal() : record(nullptr) { SetObjectType(OBJECT_SIGNAL); }
Signal::Signal(char const *name) : record(nullptr) {
    SetNormalizedName(name); // first: a kind without a name would have to be moved to it
    SetObjectType(OBJECT_SIGNAL);
}

Signal::~Signal() { delete Find(); }

Object::ObjectType Signal::GetObjectType() const { return GetStoredObjectType(); }
void Signal::AcceptObject(ObjectVisitor &visitor) { visitor.VisitSignal(this); }
void Signal::SetName(char const *name) { Object::SetName(name); }

/// For a slice that takes the address of a bus: it gets the name and the lists of `made`.
Signal::Signal(Signal &&made) noexcept : Object(made), record(made.record.exchange(nullptr)) {}

Signal::Record *Signal::Find() const { return record.load(std::memory_order_acquire); }
Signal::Record &Signal::Own() const { return OwnLazily(record); }

/// A pin that was never on a signal is not searched: with nets of a hundred thousand pins that is
/// nearly every connection.
void Signal::Connect(Pin *pin) {
    if (!pin)
        return;
    Record &own = Own();
    if (pin->MayBeListed() && own.Contains(own.pins, pin))
        return;
    own.Append(own.pins, pin);
    pin->SetListedSignal(this);
}

void Signal::Connect(Signal *other) {
    if (!other)
        return;
    Record &own = Own();
    if (!own.Contains(own.signals, other))
        own.Append(own.signals, other);
}

void Signal::Disconnect(Pin *pin) {
    if (!pin)
        return;
    if (Record *const own = Find())
        own->Remove(own->pins, pin);
    pin->Disconnect();
}

void Signal::Disconnect(Signal *other) {
    if (Record *const own = Find())
        own->Remove(own->signals, other);
}

void Signal::DisconnectAll() {
    Record *const own = Find();
    if (!own)
        return;
    ForEach(own->pins, [](Pin *pin) { pin->Disconnect(); });
    own->pins.Empty();
    own->signals.Empty();
    own->index.reset();
}

void Signal::CloneConnection(Signal *source) {
    DisconnectAll();
    Record *const others = source ? source->Find() : nullptr;
    if (!others)
        return;
    Record &own = Own();
    ForEach(others->pins, [&own](Pin *pin) { own.Append(own.pins, pin); });
    ForEach(others->signals, [&own](Signal *signal) { own.Append(own.signals, signal); });
    // This clears the signal of all pins, so that they are put on this signal after it.
    source->DisconnectAll();
    ForEach(own.pins, [this](Pin *pin) { pin->SetListedSignal(this); });
}

void Signal::AssignConstantValue(char const *text) { Own().constantValue.SetValue(text); }
void Signal::AssignConstantValue(BitVectorValue const &value) { Own().constantValue = value; }
BitVectorValue Signal::GetConstantValue() const {
    Record const *const own = Find();
    return own ? own->constantValue : BitVectorValue();
}
bool Signal::HasConstantValue() const {
    Record const *const own = Find();
    return own && !own->constantValue.IsEmpty();
}

bool Signal::HasMultiDriver() const {
    Record const *const own = Find();
    int drivers = 0;
    for (int i = 0; own && i < own->pins.GetSize() && drivers < 2; ++i)
        if (Pin const *const pin = own->pins.GetAt(i))
            drivers += pin->GetPolarity() == Polarity::OUTPUT ? 1 : 0;
    return drivers > 1;
}

Iterator<Pin *> Signal::GetPinIterator() const { return Iterator<Pin *>(&Own().pins); }
Iterator<Signal *> Signal::GetSignalIterator() const { return Iterator<Signal *>(&Own().signals); }

bool Signal::HasPins() const {
    Record const *const own = Find();
    return own && !own->pins.IsEmpty();
}

bool Signal::HasAssignments() const {
    Record const *const own = Find();
    return own && !own->signals.IsEmpty();
}

void Signal::GetBaseName(StringSet &names) const {
    auto const addIfAbsent = [&names](StringBase<char> const &name) {
        if (!names.IContains(name.View()))
            names.Add(name);
    };
    auto const *const compound = As<CompoundBus>(this);
    if (!compound)
        return addIfAbsent(Object::GetBaseName(GetNameRef()));
    addIfAbsent(GetNameRef());
    ForEach(compound->GetBusMemberIterator(), [&addIfAbsent](Signal const *member) {
        addIfAbsent(Object::GetBaseName(member->GetNameRef()));
    });
}

SignalVisitor::~SignalVisitor() = default;

} // namespace Vesk_Hdl
