// What all classes of signals share: connections, the constant and the names to be declared.

#include "vesk_hdl/netlist/Signal.h"

#include <utility>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/SignalRecord.h"

namespace Vesk_Hdl {

using Basis::StringBase;

Signal::Signal() : record(std::make_unique<Record>()) { SetObjectType(OBJECT_SIGNAL); }
Signal::Signal(char const *name) : record(std::make_unique<Record>()) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_SIGNAL);
}

Signal::~Signal() = default;

Object::ObjectType Signal::GetObjectType() const { return GetStoredObjectType(); }
void Signal::AcceptObject(ObjectVisitor &visitor) { visitor.VisitSignal(this); }
void Signal::SetName(char const *name) { Object::SetName(name); }

/// For a slice that takes the address of a bus: it gets the name and the lists of `made`.
Signal::Signal(Signal &&made) noexcept : Object(made), record(std::move(made.record)) {}

/// A pin that was never on a signal is not searched: with nets of a hundred thousand pins that is
/// nearly every connection.
void Signal::Connect(Pin *pin) {
    if (!pin || (pin->MayBeListed() && record->Contains(record->pins, pin)))
        return;
    record->Append(record->pins, pin);
    pin->SetListedSignal(this);
}

void Signal::Connect(Signal *other) {
    if (other && !record->Contains(record->signals, other))
        record->Append(record->signals, other);
}

void Signal::Disconnect(Pin *pin) {
    if (!pin)
        return;
    record->Remove(record->pins, pin);
    pin->Disconnect();
}

void Signal::Disconnect(Signal *other) { record->Remove(record->signals, other); }

void Signal::DisconnectAll() {
    ForEach(record->pins, [](Pin *pin) { pin->Disconnect(); });
    record->pins.Empty();
    record->signals.Empty();
    record->index.reset();
}

void Signal::CloneConnection(Signal *source) {
    DisconnectAll();
    if (!source)
        return;
    ForEach(source->record->pins, [this](Pin *pin) { record->Append(record->pins, pin); });
    ForEach(source->record->signals, [this](Signal *s) { record->Append(record->signals, s); });
    // This clears the signal of all pins, so that they are put on this signal after it.
    source->DisconnectAll();
    ForEach(record->pins, [this](Pin *pin) { pin->SetListedSignal(this); });
}

void Signal::AssignConstantValue(char const *text) { record->constantValue.SetValue(text); }
void Signal::AssignConstantValue(BitVectorValue const &value) { record->constantValue = value; }
BitVectorValue Signal::GetConstantValue() const { return record->constantValue; }
bool Signal::HasConstantValue() const { return !record->constantValue.IsEmpty(); }

bool Signal::HasMultiDriver() const {
    int drivers = 0;
    PtrArray<Pin *> const &pins = record->pins;
    for (int i = 0; i < pins.GetSize() && drivers < 2; ++i)
        if (Pin const *const pin = pins.GetAt(i))
            drivers += pin->GetPolarity() == Polarity::OUTPUT ? 1 : 0;
    return drivers > 1;
}

Iterator<Pin *> Signal::GetPinIterator() const { return Iterator<Pin *>(&record->pins); }

Iterator<Signal *> Signal::GetSignalIterator() const {
    return Iterator<Signal *>(&record->signals);
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
