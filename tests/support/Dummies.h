#pragma once

#include <memory>
#include <string>

#include "vesk_hdl/Vesk_Hdl.h"

/// What a plan says of the dummy signals of a netlist.
class Dummies {
public:
    Dummies(Vesk_Hdl::Netlist const &planned, Vesk_Hdl::DummyPlan const &plan) : netlist(planned) {
        for (int i = 0; i < plan.GetSize(); ++i) {
            Vesk_Hdl::DummyPlan::Step const &step = plan.GetAt(i);
            Add(step.net, step);
            if (auto const *const bus = dynamic_cast<Vesk_Hdl::Bus const *>(step.net))
                Vesk_Hdl::ForEach(bus->GetBusSliceIterator(),
                                  [&](Vesk_Hdl::Signal const *part) { Add(part, step); });
        }
    }

    /// The names that come to the netlist, in order, each with a blank in front.
    std::string const &GetNames() const { return names; }
    /// Whether one of the names is taken, so that the plan need not be exact.
    bool MeetOthers() const { return meetsOther; }

private:
    void Add(Vesk_Hdl::Signal const *signal, Vesk_Hdl::DummyPlan::Step const &step) {
        Basis::StringBase<char> name = signal->GetDummySignalName();
        if (step.former != Vesk_Hdl::DummyPlan::NONE)
            name = DummyOf(*signal, name)->GetDummySignalName();
        meetsOther |= netlist.GetSignal(name) || netlist.GetParentBus(name);
        names += " " + std::string(name.View());
    }

    static std::unique_ptr<Vesk_Hdl::Signal> DummyOf(Vesk_Hdl::Signal const &signal,
                                                     char const *name) {
        switch (signal.GetSignalType()) {
        case Vesk_Hdl::Signal::SIGNAL_BUS:
            return std::make_unique<Vesk_Hdl::Bus>(name);
        case Vesk_Hdl::Signal::SIGNAL_BUS_SLICE:
            return std::make_unique<Vesk_Hdl::BusSlice>(name, nullptr);
        case Vesk_Hdl::Signal::SIGNAL_BUS_INDEX:
            return std::make_unique<Vesk_Hdl::BusIndex>(name, nullptr);
        default:
            return std::make_unique<Vesk_Hdl::ScalarSignal>(name);
        }
    }

    Vesk_Hdl::Netlist const &netlist;
    std::string names;
    bool meetsOther = false;
};

/// The names of the signals from an index on, each with a blank in front.
inline std::string SignalsFrom(Vesk_Hdl::Netlist const &netlist, int first) {
    std::string names;
    for (int i = first; i < netlist.GetSignals().GetSize(); ++i)
        names += " " + std::string(netlist.GetSignals().GetAt(i)->GetNameRef().View());
    return names;
}
