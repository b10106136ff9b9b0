#pragma once

#include <memory>

#include "vesk_hdl/Api.h"

namespace Vesk_Hdl {

class Netlist;
class Pin;
class Signal;

/// The dummy signals that the next write would make, in the order in which it would add them to the
/// netlist, with the reason for each. Nothing is changed. VHDL and Verilog writes make the same
/// ones: both call Netlist::CreateVhdlDummySignals.
///
/// That pass has three stages, one for each reason. A stage looks for ports that are used against
/// their direction; a net that an earlier stage handled is out of the later ones. The plan foresees
/// what the later stages find in the netlist that the earlier ones have changed. It is exact unless
/// the name of a dummy signal is that of another signal already: later stages may then take the one
/// for the other.
///
/// A plan points at the signals of the netlist and is valid until the netlist is changed.
class VESK_HDL_API DummyPlan {
public:
    /// Why a net gets a dummy signal. The values are the stages, in their order.
    enum Reason : int {
        READ_OUT_PORT = 1,  ///< an instance reads an out port
        DRIVEN_IN_PORT = 2, ///< an instance drives an in port
        SEVERAL_DRIVERS = 3 ///< several output pins are on an out port
    };
    static constexpr int NONE = -1; ///< the index of no step

    /// One net that gives its pins and assignments to a dummy signal.
    struct Step {
        /// A scalar, a bus, which takes its slices and indexes along, or a compound. Never null.
        Signal const *net;
        /// On whose pins the reason was found: the net itself, a part of it, or a compound with the
        /// net as a member, which is why the net need not be a port. Never null.
        Signal const *demand;
        Reason reason; ///< also the stage that handles the net
        /// The earlier step whose dummy signal is meant in place of the net, or NONE. A compound
        /// that a later stage handles may by then have that dummy as a member.
        int former;
        /// The later step that is about the dummy signal of this one, or NONE.
        int later;

        /// Whether the net is assigned from its dummy signal; otherwise the other way round.
        /// Between a compound and its dummy there is no assignment.
        bool IsNetAssigned() const { return reason != DRIVEN_IN_PORT; }
    };

    /// Makes the plan in one walk over pins and signals. The netlist must outlive it.
    explicit DummyPlan(Netlist const &netlist);
    ~DummyPlan();
    DummyPlan(DummyPlan const &) = delete;
    DummyPlan &operator=(DummyPlan const &) = delete;

    /// The number of steps. A step for a bus makes one dummy for the bus and one for each part.
    int GetSize() const;
    /// The step of that index, which has to be at least 0 and less than the size.
    Step const &GetAt(int index) const;
    /// The first step about the net; null if there is none, as for null and for the parts of buses.
    Step const *Find(Signal const *net) const;

    /// What the pin does to the port it is on that makes a stage give the port a dummy:
    /// READ_OUT_PORT or DRIVEN_IN_PORT. False for any other pin; `reason` is then left alone.
    static bool FindReason(Pin const &pin, Reason &reason);
    /// Whether the signal is an out port with several drivers.
    static bool HasSeveralDrivers(Signal const &signal);

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
