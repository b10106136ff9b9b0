#include "vesk_hdl/netlist/passes/DummySteps.h"

#include <algorithm>
#include <cassert>
#include <string>
#include <utility>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/Names.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

std::string_view WithoutTag(std::string_view name) {
    if (Names::EndsInDummyTag(name))
        name.remove_suffix(std::string_view(Names::DUMMY_TAG).size());
    return name;
}

} // namespace

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
    former = FindFormer(scalarSteps, name.View());
    Signal *found = nullptr;
    if (former == NONE)
        found = netlist.GetSignal(name);
    else if (Signal *const net = steps[static_cast<std::size_t>(former)].net; As<ScalarSignal>(net))
        return net;
    if (As<ScalarSignal>(found))
        return found;
    former = FindFormer(busSteps, Names::BaseName(name.View()));
    if (former != NONE)
        return steps[static_cast<std::size_t>(former)].net;
    if (Bus *const bus = netlist.GetParentBus(name))
        return bus;
    return As<CompoundBus>(found);
}

/// The last step whose dummy has this name. All names of dummies end alike, and few others do.
int DummySteps::FindFormer(FoldedTextMap<int> const &latest, std::string_view name) {
    if (!Names::EndsInDummyTag(name) || steps.empty())
        return NONE;
    if (!isIndexed)
        for (std::size_t i = 0; i < steps.size(); ++i)
            Index(i);
    isIndexed = true;
    auto const found = latest.find(WithoutTag(name));
    return found == latest.end() ? NONE : found->second;
}

/// The dummy of X and that of X_DUMMY are both called X_DUMMY. If X_DUMMY is a bus, its dummy has
/// no range, and is found where a scalar would be.
void DummySteps::Index(std::size_t step) {
    Signal const *const net = steps[step].net;
    std::string_view const base = Names::BaseName(steps[step].name.View());
    bool const isBus = As<Bus>(net) != nullptr;
    if (isBus)
        busSteps.insert_or_assign(std::string(WithoutTag(base)), static_cast<int>(step));
    if (As<ScalarSignal>(net))
        scalarSteps.insert_or_assign(std::string(WithoutTag(steps[step].name.View())),
                                     static_cast<int>(step));
    else if (isBus && Names::EndsInDummyTag(base))
        scalarSteps.insert_or_assign(std::string(WithoutTag(base)), static_cast<int>(step));
}

void DummySteps::Append(Step &&step) {
    assert(step.net);
    steps.push_back(std::move(step));
    if (isIndexed)
        Index(steps.size() - 1);
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
