#include "vesk_hdl/netlist/passes/DummyPlan.h"

#include <algorithm>
#include <cassert>
#include <functional>
#include <unordered_set>
#include <vector>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/passes/DummySteps.h"
#include "vesk_hdl/text/ForEachAhead.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// The steps about each net. Two names may mean one bus: that of the bus, and that of a compound
/// with a backslash, which begins with the bus.
class StepsOfNets {
public:
    /// Steps are added in ascending order; those of a stage are found once Sort was called.
    void Add(Signal const *net, int index) { entries.push_back({net, index}); }
    void Sort() {
        std::sort(entries.begin(), entries.end(), [](Entry const &left, Entry const &right) {
            return left.net == right.net ? left.index < right.index
                                         : std::less<>()(left.net, right.net);
        });
    }
    /// The first step about a net, NONE if there is none.
    int Find(Signal const *net) const {
        auto const found = std::lower_bound(
            entries.begin(), entries.end(), net,
            [](Entry const &entry, Signal const *key) { return std::less<>()(entry.net, key); });
        return found == entries.end() || found->net != net ? DummyPlan::NONE : found->index;
    }

private:
    struct Entry {
        Signal const *net;
        int index;
    };

    std::vector<Entry> entries;
};

} // namespace

struct DummyPlan::Record {
    std::vector<Step> steps;
    StepsOfNets firstSteps;
};

namespace {

/// The three stages on a netlist that stays as it is. What an earlier stage would have changed is
/// kept beside the netlist: the pins that it would have moved to a dummy signal, and, through the
/// steps, the members of compounds that it would have replaced.
///
/// A stage takes ports away from the later ones and adds none. So one walk over all pins finds the
/// candidates of the first two stages, and a later stage leaves out those that are gone.
class StageSimulator {
public:
    StageSimulator(Netlist const &planned, std::vector<DummyPlan::Step> &found, StepsOfNets &firsts)
        : netlist(planned), steps(found), firstSteps(firsts), resolved(planned) {}

    void Run() {
        FindFeedBack();
        EndStage(DummyPlan::READ_OUT_PORT);
        if (!drivers.empty())
            for (DummyPlan::Step const &step : steps)
                NoteMoved(*step.net);
        for (Pin const *const pin : drivers)
            if (moved.count(pin) == 0 && !IsLedByDummy(*pin->GetSignal()))
                Demand(*pin->GetSignal());
        EndStage(DummyPlan::DRIVEN_IN_PORT);
        ForEachAhead(netlist.GetSignals(), [this](Signal const *signal) {
            if (DummyPlan::HasSeveralDrivers(*signal) && !HasMoved(*signal) &&
                !IsLedByDummy(*signal))
                Demand(*signal);
        });
        EndStage(DummyPlan::SEVERAL_DRIVERS);
    }

private:
    void FindFeedBack() {
        ForEachAhead(netlist.GetInstances(), [this](Instance const *instance) {
            ForEach(instance->GetPinIterator(), [this](Pin const *pin) {
                DummyPlan::Reason reason = DummyPlan::READ_OUT_PORT;
                if (!DummyPlan::FindReason(*pin, reason))
                    return;
                if (reason == DummyPlan::READ_OUT_PORT)
                    Demand(*pin->GetSignal());
                else
                    drivers.push_back(pin);
            });
        });
    }

    /// Takes up the names that Signal::GetBaseName would add, with members as they are by now.
    void Demand(Signal const &signal) {
        auto const *const compound = As<CompoundBus>(&signal);
        if (!compound)
            return AddName(Object::GetBaseName(signal.GetNameRef()), signal);
        AddName(signal.GetNameRef(), signal);
        ForEach(compound->GetBusMemberIterator(), [&](Signal const *member) {
            AddName(Object::GetBaseName(IsReplaced(member) ? member->GetDummySignalName()
                                                           : member->GetNameRef()),
                    signal);
        });
    }

    void AddName(StringBase<char> const &name, Signal const &demand) {
        if (names.IContains(name.View()))
            return;
        names.Add(name);
        if (!(name == demand.GetNameRef()))
            demands.emplace(name.View(), &demand);
    }

    /// Turns the names of a stage into steps and notes what these would change.
    void EndStage(DummyPlan::Reason reason) {
        resolved.AddStage(names);
        for (std::size_t i = steps.size(); i < resolved.Get().size(); ++i) {
            DummySteps::Step const &step = resolved.Get()[i];
            auto const index = static_cast<int>(i);
            int const former = resolved.GetFormer(i);
            auto const demand = demands.find(step.name.View());
            steps.push_back({step.net, demand == demands.end() ? step.net : demand->second, reason,
                             former, DummyPlan::NONE});
            if (former != DummyPlan::NONE)
                steps[static_cast<std::size_t>(former)].later = index;
            else
                firstSteps.Add(step.net, index);
        }
        firstSteps.Sort();
        names.Empty(); // its names stay out of the later stages
        demands.clear();
    }

    /// Notes the pins that are on a dummy signal from now on. Those of scalars and buses need not
    /// be noted, as the names of these are out of the later stages anyway. A net takes along what
    /// it lists, also a pin that was connected to another net later.
    void NoteMoved(Signal const &net) {
        bool const isCompound = As<CompoundBus>(&net) != nullptr;
        auto const noteListed = [this, isCompound](Signal const &listing) {
            if (!listing.HasPins())
                return; // a walk would make an empty list
            ForEach(listing.GetPinIterator(), [&](Pin const *pin) {
                if (isCompound || pin->GetSignal() != &listing)
                    moved.insert(pin);
            });
        };
        noteListed(net);
        if (auto const *const bus = As<Bus>(&net))
            ForEach(bus->GetBusSliceIterator(), [&](Signal const *part) { noteListed(*part); });
    }

    bool HasMoved(Signal const &signal) const {
        return firstSteps.Find(&signal) != DummyPlan::NONE;
    }

    /// Scalars are replaced in all compounds, parts and buses in none.
    bool IsReplaced(Signal const *member) const {
        return HasMoved(*member) && As<ScalarSignal>(member);
    }

    /// Whether the first member of a compound is a dummy signal by now. A compound has the
    /// direction of its first member, and a dummy signal has none.
    bool IsLedByDummy(Signal const &signal) const {
        Signal const *first = &signal;
        // The walk ends at a port: only that gives the compound the direction it has.
        while (auto const *const compound = As<CompoundBus>(first))
            first = compound->GetAt(0);
        return first != &signal && IsReplaced(first);
    }

    Netlist const &netlist;
    std::vector<DummyPlan::Step> &steps;
    StepsOfNets &firstSteps;
    DummySteps resolved;
    StringSet names;                  ///< of the stage; those of all stages in any case
    TextMap<Signal const *> demands;  ///< for names that are not their own
    std::vector<Pin const *> drivers; ///< on in ports
    std::unordered_set<Pin const *> moved;
};

} // namespace

DummyPlan::DummyPlan(Netlist const &netlist) : record(std::make_unique<Record>()) {
    StageSimulator(netlist, record->steps, record->firstSteps).Run();
}

DummyPlan::~DummyPlan() = default;

int DummyPlan::GetSize() const { return static_cast<int>(record->steps.size()); }

DummyPlan::Step const &DummyPlan::GetAt(int index) const {
    assert(index >= 0 && index < GetSize());
    return record->steps[static_cast<std::size_t>(index)];
}

DummyPlan::Step const *DummyPlan::Find(Signal const *net) const {
    int const index = record->firstSteps.Find(net);
    return index == NONE ? nullptr : &GetAt(index);
}

bool DummyPlan::FindReason(Pin const &pin, Reason &reason) {
    Signal const *const signal = pin.GetSignal();
    Polarity const port = signal ? signal->GetPortPolarity() : Polarity();
    if (port != Polarity::OUTPUT && port != Polarity::INPUT)
        return false;
    bool const isOut = port == Polarity::OUTPUT;
    Polarity const own = pin.GetPolarity();
    if (own != Polarity::BIDIRECTIONAL && own != (isOut ? Polarity::INPUT : Polarity::OUTPUT))
        return false;
    reason = isOut ? READ_OUT_PORT : DRIVEN_IN_PORT;
    return true;
}

bool DummyPlan::HasSeveralDrivers(Signal const &signal) {
    return signal.GetPortPolarity() == Polarity::OUTPUT && signal.HasMultiDriver();
}

} // namespace Vesk_Hdl
