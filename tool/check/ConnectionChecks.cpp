// Assignments between nets, compounds on pins, and what the dummy signals make of them. Before a
// write each out port that is read inside, each in port that is driven inside and each out port
// with several drivers gives its pins to a dummy signal.

#include <set>

#include "tool/check/Design.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

bool IsPart(Signal const &signal) {
    return signal.GetSignalType() == Signal::SIGNAL_BUS_SLICE ||
           signal.GetSignalType() == Signal::SIGNAL_BUS_INDEX;
}

/// The net that is declared: a part's bus, or the net itself.
Signal const *DeclaredOf(Design const &design, Signal const &signal) {
    return IsPart(signal) ? design.BusOf(signal) : &signal;
}

class AssignmentChecker {
public:
    AssignmentChecker(Design const &checked, Signal const &assigned, Signal const &from)
        : design(checked), target(assigned), source(from) {}

    void Run() {
        bool compound = false;
        for (Signal const *const side : {&target, &source}) {
            if (side->GetSignalType() == Signal::SIGNAL_COMPOUND_BUS) {
                Add(Id::COMPOUND_ASSIGNMENT, *side);
                compound = true;
            } else if (side->GetSignalType() == Signal::SIGNAL_BUS_INDEX) {
                Add(Id::BIT_ASSIGNMENT, *side);
            }
        }
        if (compound)
            return;
        if (&target == &source)
            Add(Id::SELF_ASSIGNMENT, target);
        Signal const *const declared = DeclaredOf(design, target);
        DummyPlan::Step const *const dummy = design.dummies.Find(declared);
        // What was assigned to an in port that is driven as well goes to its dummy.
        bool const moves = dummy && !dummy->IsNetAssigned();
        if (target.GetPortPolarity() == Polarity::INPUT && !moves)
            Add(Id::ASSIGNED_IN_PORT, target);
        if (source.GetPortPolarity() == Polarity::OUTPUT)
            Add(Id::READ_OUT_PORT, source);
        CheckWidth();
    }

private:
    void Add(Id id, Signal const &side, Languages languages = BOTH, std::string detail = {}) {
        design.findings.Add(
            {id, design.AssignedAt(target), NetName(side), {}, languages, std::move(detail)});
    }

    /// To VHDL one bit and a vector of one bit are two types.
    void CheckWidth() {
        auto const isVector = [](Signal const &side) {
            return side.GetSignalType() == Signal::SIGNAL_BUS ||
                   side.GetSignalType() == Signal::SIGNAL_BUS_SLICE;
        };
        int const width = target.GetWidth();
        int const other = source.GetWidth();
        if (width == 0 || other == 0)
            return;
        if (width != other)
            Add(Id::ASSIGNMENT_WIDTH, target, BOTH,
                std::to_string(width) + " from " + std::to_string(other) + " of " +
                    Quoted(source.GetNameRef().View()));
        else if (isVector(target) != isVector(source))
            Add(Id::ASSIGNMENT_WIDTH, target, VHDL,
                "one bit and a vector of one bit, " + Quoted(source.GetNameRef().View()));
    }

    Design const &design;
    Signal const &target;
    Signal const &source;
};

/// A compound on pins.
class CompoundChecker {
public:
    CompoundChecker(Design const &checked, CompoundBus const &checkedCompound)
        : design(checked), compound(checkedCompound),
          dummy(checked.dummies.Find(&checkedCompound)) {
        Design::ForEachPinOn(compound, [this](Pin const *pin) {
            drives |= pin->GetPolarity() != Polarity::INPUT;
            reads |= pin->GetPolarity() != Polarity::OUTPUT;
        });
    }

    void Run() {
        for (int i = 0; i < compound.GetSize(); ++i)
            if (compound.GetAt(i))
                CheckMember(*compound.GetAt(i));
    }

private:
    void CheckMember(Signal const &member) {
        Polarity const polarity = member.GetPortPolarity();
        Signal const *const declared = DeclaredOf(design, member);
        DummyPlan::Step const *const own = design.dummies.Find(declared);
        if (dummy) {
            if (polarity == Polarity::BIDIRECTIONAL)
                Add(Id::INOUT_IN_COMPOUND, member, BOTH);
            // The members are treated like the first one, unless they had a dummy before.
            if (own && polarity == (own->IsNetAssigned() ? Polarity::INPUT : Polarity::OUTPUT))
                Add(Id::IN_PORT_IN_COMPOUND, member, BOTH);
            return;
        }
        // Scalars are replaced in all compounds, parts and buses in none.
        bool const replaced = own && member.GetSignalType() == Signal::SIGNAL_SCALAR;
        if (replaced)
            return;
        if (polarity == Polarity::INPUT && drives)
            Add(Id::IN_PORT_IN_COMPOUND, member, BOTH);
        if (polarity == Polarity::OUTPUT && reads)
            Add(Id::OUT_PORT_IN_COMPOUND, member, VHDL);
        if (drives && own && own->reason == DummyPlan::READ_OUT_PORT)
            Add(Id::BYPASSED_DUMMY, member, BOTH);
    }

    /// Once for each check: with the first member that it finds.
    void Add(Id id, Signal const &member, Languages languages) {
        if (!found.insert(id).second)
            return;
        design.findings.Add(
            {id,
             design.NetAt(compound),
             "compound " + Quoted(compound.GetNameRef().View()),
             {{&member, "the member " + Quoted(member.GetNameRef().View()) + " is here"}},
             languages,
             Quoted(member.GetNameRef().View())});
    }

    Design const &design;
    CompoundBus const &compound;
    DummyPlan::Step const *dummy;
    std::set<Id> found;
    bool drives = false;
    bool reads = false;
};

/// Pins that a net lists and that are on another one now: they go to the net's dummy.
void CheckReturns(Design const &design, Signal const &signal) {
    ForEach(signal.GetPinIterator(), [&](Pin const *pin) {
        Signal const *const now = pin->GetSignal();
        if (now == &signal)
            return;
        Instance const *const owner = design.OwnerOf(pin);
        design.findings.Add(
            {Id::PIN_RETURNS,
             design.places.Find(LocationMap::CONNECTED, pin),
             owner ? PinName(*owner, *pin) : "pin " + Quoted(pin->GetNameRef().View()),
             {{&signal, "its first net is here"}},
             BOTH,
             "to the dummy signal of " + Quoted(signal.GetNameRef().View())});
    });
}

/// A constant stays where it is when the readers of its net go to a dummy signal.
void CheckConstantBesideDummy(Design const &design, Signal const &signal) {
    if (!signal.HasConstantValue() || !design.IsInside(signal))
        return;
    std::string const net = NetName(signal);
    design.findings.Add({Id::BYPASSED_DUMMY,
                         design.ConstantAt(signal),
                         "constant of " + net,
                         {{&signal, net + " is here"}}});
}

} // namespace

void CheckConnections(Design const &design) {
    design.ForEachSignal([&](Signal const *signal) {
        ForEach(signal->GetSignalIterator(),
                [&](Signal const *source) { AssignmentChecker(design, *signal, *source).Run(); });
        if (auto const *const compound = dynamic_cast<CompoundBus const *>(signal))
            CompoundChecker(design, *compound).Run();
    });
    design.ForEachSignal([&design](Signal const *signal) {
        DummyPlan::Step const *const dummy = design.dummies.Find(signal);
        if (!dummy)
            return;
        bool const isLeft = dummy->reason == DummyPlan::READ_OUT_PORT; // by its readers
        auto const checkPart = [&design, isLeft](Signal const *part) {
            CheckReturns(design, *part);
            if (isLeft)
                CheckConstantBesideDummy(design, *part);
        };
        checkPart(signal);
        if (auto const *const bus = dynamic_cast<Bus const *>(signal))
            ForEach(bus->GetBusSliceIterator(), checkPart);
    });
}

} // namespace Checks
