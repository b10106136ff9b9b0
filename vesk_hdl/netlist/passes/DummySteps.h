#pragma once

#include <utility>
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
    };

    explicit DummySteps(Netlist const &changedLater) : netlist(changedLater) {}

    /// Appends the steps of a stage in the order of the new signals: first scalars and buses in the
    /// order of the set, then compounds. Names that mean nothing are passed over.
    void AddStage(StringSet &names);
    std::vector<Step> const &Get() const { return steps; }
    /// Whether some step of the last stage is about a compound.
    bool HasCompounds() const;
    /// The earlier step whose dummy is meant in place of the net of a step, or NONE.
    int GetFormer(std::size_t step) const;

private:
    Signal *Resolve(Basis::StringBase<char> const &name, int &former);
    int FindFormer(FoldedTextMap<int> const &latest, std::string_view name);
    void Index(std::size_t step);
    void Append(Step &&step);

    Netlist const &netlist;
    std::vector<Step> steps; ///< kept small: a design may have a million of them
    std::vector<std::pair<std::size_t, int>> formers; ///< of the few steps that have one, ascending
    // The last steps whose dummies have a name, without its end "_DUMMY". They are filled when one
    // is first looked for.
    FoldedTextMap<int> scalarSteps; ///< by the whole name; a bus without a range is here as well
    FoldedTextMap<int> busSteps;    ///< by the base name
    bool isIndexed = false;
};

/// Makes the dummy signals of the steps, which were decided for the netlist as it is now. The name
/// of each scalar and bus is looked up again at its turn, and that lookup decides. With
/// `portTakesDummy` each net is assigned from its dummy, otherwise the dummy from the net.
void ApplyDummySteps(Netlist &netlist, DummySteps const &plan, bool portTakesDummy);

} // namespace Vesk_Hdl
