// The class ScalarSignal.

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

using Basis::StringBase;

/// Only ports have one: most scalar signals of a design are inner nets.
struct ScalarSignal::Record {
    Polarity portPolarity;
};

ScalarSignal::ScalarSignal(char const *name) : Signal(name) {}
ScalarSignal::~ScalarSignal() = default;

Signal::SignalType ScalarSignal::GetSignalType() const { return SIGNAL_SCALAR; }

void ScalarSignal::SetPortPolarity(Polarity const &polarity) {
    if (!record)
        record = std::make_unique<Record>();
    record->portPolarity = polarity;
}

void ScalarSignal::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitScalarSignal(this);
    visitor.VisitSignal(this);
}

Polarity ScalarSignal::GetPortPolarity() const {
    return record ? record->portPolarity : Polarity();
}

int ScalarSignal::GetWidth() const { return 1; }
bool ScalarSignal::IsPort() const { return GetPortPolarity() != Polarity::INVALID; }
bool ScalarSignal::IsNeededToDeclared() const { return true; }

/// Required: a name that ends in the mark gets no second one. A dummy that becomes a port again
/// then has the name of its own dummy.
StringBase<char> ScalarSignal::GetDummySignalName() const {
    StringBase<char> name = GetNameRef();
    if (!Names::EndsInDummyTag(name.View()))
        name += Names::DUMMY_TAG;
    return name;
}

ScalarSignal *ScalarSignal::CreateDummySignal() const {
    return new ScalarSignal(GetDummySignalName());
}

} // namespace Vesk_Hdl
