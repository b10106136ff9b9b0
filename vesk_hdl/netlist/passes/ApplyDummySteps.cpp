#include <cassert>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/passes/DummySteps.h"
#include "vesk_hdl/text/ForEachAhead.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// The positions of scalar signals in compounds, by name in any case. It takes the place of a walk
/// over all compounds of the netlist for each scalar that gets a dummy.
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
        // The places now bear the dummy's name, by which a later step may find them again.
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

/// The dummy of a slice or index of a bus, on the bus's own dummy; null for any other class.
Signal *MakePartDummy(Signal const *part, Bus *parent) {
    if (auto const *const slice = As<BusSlice>(part))
        return slice->CreateDummySignal(parent);
    if (auto const *const index = As<BusIndex>(part))
        return index->CreateDummySignal(parent);
    return nullptr;
}

class DummyMaker {
public:
    DummyMaker(Netlist &changed, DummySteps const &decided, bool portIsAssigned)
        : netlist(changed), plan(decided), portTakesDummy(portIsAssigned),
          scalarMembers(changed.GetSignals()) {}

    void Run() {
        std::vector<DummySteps::Step> const &steps = plan.Get();
        for (std::size_t i = 0; i < steps.size(); ++i) {
            if (i + STEPS_AHEAD < steps.size())
                Prefetch(steps[i + STEPS_AHEAD]);
            Make(steps[i]);
        }
    }

private:
    /// Nets and names lie all over the memory, see ForEachAhead.
    static void Prefetch(DummySteps::Step const &step) {
        __builtin_prefetch(step.net);
        __builtin_prefetch(step.name.GetText());
    }

    /// The name decides, not the plan: required, it means what it means by now, and that may be a
    /// dummy of this stage. Only a compound is the one of before the stage.
    void Make(DummySteps::Step const &step) {
        if (auto *const compound = As<CompoundBus>(step.net))
            return MakeOfCompound(*compound);
        if (auto *const scalar = As<ScalarSignal>(netlist.GetSignal(step.name))) {
            assert(As<ScalarSignal>(step.net) && "the plan foresaw another net");
            return MakeOfScalar(*scalar, step.name);
        }
        Bus *const bus = netlist.GetParentBus(step.name);
        assert(bus && As<Bus>(step.net) && "the plan foresaw another net");
        if (bus)
            MakeOfBus(*bus);
    }

    void MakeOfScalar(ScalarSignal &net, StringBase<char> const &name) {
        ScalarSignal *const dummy = net.CreateDummySignal();
        Add(dummy, net);
        Link(net, *dummy);
        scalarMembers.Replace(name, dummy);
    }

    /// The parts get no assignment of their own: that of the whole bus carries them.
    void MakeOfBus(Bus &net) {
        Bus *const dummy = net.CreateDummySignal();
        Add(dummy, net);
        Link(net, *dummy);
        ForEach(net.GetBusSliceIterator(), [&](Signal *part) {
            if (Signal *const partDummy = MakePartDummy(part, dummy))
                Add(partDummy, *part);
        });
    }

    void MakeOfCompound(CompoundBus &net) {
        CompoundBus *const dummy = net.CreateDummySignal();
        Add(dummy, net);
        ForEach(net.GetBusMemberIterator(), [this, dummy](Signal const *member) {
            if (Signal *const memberDummy = netlist.GetSignal(member->GetDummySignalName()))
                dummy->AddBusMember(memberDummy);
        });
    }

    void Add(Signal *dummy, Signal &net) {
        netlist.Add(dummy);
        dummy->CloneConnection(&net);
    }

    void Link(Signal &net, Signal &dummy) {
        if (portTakesDummy)
            net.Connect(&dummy);
        else
            dummy.Connect(&net);
    }

    static constexpr std::size_t STEPS_AHEAD = 12;

    Netlist &netlist;
    DummySteps const &plan;
    bool portTakesDummy;
    ScalarMembers scalarMembers;
};

} // namespace

void ApplyDummySteps(Netlist &netlist, DummySteps const &plan, bool portTakesDummy) {
    DummyMaker(netlist, plan, portTakesDummy).Run();
}

} // namespace Vesk_Hdl
