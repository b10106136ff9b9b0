#pragma once

#include <vector>

#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/SeededHash.h"

namespace Vesk_Hdl {

/// The nets that names mean to a stage of the rewriting, decided before anything is changed.
///
/// A stage adds dummy signals one after the other, and a name that comes later may mean one of
/// them. Each step here knows which earlier step that is, so that nobody has to change the netlist
/// in order to look a name up.
class DummySteps {
public:
    static constexpr int NONE = -1;

    struct Step {
        Basis::StringBase<char> name; ///< as the stage found it
        Signal *net;                  ///< a scalar, a bus or a compound
        int former;                   ///< the step whose dummy is meant in place of the net
    };

    explicit DummySteps(Netlist const &changedLater) : netlist(changedLater) {}

    /// Appends the steps of a stage in the order of the new signals: first scalars and buses in the
    /// order of the set, then compounds. Names that mean nothing are passed over.
    void AddStage(StringSet &names);
    std::vector<Step> const &Get() const { return steps; }

private:
    Step Resolve(Basis::StringBase<char> const &name);
    int FindFormer(std::string_view name);
    void Append(Step const &step);

    Netlist const &netlist;
    std::vector<Step> steps;
    FoldedTextMap<int> stepsByName; ///< filled when a name is first looked for here
    bool isIndexed = false;
};

/// Makes the dummy signals of the steps, which were decided for the netlist as it is now. With
/// `portTakesDummy` each net is assigned from its dummy, otherwise the dummy from the net.
void ApplyDummySteps(Netlist &netlist, DummySteps const &plan, bool portTakesDummy);

} // namespace Vesk_Hdl
