// The rewriting before a write. A drawing may read an out port, drive an in port and join several
// drivers on an out port; VHDL forbids the first two (IEEE 1076-1993, 1.1.1.2 and 4.3.2) and gives
// the third no single source. These passes change the netlist for good and know nothing of text.

#include "vesk_hdl/netlist/Netlist.h"

#include <vector>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/NetlistRecord.h"
#include "vesk_hdl/text/ForEachAhead.h"
#include "vesk_hdl/text/SeededHash.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// Where scalar signals stand in compounds, by name in any case. It takes the place of a walk over
/// all compounds of the netlist for each scalar that gets a dummy.
class ScalarMembers {
public:
    explicit ScalarMembers(PtrArray<Signal *> const &signals) {
        ForEachAhead(signals, [this](Signal *signal) {
            auto *const compound = As<CompoundBus>(signal);
            for (int i = 0; compound && i < compound->GetSize(); ++i)
                if (As<ScalarSignal>(compound->GetAt(i)))
                    places[compound->GetAt(i)->GetNameRef().GetText()].push_back({compound, i});
        });
    }

    /// Puts `dummy` into every place of a scalar of that name.
    void Replace(StringBase<char> const &name, Signal *dummy) {
        auto const found = places.find(name.View());
        if (found == places.end())
            return;
        std::vector<Place> const replaced = std::move(found->second);
        places.erase(found);
        // The places now bear the dummy's name, by which a later round may find them again.
        std::vector<Place> &now = places[dummy->GetNameRef().GetText()];
        for (Place const &place : replaced) {
            place.compound->SetAt(place.position, dummy);
            now.push_back(place);
        }
    }

private:
    struct Place {
        CompoundBus *compound;
        int position;
    };

    FoldedTextMap<std::vector<Place>> places;
};

void AddNames(PtrArray<Signal *> const &signals, StringSet &names) {
    ForEachAhead(signals, [&names](Signal const *signal) { signal->GetBaseName(names); });
}

/// The dummy of a slice or index of a bus, on the bus's own dummy; null for any other class.
Signal *MakeSliceDummy(Signal const *member, Bus *parent) {
    if (auto const *const slice = As<BusSlice>(member))
        return slice->CreateDummySignal(parent);
    if (auto const *const index = As<BusIndex>(member))
        return index->CreateDummySignal(parent);
    return nullptr;
}

} // namespace

/// In ports are looked for together with out ports, and again only if the latter changed anything.
void Netlist::CreateVhdlDummySignals() {
    // One set for all stages: emptied, it still keeps the names that a stage handled out of the
    // later ones.
    StringSet names;
    PtrArray<Signal *> driven;
    FindFeedBack(names, driven);
    if (!names.IsEmpty()) {
        AddDummySignals(true, names);
        names.Empty();
        driven.Empty(); // the netlist is another one now
        StringSet ignored;
        FindFeedBack(ignored, driven);
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

/// Both in one walk: the names of the out ports that are read, and the in ports that are driven.
void Netlist::FindFeedBack(StringSet &read, PtrArray<Signal *> &driven) {
    auto const look = [&read, &driven](Pin const *pin) {
        Signal *const signal = pin->GetSignal();
        Polarity const port = signal ? signal->GetPortPolarity() : Polarity();
        if (port != Polarity::OUTPUT && port != Polarity::INPUT)
            return;
        Polarity const own = pin->GetPolarity();
        bool const isRead = port == Polarity::OUTPUT;
        if (own != Polarity::BIDIRECTIONAL && own != (isRead ? Polarity::INPUT : Polarity::OUTPUT))
            return;
        if (isRead)
            signal->GetBaseName(read);
        else
            driven.Add(signal);
    };
    ForEachAhead(GetInstances(),
                 [&look](Instance const *instance) { ForEach(instance->GetPinIterator(), look); });
}

/// Collects the out ports with several drivers.
void Netlist::GetWiredOrOutputSignals(StringSet &names) {
    ForEachAhead(GetSignals(), [&names](Signal const *signal) {
        if (signal->GetPortPolarity() == Polarity::OUTPUT && signal->HasMultiDriver())
            signal->GetBaseName(names);
    });
}

/// Gives each named signal a dummy that takes over its connections. With `portTakesDummy` the port
/// is assigned from the dummy, otherwise the dummy from the port. The order of the names is the
/// order of the new signals.
void Netlist::AddDummySignals(bool portTakesDummy, StringSet &names) {
    if (names.IsEmpty())
        return;
    auto const addDummy = [this](Signal *dummy, Signal *old) {
        Add(dummy);
        dummy->CloneConnection(old);
    };
    auto const link = [portTakesDummy](Signal *port, Signal *dummy) {
        if (portTakesDummy)
            port->Connect(dummy);
        else
            dummy->Connect(port);
    };

    ScalarMembers scalarMembers(GetSignals());
    PtrArray<CompoundBus *> compounds;
    StringSetIterator const end = names.GetEndPos();
    for (StringSetIterator it = names.GetBeginPos(); it != end; ++it) {
        StringBase<char> const name = *it;
        Signal *const found = GetSignal(name);
        if (auto *const old = As<ScalarSignal>(found)) {
            ScalarSignal *const dummy = old->CreateDummySignal();
            addDummy(dummy, old);
            link(old, dummy);
            scalarMembers.Replace(name, dummy);
        } else if (Bus *const oldBus = GetParentBus(name)) {
            Bus *const dummy = oldBus->CreateDummySignal();
            addDummy(dummy, oldBus);
            link(oldBus, dummy);
            // The slices get no link of their own: the assignment of the whole buses carries them.
            ForEach(oldBus->GetBusSliceIterator(), [&](Signal *member) {
                if (Signal *const part = MakeSliceDummy(member, dummy))
                    addDummy(part, member);
            });
        } else if (auto *const compound = As<CompoundBus>(found)) {
            compounds.Add(compound);
        }
    }

    // A compound's dummy lists the dummies of its members, which exist by now.
    ForEach(compounds, [&](CompoundBus *old) {
        CompoundBus *const dummy = old->CreateDummySignal();
        addDummy(dummy, old);
        ForEach(old->GetBusMemberIterator(), [this, dummy](Signal const *member) {
            if (Signal *const memberDummy = GetSignal(member->GetDummySignalName()))
                dummy->AddBusMember(memberDummy);
        });
    });
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
