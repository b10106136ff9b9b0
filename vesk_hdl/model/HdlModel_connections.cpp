// Model's connections. Netlists arrive as flat text, a signal and a pin at a time, and signals need
// not be declared first: a name that is used makes the signals that it refers to.

#include "vesk_hdl/model/HdlModel.h"

#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/NetlistEdit.h"
#include "vesk_hdl/text/basis/OrEmpty.h"

#define RAISE(...) VESK_HDL_RAISE("HdlModel", __VA_ARGS__)

using namespace Vesk_Hdl;
using Basis::OrEmpty;
using Text = Basis::StringBase<char>;

namespace {

/// Builds the name of the signal that ties a pin to a constant. Its form follows from the class of
/// the pin, so that the signal is as wide as the pin.
class PinConstantSignalVisitor : public PinVisitor {
public:
    explicit PinConstantSignalVisitor(char const *instance) : instanceName(instance) {}

    void VisitScalarPin(ScalarPin *pin) override { SetName(*pin); }
    void VisitBusPin(BusPin *pin) override {
        Text left;
        Text right;
        pin->GetIndex(left, right);
        SetName(*pin);
        signalName = Names::BusName(signalName.View(), left.View(), right.View());
    }
    void VisitBusIndexPin(BusIndexPin *pin) override {
        SetName(*pin);
        signalName = Names::BitName(signalName.View(), pin->GetIndex().View());
    }

    Text const &GetSignalName() const { return signalName; }

private:
    void SetName(Pin const &pin) {
        signalName = Names::PinSignalBase(instanceName.View(), pin.GetBaseName().View(),
                                          Names::CONSTANT_TAG);
    }

    Text instanceName;
    Text signalName;
};

} // namespace

namespace Vesk_Hdl {

/// Null for a bit of an unknown bus: the width of a bus does not follow from one of its bits.
/// Required: the forms are tested on the name as it was typed, so that "a[3]" makes a single net
/// that is called a(3).
Signal *Model::GetOrCreateSignal(char const *name) {
    if (Signal *const signal = GetSignal(name))
        return signal;
    Text const typed(name);
    if (BusIndex::IsBusIndexName(typed))
        return CreateAndAddBusIndexSignal(name);
    if (Bus::IsBusName(typed))
        return CreateAndAddBusSliceSignal(name);
    if (CompoundBus::IsCompoundBusName(typed))
        return CreateAndAddCompundSignal(name);
    AddSignal(OrEmpty(name));
    return GetSignal(name);
}

Signal *Model::CreateAndAddBusIndexSignal(char const *name) {
    Bus *const parent = GetNetlist()->GetParentBus(name);
    if (!parent)
        return nullptr;
    auto *const index = new BusIndex(name, parent);
    GetNetlist()->Add(index);
    SetModifiedFlag(true);
    return index;
}

/// Required: a range that is narrower than the bus makes a slice, also if it is outside the bus.
/// One that is as wide or wider replaces the bus, and the bus becomes a slice of it.
Signal *Model::CreateAndAddBusSliceSignal(char const *name) {
    Netlist &netlist = *GetNetlist();
    Bus *const bus = netlist.GetParentBus(name);
    Signal *signal = nullptr;
    if (!bus) {
        AddSignal(name);
        signal = netlist.GetSignal(name);
    } else if (bus->GetWidth() > Names::BusWidth(name)) {
        signal = new BusSlice(name, bus);
        netlist.Add(signal);
    } else {
        signal = NetlistEdit(netlist).Widen(bus, name);
    }
    SetModifiedFlag(true);
    return signal;
}

Signal *Model::CreateAndAddCompundSignal(char const *name) {
    Text normal(name);
    Object::NormalizeName(normal);
    StringArray memberNames;
    CompoundBus::ParseCompoundBusName(normal, memberNames, false);

    // A later member may widen the bus of an earlier one. The pointer in this array is then one to
    // the slice at the address of that bus, see docs/architecture.md, "Widening".
    PtrArray<Signal *> members;
    for (int i = 0; i < memberNames.GetSize(); ++i) {
        Text const &member = memberNames.At(i);
        Signal *signal = GetSignal(member);
        if (!signal && BusIndex::IsBusIndexName(member))
            signal = CreateAndAddBusIndexSignal(member);
        else if (!signal && Bus::IsBusName(member))
            signal = CreateAndAddBusSliceSignal(member);
        if (!signal) { // required: also a bit of an unknown bus, which is refused outside a
                       // compound
            AddSignal(member);
            signal = GetSignal(member);
        }
        members.Add(signal);
    }
    auto *const compound = new CompoundBus(normal, members);
    GetNetlist()->Add(compound);
    SetModifiedFlag(true);
    return compound;
}

// The private operations below are part of the interface of the class. They refuse nothing: a null
// gives false.

bool Model::Connect(Signal *signal, Pin *pin) {
    if (!signal || !pin)
        return false;
    signal->Connect(pin);
    SetModifiedFlag(true);
    return true;
}

bool Model::Connect(Signal *left, Signal *right) {
    if (!left || !right)
        return false;
    left->Connect(right);
    SetModifiedFlag(true);
    return true;
}

bool Model::AssignConstant(Signal *signal, char const *value) {
    if (!signal)
        return false;
    signal->AssignConstantValue(value);
    SetModifiedFlag(true);
    return true;
}

bool Model::AssignConstant(Pin *pin, char const *value, char const *instanceName) {
    if (!pin)
        return false;
    PinConstantSignalVisitor visitor(instanceName);
    pin->AcceptPin(visitor);
    Text const &signalName = visitor.GetSignalName();
    if (!GetSignal(signalName))
        AddSignal(signalName);
    Signal *const signal = GetSignal(signalName);
    if (!AssignConstant(signal, value))
        return false;
    // Required: one way only. The writers find the constant through the pin, and the passes before
    // a write find no pin through the signal.
    pin->Connect(signal);
    return true;
}

bool Model::ConnectSignalToPin(char const *signalName, char const *instanceName,
                               char const *pinName) {
    Signal *const signal = GetOrCreateSignal(signalName);
    if (!signal)
        RAISE(Messages::SIGNAL_NOT_FOUND, signalName);
    Instance const *const instance = GetInstance(instanceName);
    if (!instance)
        RAISE(Messages::CONNECTED_INSTANCE_NOT_FOUND, instanceName);
    Pin *const pin = instance->GetPin(pinName);
    if (!pin)
        RAISE(Messages::INSTANCE_PIN_NOT_FOUND, instanceName, pinName);
    return Connect(signal, pin);
}

bool Model::ConnectSignals(char const *left, char const *right) {
    // A copy: `right` may be the text of a bus that the signal on the left replaces.
    Text const sourceName(right);
    Signal *const target = GetOrCreateSignal(left);
    if (!target)
        RAISE(Messages::SIGNAL_NOT_FOUND, left);
    Signal *const source = GetOrCreateSignal(sourceName);
    if (!source)
        RAISE(Messages::SIGNAL_NOT_FOUND, sourceName.GetText());
    return Connect(target, source);
}

bool Model::AssignConstantToPin(char const *instanceName, char const *pinName, char const *value) {
    Instance const *const instance = GetInstance(instanceName);
    if (!instance)
        RAISE(Messages::CONNECTED_INSTANCE_NOT_FOUND, instanceName);
    Pin *const pin = instance->GetPin(pinName);
    if (!pin)
        RAISE(Messages::PIN_NOT_FOUND, pinName);
    return AssignConstant(pin, value, instanceName);
}

bool Model::AssignConstantToSignal(char const *signalName, char const *value) {
    Signal *const signal = GetOrCreateSignal(signalName);
    if (!signal)
        RAISE(Messages::SIGNAL_NOT_FOUND, signalName);
    return AssignConstant(signal, value);
}

} // namespace Vesk_Hdl
