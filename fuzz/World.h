#pragma once

#include <set>

#include "fuzz/Choices.h"
#include "fuzz/Fuzz.h"
#include "fuzz/Known.h"
#include "tests/support/MemoryFile.h"
#include "vesk_hdl/Vesk_Hdl.h"

// For a target of client calls: what the client holds, and which calls it may make.

namespace Vesk_Hdl::Fuzz {

/// What a walk from signals follows beside the members of compounds.
enum Follow : unsigned int { MEMBERS = 0, PINS = 1, SLICES = 2, LINKS = 4 };

inline std::vector<Signal *> SignalsOn(Instance const *instance) {
    std::vector<Signal *> found;
    ForEach(instance->GetPinIterator(), [&](Pin *pin) { found.push_back(pin->GetSignal()); });
    return found;
}

/// All objects that the client knows.
struct World {
    explicit World(Choices &bytes) : choices(bytes) {}

    Choices &choices;
    CommandFactory factory;
    Capture capture;
    Engine engine;
    Known<Netlist> netlists;
    std::unordered_map<Netlist const *, Model *> models; ///< null for a netlist without one
    Known<Signal> signals;
    Known<Pin> pins;
    Known<Component> components;
    Known<Instance> instances;
    Known<Attribute> attributes; ///< those that belong to no object yet

    // Which calls are allowed.

    bool PinsLive(Signal const *signal) const {
        bool live = true;
        ForEach(signal->GetPinIterator(), [&](Pin *pin) { live = live && pins.Lives(pin); });
        return live;
    }
    bool ComponentLives(Instance const *instance) const {
        return !instance->GetComponent() || components.Lives(instance->GetComponent());
    }
    bool ComponentsLive(Netlist const *netlist) const {
        bool live = true;
        ForEach(netlist->GetInstanceIterator(),
                [&](Instance *instance) { live = live && ComponentLives(instance); });
        return live;
    }
    /// Whether all that can be reached from these signals exists, within a bounded number of steps.
    bool CanWalk(std::vector<Signal *> left, unsigned int follow) const {
        std::set<Signal *> seen;
        while (!left.empty()) {
            Signal *const signal = left.back();
            left.pop_back();
            if (!signal || !seen.insert(signal).second)
                continue;
            if (!signals.Lives(signal) || ((follow & PINS) && !PinsLive(signal)))
                return false;
            auto const push = [&left](Signal *next) { left.push_back(next); };
            if (follow & LINKS)
                ForEach(signal->GetSignalIterator(), push);
            if (auto const *const bus = dynamic_cast<Bus *>(signal); bus && (follow & SLICES))
                ForEach(bus->GetBusSliceIterator(), push);
            if (auto const *const compound = dynamic_cast<CompoundBus *>(signal))
                ForEach(compound->GetBusMemberIterator(), push);
        }
        unsigned int steps = 0;
        std::set<Signal *> inside;
        for (Signal *const signal : seen)
            CountSteps(signal, inside, steps);
        return steps < MAX_STEPS;
    }
    /// Counts the visits of a walk that enters a compound as often as it is listed.
    static void CountSteps(Signal *signal, std::set<Signal *> &inside, unsigned int &steps) {
        auto const *const compound = dynamic_cast<CompoundBus *>(signal);
        if (++steps >= MAX_STEPS || !compound || !inside.insert(signal).second)
            return;
        ForEach(compound->GetBusMemberIterator(),
                [&](Signal *member) { CountSteps(member, inside, steps); });
        inside.erase(signal);
    }
    static constexpr unsigned int MAX_STEPS = 3000;

    /// CanWalk from all signals and pins of a netlist.
    bool CanWalk(Netlist const *netlist, unsigned int follow) const {
        std::vector<Signal *> found;
        ForEach(netlist->GetSignalIterator(), [&](Signal *signal) { found.push_back(signal); });
        ForEach(netlist->GetInstanceIterator(), [&](Instance *instance) {
            for (Signal *const signal : SignalsOn(instance))
                found.push_back(signal);
        });
        return CanWalk(found, follow);
    }
    bool CanWrite(Netlist const *netlist) const {
        return ComponentsLive(netlist) && CanWalk(netlist, PINS | SLICES | LINKS);
    }
    /// Widening touches the pins of each bus, which therefore must exist.
    bool CanWiden(Netlist const *netlist) const {
        bool can = true;
        ForEach(netlist->GetSignalIterator(), [&](Signal *signal) {
            can = can && (signal->GetSignalType() != Signal::SIGNAL_BUS || PinsLive(signal));
        });
        return can;
    }

    // What the client learns after a call.

    void Look() {
        for (Netlist *const netlist : netlists.Living())
            Meet(netlist);
        for (Netlist *const netlist : netlists.Living())
            Expect(netlist);
        replaced.clear(); // other pointers to them are the client's own
        auto const meetPins = [this](auto const &holders) {
            for (auto *const holder : holders.Living())
                ForEach(holder->GetPinIterator(), [&](Pin *pin) { pins.Add(pin, holder); });
        };
        meetPins(components);
        meetPins(instances);
    }
    void Meet(Netlist *netlist) {
        std::set<Signal const *> listed;
        ForEach(netlist->GetSignalIterator(), [&](Signal *signal) {
            signals.Add(signal, netlist);
            listed.insert(signal);
        });
        ForEach(netlist->GetComponentIterator(), [&](Component *c) { components.Add(c, netlist); });
        ForEach(netlist->GetInstanceIterator(), [&](Instance *i) { instances.Add(i, netlist); });
        for (Signal *const signal : signals.LivingOf(netlist))
            if (!listed.contains(signal) && !signals.Get(signal).isHidden) {
                signals.Bury(signal);
                replaced.insert(signal);
            }
        for (Signal *const signal : signals.LivingOf(netlist))
            if (auto const *const bus = dynamic_cast<Bus *>(signal))
                ForEach(bus->GetBusSliceIterator(), [&](Signal *slice) {
                    if (!signals.Knows(slice))
                        signals.Add(slice, netlist, true);
                    replaced.erase(slice); // the slice lies where the bus was
                });
    }
    /// Nothing that a netlist holds points at a bus that the netlist replaced by a wider one.
    void Expect(Netlist *netlist) {
        auto const expect = [&](Signal *target) {
            FUZZ_EXPECT(!target ||
                            (signals.Knows(target) &&
                             !(replaced.contains(target) && signals.Get(target).owner == netlist)),
                        "something points at a bus that was replaced");
        };
        for (Signal *const signal : signals.LivingOf(netlist)) {
            ForEach(signal->GetSignalIterator(), expect);
            if (auto const *const compound = dynamic_cast<CompoundBus *>(signal))
                ForEach(compound->GetBusMemberIterator(), expect);
        }
        auto const expectOn = [&](auto *holder) {
            ForEach(holder->GetPinIterator(), [&](Pin *pin) { expect(pin->GetSignal()); });
        };
        ForEach(netlist->GetComponentIterator(), expectOn);
        ForEach(netlist->GetInstanceIterator(), expectOn);
    }
    std::set<Signal const *> replaced; ///< in the last call

    // The end of objects. Pointers to them stay as they are.

    template <class T> void Remove(Known<T> &known, T *object) {
        auto const owner = static_cast<Netlist const *>(known.Get(object).owner);
        pins.BuryAllOf(object);
        known.Bury(object);
        if (!owner)
            delete object;
        else if constexpr (!std::is_same_v<T, Pin> && !std::is_same_v<T, Attribute>)
            const_cast<Netlist *>(owner)->Remove(object);
    }
    void Remove(Netlist *netlist) {
        for (Component const *const component : components.LivingOf(netlist))
            pins.BuryAllOf(component);
        for (Instance const *const instance : instances.LivingOf(netlist))
            pins.BuryAllOf(instance);
        components.BuryAllOf(netlist);
        instances.BuryAllOf(netlist);
        signals.BuryAllOf(netlist);
        netlists.Bury(netlist);
        Model *const model = models[netlist];
        if (!netlists.IsOwn(netlist)) {
            model->SetName("that one"); // it may have the name of another
            FUZZ_EXPECT(engine.RemoveModel("THAT ONE"), "no such model");
        } else if (model) {
            delete model;
        } else {
            delete netlist;
        }
    }
    template <class T> void RemoveOwn(Known<T> &known) {
        for (T *const object : known.LivingOf(nullptr))
            Remove(known, object);
    }
};

} // namespace Vesk_Hdl::Fuzz
