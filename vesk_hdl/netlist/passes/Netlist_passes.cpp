// The rewriting before a write. A drawing may read an out port, drive an in port and join several
// drivers on an out port; VHDL forbids the first two (IEEE 1076-1993, 1.1.1.2 and 4.3.2), and
// several drivers meet on a net inside, not on the port. These passes change the netlist for good
// and know nothing of text.

#include "vesk_hdl/netlist/Netlist.h"

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/passes/DummyPlan.h"
#include "vesk_hdl/netlist/passes/DummySteps.h"
#include "vesk_hdl/text/ForEachAhead.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

void AddNames(PtrArray<Signal *> const &signals, StringSet &names) {
    ForEachAhead(signals, [&names](Signal const *signal) { signal->GetBaseName(names); });
}

/// Both in one walk: the names of the out ports that are read, and the in ports that are driven.
void FindFeedBack(Netlist const &netlist, StringSet &read, PtrArray<Signal *> &driven) {
    auto const look = [&read, &driven](Pin const *pin) {
        DummyPlan::Reason reason = DummyPlan::READ_OUT_PORT;
        if (!DummyPlan::FindReason(*pin, reason))
            return;
        if (reason == DummyPlan::READ_OUT_PORT)
            pin->GetSignal()->GetBaseName(read);
        else
            driven.Add(pin->GetSignal());
    };
    ForEachAhead(netlist.GetInstances(),
                 [&look](Instance const *instance) { ForEach(instance->GetPinIterator(), look); });
}

} // namespace

/// In ports are looked for together with out ports, and a second time only if the dummies of out
/// ports may have changed the answer.
void Netlist::CreateVhdlDummySignals() {
    // One set for all stages: emptied, it still keeps the names that a stage handled out of the
    // later ones.
    StringSet names;
    PtrArray<Signal *> driven;
    FindFeedBack(*this, names, driven);
    if (!names.IsEmpty()) {
        DummySteps plan(*this);
        plan.AddStage(names);
        ApplyDummySteps(*this, plan, true);
        names.Empty();
        // Pins moved away from ports, which leaves fewer in ports that are driven. Only a
        // compound's dummy may begin with a port: one that has the name of the first member's
        // dummy.
        if (!driven.IsEmpty() || plan.HasCompounds()) {
            StringSet ignored;
            driven.Empty();
            FindFeedBack(*this, ignored, driven);
        }
    }
    AddNames(driven, names);
    AddDummySignals(false, names);
    names.Empty();
    GetWiredOrOutputSignals(names);
    AddDummySignals(true, names);
}

void Netlist::CreateVerilogDummySignals() {
    StringSet names;
    GetFeedBackSignals(false, names);
    AddDummySignals(false, names);
}

/// Collects the names of the out ports that an instance reads, or of the in ports that one drives.
void Netlist::GetFeedBackSignals(bool outPortToInPin, StringSet &names) {
    PtrArray<Pin *> pins;
    ForEachAhead(GetInstances(), [&pins, outPortToInPin](Instance const *instance) {
        if (outPortToInPin)
            instance->GetOutPortConnectedToInPin(pins);
        else
            instance->GetInPortConnectedToOutPin(pins);
    });
    ForEach(pins, [&names](Pin const *pin) { pin->GetSignal()->GetBaseName(names); });
}

/// Collects the out ports with several drivers.
void Netlist::GetWiredOrOutputSignals(StringSet &names) {
    ForEachAhead(GetSignals(), [&names](Signal const *signal) {
        if (DummyPlan::HasSeveralDrivers(*signal))
            signal->GetBaseName(names);
    });
}

/// Gives each named signal a dummy that takes over its connections. With `portTakesDummy` the port
/// is assigned from the dummy, otherwise the dummy from the port. The order of the names is the
/// order of the new signals.
void Netlist::AddDummySignals(bool portTakesDummy, StringSet &names) {
    if (names.IsEmpty())
        return;
    DummySteps plan(*this);
    plan.AddStage(names);
    ApplyDummySteps(*this, plan, portTakesDummy);
}

void Netlist::ConnectOpenPinToDummy() {
    PtrArray<Pin *> open;
    ForEachAhead(GetInstances(), [&](Instance const *instance) {
        open.Empty();
        instance->GetOpenPin(open, true);
        ForEach(open, [&](Pin *pin) {
            StringBase<char> const base = Names::PinSignalBase(
                instance->GetNameRef().View(), pin->GetBaseName().View(), Names::OPEN_TAG);
            Signal *signal = nullptr;
            if (pin->GetPinType() == Pin::PIN_SCALAR) {
                signal = new ScalarSignal(base);
            } else if (auto const *const busPin = dynamic_cast<BusPin const *>(pin)) {
                StringBase<char> left;
                StringBase<char> right;
                busPin->GetIndex(left, right);
                signal = new Bus(Names::BusName(base.View(), left.View(), right.View()));
            } else {
                return; // a pin that is one bit of a range stays open
            }
            Add(signal);
            pin->Connect(signal);
        });
    });
}

void Netlist::SetBoxTypeAttribute() {
    ForEach(GetComponents(), [](Component *component) {
        Attribute const *const level = component->GetAttr("Level");
        if (!level || !Basis::Ascii::EqualIgnoringCase(level->GetValueString().View(), "ORVANE") ||
            component->GetAttr("BOX_TYPE"))
            return;
        Attribute *const boxType =
            AttributeFactory::GetInstance().CreateAttribute("String", "BOX_TYPE", "BLACK_BOX");
        boxType->SetSynAttr("ASSIGN");
        component->AddAttr(boxType);
    });
}

} // namespace Vesk_Hdl
