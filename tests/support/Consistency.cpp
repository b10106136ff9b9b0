#include "tests/support/Consistency.h"

#include <set>
#include <stdexcept>

using namespace Vesk_Hdl;

namespace {

class ConsistencyWalk {
public:
    explicit ConsistencyWalk(Netlist const &walked) : netlist(walked) {}

    void Walk() {
        ForEach(netlist.GetComponentIterator(), [this](Component *component) {
            Expect(netlist.GetComponent(component->GetName()), *component);
            ForEach(component->GetPinIterator(), [](Pin *pin) { Read(pin); });
        });
        ForEach(netlist.GetSignalIterator(), [this](Signal *signal) {
            Expect(netlist.GetSignal(signal->GetName()), *signal);
            WalkSignal(signal);
        });
        ForEach(netlist.GetInstanceIterator(), [this](Instance *instance) {
            Expect(netlist.GetInstance(instance->GetName()), *instance);
            Read(instance->GetComponent());
            ForEach(instance->GetPinIterator(), [this](Pin *pin) { WalkPin(pin); });
        });
    }

private:
    [[noreturn]] static void Fail(Object const &object, char const *fault) {
        throw std::runtime_error(std::string(object.GetName()) + ": " + fault);
    }

    /// Touches an object, so that a sanitizer sees whether it lives.
    static void Read(Object const *object) {
        if (!object)
            throw std::runtime_error("null in a list");
        if (object->GetNameRef().GetLength() > 0 && object->GetNameRef().GetText()[0] == '\0')
            Fail(*object, "its text is shorter than its length");
    }

    static void Expect(Object const *found, Object const &object) {
        if (!found)
            Fail(object, "its name does not find it");
        if (!found->IsNamed(object.GetName()))
            Fail(object, "its name finds another");
    }

    void WalkSignal(Signal *signal) {
        Read(signal);
        if (!seen.insert(signal).second)
            return;
        std::set<Pin *> pins;
        ForEach(signal->GetPinIterator(), [&](Pin *pin) {
            Read(pin);
            if (!pins.insert(pin).second)
                Fail(*signal, "lists a pin twice");
        });
        std::set<Signal *> assigned;
        ForEach(signal->GetSignalIterator(), [&](Signal *other) {
            if (!assigned.insert(other).second)
                Fail(*signal, "lists a signal twice");
            WalkSignal(other);
        });
        signal->GetPortPolarity(); // asks the parent of a slice or bit, which may not be dead
        if (auto const *const bus = dynamic_cast<Bus const *>(signal))
            ForEach(bus->GetBusSliceIterator(), [this](Signal *slice) { WalkSignal(slice); });
        if (auto const *const compound = dynamic_cast<CompoundBus const *>(signal))
            ForEach(compound->GetBusMemberIterator(),
                    [this](Signal *member) { WalkSignal(member); });
        ExpectListedByBus(signal);
    }

    void ExpectListedByBus(Signal *signal) {
        Signal::SignalType const type = signal->GetSignalType();
        if (type != Signal::SIGNAL_BUS_SLICE && type != Signal::SIGNAL_BUS_INDEX)
            return;
        Bus const *const bus = netlist.GetParentBus(signal->GetName());
        if (!bus || IsMadeByLibrary(signal)) // of a dummy there may be two
            return;
        bool listed = false;
        ForEach(bus->GetBusSliceIterator(), [&](Signal *slice) { listed |= slice == signal; });
        if (!listed)
            Fail(*signal, "its bus does not list it");
    }

    static bool IsMadeByLibrary(Signal const *signal) {
        std::string const name(signal->GetName());
        return Basis::strimatch(name.c_str(), "*_openSignal*") ||
               Basis::strimatch(name.c_str(), "*_DUMMY*") ||
               Basis::strimatch(name.c_str(), "*_CONST_SIGNAL*");
    }

    void WalkPin(Pin *pin) {
        Read(pin);
        Signal *const signal = pin->GetSignal();
        if (!signal)
            return;
        WalkSignal(signal);
        bool listed = IsMadeByLibrary(signal);
        ForEach(signal->GetPinIterator(), [&](Pin *other) { listed |= other == pin; });
        if (!listed)
            Fail(*pin, ("is not listed by its signal " + std::string(signal->GetName())).c_str());
    }

    Netlist const &netlist;
    std::set<Signal *> seen;
};

} // namespace

std::string Inconsistency(Netlist const &netlist) {
    try {
        ConsistencyWalk(netlist).Walk();
    } catch (std::runtime_error const &fault) {
        return fault.what();
    }
    return "";
}
