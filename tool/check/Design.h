#pragma once

#include <span>
#include <unordered_map>
#include <vector>

#include "tool/check/Findings.h"
#include "tool/check/Recorder.h"
#include "tool/check/Text.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace Checks {

/// What a pin or an assignment does to a net.
struct Use {
    enum Kind { DRIVES, READS, EITHER };

    Kind kind;
    Vesk_Hdl::Pin const *pin;       ///< null for an assignment, a constant or a port
    Vesk_Hdl::Signal const *source; ///< of an assignment, else null
};

/// The netlist as it is, and what the writers would make of it; nothing is changed. Made anew
/// for each write that is checked, in one walk over the design.
class Design {
public:
    Design(Vesk_Hdl::Model &model, LocationMap const &madePlaces, Recorder const &history,
           Findings &foundThings);

    CompactLocation MadeAt(void const *object) const {
        return places.Find(LocationMap::MADE, object);
    }
    /// Where a pin got its net, or where its instance was made.
    CompactLocation ConnectedAt(Vesk_Hdl::Instance const &instance, Vesk_Hdl::Pin const &pin) const;
    /// Where a net was made; of a part that is outside the netlist, where its bus was.
    CompactLocation NetAt(Vesk_Hdl::Signal const &signal) const;
    CompactLocation ConstantAt(Vesk_Hdl::Signal const &signal) const;
    CompactLocation AssignedAt(Vesk_Hdl::Signal const &signal) const;

    bool IsUsed(Vesk_Hdl::Component const *component) const {
        return firstInstances.count(component) > 0;
    }
    /// Whether the netlist knows the signal, so that its constant and assignments are written.
    bool IsInside(Vesk_Hdl::Signal const &signal) const {
        return netlist.GetSignal(signal.GetNameRef()) == &signal;
    }
    /// Where an option got its text; where a list of options or a comment got each of its texts,
    /// which are `count`.
    CompactLocation TextAt(void const *option) const {
        return places.Find(LocationMap::TEXT, option);
    }
    std::vector<CompactLocation> TextsAt(void const *owner, int count) const;
    /// Whether a bit or slice occurs anywhere in the text.
    bool IsWritten(Vesk_Hdl::Signal const &part) const;
    /// The bus of a bit or slice, null if there is none.
    Vesk_Hdl::Bus *BusOf(Vesk_Hdl::Signal const &part) const;
    Vesk_Hdl::Instance const *OwnerOf(Vesk_Hdl::Pin const *pin) const;
    /// The uses of a signal that are not in its list of pins: through compounds, assignments and
    /// ties to constants.
    std::span<Use const> FurtherUses(Vesk_Hdl::Signal const *signal) const;
    static Use UseOf(Vesk_Hdl::Pin const *pin);

    /// All but the nets that a write gave to open pins, of which no line says anything.
    template <class Act> void ForEachSignal(Act act) const {
        Vesk_Hdl::ForEach(netlist.GetSignalIterator(), [this, &act](Vesk_Hdl::Signal *signal) {
            if (!places.IsOpen(signal))
                act(signal);
        });
    }
    template <class Act> void ForEachInstance(Act act) const {
        Vesk_Hdl::ForEach(netlist.GetInstanceIterator(), act);
    }
    template <class Act> void ForEachUsedComponent(Act act) const {
        Vesk_Hdl::ForEach(netlist.GetComponentIterator(), [&](Vesk_Hdl::Component *component) {
            if (IsUsed(component))
                act(component);
        });
    }
    /// Each pin of each instance, with its instance.
    template <class Act> void ForEachPin(Act act) const {
        ForEachInstance([&act](Vesk_Hdl::Instance const *instance) {
            Vesk_Hdl::ForEach(instance->GetPinIterator(),
                              [&](Vesk_Hdl::Pin *pin) { act(*instance, *pin); });
        });
    }
    /// Each pin that is on the signal and not merely listed there.
    template <class Act> static void ForEachPinOn(Vesk_Hdl::Signal const &signal, Act act) {
        Vesk_Hdl::ForEach(signal.GetPinIterator(), [&](Vesk_Hdl::Pin *pin) {
            if (pin->GetSignal() == &signal)
                act(pin);
        });
    }

    Vesk_Hdl::Netlist const &netlist;
    Vesk_Hdl::HdlOptions const &options;
    LocationMap const &places;
    Recorder const &recorder;
    Findings &findings;
    std::unordered_map<Vesk_Hdl::Component const *, Vesk_Hdl::Instance const *> firstInstances;
    Vesk_Hdl::DummyPlan const dummies; ///< that a write would make

private:
    void FindUses();
    /// Calls `act` with the net and the use of each pin that was tied to a constant: such a net
    /// does not list the pin.
    template <class Act> void ForEachTie(Act act) const;

    std::vector<Vesk_Hdl::Signal const *> usedSignals; ///< sorted, and beside it the uses
    std::vector<Use> furtherUses;
    mutable std::vector<std::pair<Vesk_Hdl::Pin const *, Vesk_Hdl::Instance const *>> owners;
};

// The groups of checks, in the order of the table.
void CheckNames(Design const &design);
/// `vhdlIsWritten`: lines that write VHDL come between the last change and the text to check.
void CheckMadeNets(Design const &design, bool vhdlIsWritten);
void CheckNets(Design const &design);
void CheckPins(Design const &design);
void CheckConnections(Design const &design);
void CheckConstants(Design const &design);
void CheckAttributes(Design const &design);
void CheckMacro(Design const &design);
void CheckTexts(Design const &design);
/// The languages that do not take a text in a comment.
Languages RefusedInComment(std::string_view text);

} // namespace Checks
