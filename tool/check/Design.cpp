#include "tool/check/Design.h"

using namespace Vesk_Hdl;

namespace Checks {

Design::Design(Model &model, Places const &madePlaces, Recorder const &history,
               Findings &foundThings)
    : netlist(*model.GetNetlist()), options(*model.GetOptions()), places(madePlaces),
      recorder(history), findings(foundThings) {
    ForEachInstance([this](Instance const *instance) {
        if (instance->GetComponent())
            firstInstances.try_emplace(instance->GetComponent(), instance);
    });
    FindDummies();
    FindUses();
}

Spot Design::ConnectedAt(Instance const &instance, Pin const &pin) const {
    Spot const spot = places.Find(Places::CONNECTED, &pin);
    return spot.line > 0 ? spot : MadeAt(&instance);
}

Spot Design::NetAt(Signal const &signal) const {
    Spot const spot = MadeAt(&signal);
    if (spot.line > 0)
        return spot;
    Bus const *const bus = BusOf(signal);
    return bus ? MadeAt(bus) : spot;
}

Spot Design::ConstantAt(Signal const &signal) const {
    Spot const spot = places.Find(Places::CONSTANT, &signal);
    return spot.line > 0 ? spot : NetAt(signal);
}

Spot Design::AssignedAt(Signal const &signal) const {
    Spot const spot = places.Find(Places::ASSIGNED, &signal);
    return spot.line > 0 ? spot : NetAt(signal);
}

std::vector<Spot> Design::TextsAt(void const *owner, int count) const {
    std::vector<Spot> spots(static_cast<std::size_t>(count));
    std::uint32_t before = Places::EVER;
    for (auto spot = spots.rbegin(); spot != spots.rend(); ++spot) {
        *spot = places.Find(Places::TEXT, owner, before);
        before = spot->line;
    }
    return spots;
}

bool Design::IsWritten(Signal const &part) const {
    bool onPin = false;
    ForEachPinOn(part, [&onPin](Pin const *) { onPin = true; });
    return onPin || !FurtherUses(&part).empty() || (part.HasConstantValue() && IsInside(part));
}

Bus *Design::BusOf(Signal const &part) const { return netlist.GetParentBus(part.GetNameRef()); }

/// A walk over all pins at the first question, which only findings ask.
Instance const *Design::OwnerOf(Pin const *pin) const {
    if (owners.empty())
        ForEachPin([this](Instance const &instance, Pin const &own) { owners[&own] = &instance; });
    auto const found = owners.find(pin);
    return found == owners.end() ? nullptr : found->second;
}

Design::Dummy const *Design::DummyOf(Signal const *signal) const {
    auto const found = dummies.find(signal);
    return found == dummies.end() ? nullptr : &found->second;
}

std::vector<Use> const &Design::FurtherUses(Signal const *signal) const {
    static std::vector<Use> const none;
    auto const found = furtherUses.find(signal);
    return found == furtherUses.end() ? none : found->second;
}

Use Design::UseOf(Pin const *pin) {
    Polarity const polarity = pin->GetPolarity();
    return {polarity == Polarity::OUTPUT  ? Use::DRIVES
            : polarity == Polarity::INPUT ? Use::READS
                                          : Use::EITHER,
            pin, nullptr};
}

void Design::FindUses() {
    auto const addTo = [this](Signal const *signal, Use const &use) {
        auto const *const compound = dynamic_cast<CompoundBus const *>(signal);
        if (!compound)
            furtherUses[signal].push_back(use);
        for (int i = 0; compound && i < compound->GetSize(); ++i)
            furtherUses[compound->GetAt(i)].push_back(use);
    };
    ForEachSignal([&](Signal const *signal) {
        if (signal->GetSignalType() == Signal::SIGNAL_COMPOUND_BUS) {
            ForEachPinOn(*signal, [&](Pin const *pin) { addTo(signal, UseOf(pin)); });
            if (signal->HasConstantValue())
                addTo(signal, {Use::DRIVES, nullptr, nullptr});
        }
        ForEach(signal->GetSignalIterator(), [&](Signal const *source) {
            addTo(source, {Use::READS, nullptr, nullptr});
            addTo(signal, {Use::DRIVES, nullptr, source});
        });
    });
    // A pin that was tied to a constant has a signal that does not list it.
    std::unordered_set<Pin const *> listed;
    ForEachSignal([&listed](Signal const *signal) {
        if (signal->HasConstantValue())
            ForEachPinOn(*signal, [&listed](Pin const *pin) { listed.insert(pin); });
    });
    ForEachPin([&](Instance const &, Pin const &pin) {
        Signal const *const signal = pin.GetSignal();
        if (signal && signal->HasConstantValue() && listed.count(&pin) == 0)
            addTo(signal, UseOf(&pin));
    });
}

/// A name that one stage took is out of the later ones.
void Design::FindDummies() {
    auto const feedBack = [this](int stage, Polarity::Value port, Polarity::Value use) {
        ForEachPin([&](Instance const &, Pin const &pin) {
            Polarity const polarity = pin.GetPolarity();
            if (pin.GetSignal() && (polarity == use || polarity == Polarity::BIDIRECTIONAL) &&
                pin.GetSignal()->GetPortPolarity() == port)
                DemandDummy(pin.GetSignal(), stage);
        });
    };
    feedBack(READ_STAGE, Polarity::OUTPUT, Polarity::INPUT);
    feedBack(DRIVEN_STAGE, Polarity::INPUT, Polarity::OUTPUT);
    ForEachSignal([this](Signal const *signal) {
        if (signal->GetPortPolarity() == Polarity::OUTPUT && signal->HasMultiDriver())
            DemandDummy(signal, WIRED_STAGE);
    });
}

void Design::DemandDummy(Signal const *signal, int stage) {
    Dummy const dummy = {stage != DRIVEN_STAGE, signal, stage, nullptr};
    NeedDummy(signal, dummy);
    if (auto const *const compound = dynamic_cast<CompoundBus const *>(signal))
        for (int i = 0; i < compound->GetSize(); ++i)
            NeedDummy(compound->GetAt(i), dummy);
}

/// Scalars and compounds by themselves, bits and slices with their bus.
void Design::NeedDummy(Signal const *signal, Dummy const &dummy) {
    Signal::SignalType const type = signal->GetSignalType();
    if (type == Signal::SIGNAL_BUS_SLICE || type == Signal::SIGNAL_BUS_INDEX)
        signal = BusOf(*signal);
    if (!signal)
        return;
    auto const [found, isNew] = dummies.try_emplace(signal, dummy);
    bool const isMember = dummy.demand != signal;
    if (!isNew && isMember && type == Signal::SIGNAL_SCALAR && found->second.stage < dummy.stage)
        found->second.again = dummy.demand;
}

} // namespace Checks
