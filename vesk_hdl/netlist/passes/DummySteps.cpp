#include "vesk_hdl/netlist/passes/DummySteps.h"

#include <cassert>
#include <string>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/Names.h"

namespace Vesk_Hdl {

using Basis::StringBase;

void DummySteps::AddStage(StringSet &names) {
    std::vector<Step> compounds;
    StringSetIterator const end = names.GetEndPos();
    for (StringSetIterator it = names.GetBeginPos(); it != end; ++it) {
        Step step = Resolve(*it);
        if (As<CompoundBus>(step.net))
            compounds.push_back(std::move(step));
        else if (step.net)
            Append(step);
    }
    // A compound's dummy lists the dummies of its members, which have to exist by then.
    for (Step const &step : compounds)
        Append(step);
}

/// A scalar of the whole name comes before a bus of that base name, and of two signals of one name
/// the newer one is found.
DummySteps::Step DummySteps::Resolve(StringBase<char> const &name) {
    int const former = FindFormer(name.View());
    Signal *const formerNet =
        former == NONE ? nullptr : steps[static_cast<std::size_t>(former)].net;
    if (As<ScalarSignal>(formerNet))
        return {name, formerNet, former};
    Signal *const found = netlist.GetSignal(name);
    if (As<ScalarSignal>(found))
        return {name, found, NONE};
    if (formerNet)
        return {name, formerNet, former};
    if (Bus *const bus = netlist.GetParentBus(name))
        return {name, bus, NONE};
    return {name, As<CompoundBus>(found), NONE};
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

void DummySteps::Append(Step const &step) {
    assert(step.net && step.former < static_cast<int>(steps.size()));
    if (isIndexed)
        stepsByName.emplace(step.name.View(), static_cast<int>(steps.size()));
    steps.push_back(step);
}

} // namespace Vesk_Hdl
