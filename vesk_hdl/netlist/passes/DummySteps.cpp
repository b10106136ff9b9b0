#include "vesk_hdl/netlist/passes/DummySteps.h"

#include <algorithm>
#include <cassert>
#include <utility>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/Names.h"

namespace Vesk_Hdl {

using Basis::StringBase;

void DummySteps::AddStage(StringSet &names) {
    std::vector<Step> compounds;
    StringSetIterator const end = names.GetEndPos();
    for (StringSetIterator it = names.GetBeginPos(); it != end; ++it) {
        StringBase<char> name = *it;
        int former = NONE;
        Signal *const net = Resolve(name, former);
        if (former != NONE)
            formers.emplace_back(steps.size(), former);
        if (As<CompoundBus>(net))
            compounds.push_back({std::move(name), net});
        else if (net)
            Append({std::move(name), net});
    }
    // A compound's dummy lists the dummies of its members, which have to exist by then.
    for (Step &step : compounds)
        Append(std::move(step));
}

/// A scalar of the whole name comes before a bus of that base name, and of two signals of one name
/// the newer one is found.
Signal *DummySteps::Resolve(StringBase<char> const &name, int &former) {
    former = FindFormer(name.View());
    Signal *const formerNet =
        former == NONE ? nullptr : steps[static_cast<std::size_t>(former)].net;
    if (As<ScalarSignal>(formerNet))
        return formerNet;
    Signal *const found = netlist.GetSignal(name);
    if (As<ScalarSignal>(found)) {
        former = NONE;
        return found;
    }
    if (formerNet)
        return formerNet;
    if (Bus *const bus = netlist.GetParentBus(name))
        return bus;
    return As<CompoundBus>(found);
}

/// The step whose dummy has this name. The dummy of X_DUMMY is called X_DUMMY again and is no other
/// step's: a name occurs once.
int DummySteps::FindFormer(std::string_view name) {
    if (!Names::EndsInDummyTag(name) || steps.empty())
        return NONE;
    if (!isIndexed)
        for (std::size_t i = 0; i < steps.size(); ++i)
            stepsByName.emplace(steps[i].name.View(), static_cast<int>(i));
    isIndexed = true;
    name.remove_suffix(std::string_view(Names::DUMMY_TAG).size());
    auto const found = stepsByName.find(name);
    if (found == stepsByName.end() || Names::EndsInDummyTag(name) ||
        As<CompoundBus>(steps[static_cast<std::size_t>(found->second)].net))
        return NONE;
    return found->second;
}

void DummySteps::Append(Step &&step) {
    assert(step.net);
    if (isIndexed)
        stepsByName.emplace(step.name.View(), static_cast<int>(steps.size()));
    steps.push_back(std::move(step));
}

bool DummySteps::HasCompounds() const {
    return !steps.empty() && As<CompoundBus>(steps.back().net); // they come last
}

int DummySteps::GetFormer(std::size_t step) const {
    auto const found =
        std::lower_bound(formers.begin(), formers.end(), std::pair<std::size_t, int>(step, NONE));
    return found == formers.end() || found->first != step ? NONE : found->second;
}

} // namespace Vesk_Hdl
