#include "tool/check/Design.h"

#include <algorithm>
#include <functional>
#include <unordered_set>

using namespace Vesk_Hdl;

namespace Checks {

Design::Design(Model &model, LocationMap const &madePlaces, Recorder const &history,
               Findings &foundThings)
    : netlist(*model.GetNetlist()), options(*model.GetOptions()), places(madePlaces),
      recorder(history), findings(foundThings), dummies(netlist) {
    Component const *last = nullptr;
    ForEachInstance([&](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (component && component != last)
            firstInstances.try_emplace(component, instance);
        last = component;
    });
    FindUses();
}

CompactLocation Design::ConnectedAt(Instance const &instance, Pin const &pin) const {
    CompactLocation const spot = places.Find(LocationMap::CONNECTED, &pin);
    return spot.line > 0 ? spot : MadeAt(&instance);
}

CompactLocation Design::NetAt(Signal const &signal) const {
    CompactLocation const spot = MadeAt(&signal);
    if (spot.line > 0)
        return spot;
    Bus const *const bus = BusOf(signal);
    return bus ? MadeAt(bus) : spot;
}

CompactLocation Design::ConstantAt(Signal const &signal) const {
    CompactLocation const spot = places.Find(LocationMap::CONSTANT, &signal);
    return spot.line > 0 ? spot : NetAt(signal);
}

CompactLocation Design::AssignedAt(Signal const &signal) const {
    CompactLocation const spot = places.Find(LocationMap::ASSIGNED, &signal);
    return spot.line > 0 ? spot : NetAt(signal);
}

std::vector<CompactLocation> Design::TextsAt(void const *owner, int count) const {
    std::vector<CompactLocation> spots(static_cast<std::size_t>(count));
    std::uint32_t before = LocationMap::EVER;
    for (auto spot = spots.rbegin(); spot != spots.rend(); ++spot) {
        *spot = places.Find(LocationMap::TEXT, owner, before);
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
    using Owner = std::pair<Pin const *, Instance const *>;
    auto const isLess = [](Owner const &left, Owner const &right) {
        return std::less<>()(left.first, right.first);
    };
    if (owners.empty()) {
        ForEachPin([this](Instance const &instance, Pin const &own) {
            owners.emplace_back(&own, &instance);
        });
        std::sort(owners.begin(), owners.end(), isLess);
    }
    auto const found = std::lower_bound(owners.begin(), owners.end(), Owner{pin, nullptr}, isLess);
    return found == owners.end() || found->first != pin ? nullptr : found->second;
}

std::span<Use const> Design::FurtherUses(Signal const *signal) const {
    auto const [first, last] =
        std::equal_range(usedSignals.begin(), usedSignals.end(), signal, std::less<>());
    return {furtherUses.data() + (first - usedSignals.begin()),
            static_cast<std::size_t>(last - first)};
}

Use Design::UseOf(Pin const *pin) {
    Polarity const polarity = pin->GetPolarity();
    return {polarity == Polarity::OUTPUT  ? Use::DRIVES
            : polarity == Polarity::INPUT ? Use::READS
                                          : Use::EITHER,
            pin, nullptr};
}

/// Constants are rare. Without one there is nothing to find on the pins.
template <class Act> void Design::ForEachTie(Act act) const {
    std::unordered_set<Pin const *> listed;
    bool hasConstants = false;
    ForEachSignal([&](Signal const *signal) {
        if (!signal->HasConstantValue())
            return;
        hasConstants = true;
        ForEachPinOn(*signal, [&listed](Pin const *pin) { listed.insert(pin); });
    });
    if (hasConstants)
        ForEachPin([&](Instance const &, Pin const &pin) {
            Signal const *const signal = pin.GetSignal();
            if (signal && signal->HasConstantValue() && listed.count(&pin) == 0)
                act(signal, UseOf(&pin));
        });
}

/// Most nets have no use but their pins. The others are kept in two sorted arrays, which take less
/// memory than a table of lists.
void Design::FindUses() {
    std::vector<std::pair<Signal const *, Use>> found;
    auto const addTo = [&found](Signal const *signal, Use const &use) {
        auto const *const compound = dynamic_cast<CompoundBus const *>(signal);
        if (!compound)
            found.emplace_back(signal, use);
        for (int i = 0; compound && i < compound->GetSize(); ++i)
            found.emplace_back(compound->GetAt(i), use);
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
    ForEachTie(addTo);
    std::stable_sort(found.begin(), found.end(), [](auto const &left, auto const &right) {
        return std::less<>()(left.first, right.first);
    });
    usedSignals.reserve(found.size());
    furtherUses.reserve(found.size());
    for (auto const &[signal, use] : found) {
        usedSignals.push_back(signal);
        furtherUses.push_back(use);
    }
}

} // namespace Checks
