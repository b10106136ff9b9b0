// The class Bus. Widths and bounds are read from the name each time, see BusText.h.

#include "vesk_hdl/netlist/BusRecord.h"
#include "vesk_hdl/netlist/BusText.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

using Basis::StringBase;

Bus::Bus(char const *name) : Signal(name), record(new Record(this)) {}

Bus::~Bus() {
    record->bus = nullptr; // parts that live on have no parent then
    Record::Leave(record);
}

Signal::SignalType Bus::GetSignalType() const { return SIGNAL_BUS; }
void Bus::SetPortPolarity(Polarity const &polarity) { record->portPolarity = polarity; }

void Bus::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitBus(this);
    visitor.VisitSignal(this);
}

Polarity Bus::GetPortPolarity() const { return record->portPolarity; }
int Bus::GetWidth() const { return Names::BusWidth(GetNameRef().View()); }
bool Bus::IsPort() const { return GetPortPolarity() != Polarity::INVALID; }
bool Bus::IsNeededToDeclared() const { return true; }

StringBase<char> Bus::GetDummySignalName() const {
    StringBase<char> base = GetBaseName();
    return Names::EndsInDummyTag(base.View()) ? base : GetDummyBusName(*this);
}

void Bus::AddBusSlice(Signal *slice) { record->busSlices.Add(slice); }
void Bus::RemoveBusSlice(Signal *slice) { record->busSlices.Remove(slice); }
void Bus::EmptyBusSlice() { record->busSlices.Empty(); }

Iterator<Signal *> Bus::GetBusSliceIterator() const {
    return Iterator<Signal *>(&record->busSlices);
}

void Bus::GetIndex(StringBase<char> &left, StringBase<char> &right) const {
    GetBounds(*this, left, right);
}
void Bus::GetIndex(int, int) const {}
bool Bus::IsDownTo() const { return RunsDown(*this); }
StringBase<char> Bus::GetBaseName() const { return Object::GetBaseName(GetNameRef()); }
Bus *Bus::CreateDummySignal() const { return new Bus(GetDummySignalName()); }

bool Bus::IsBusName(StringBase<char> const &name) { return Names::IsBusName(name.View()); }

bool Bus::ParseBusName(StringBase<char> const &name, StringBase<char> &base, StringBase<char> &left,
                       StringBase<char> &right) {
    StringBase<char> const whole(name); // an output may be the name itself; `parts` refers to it
    Names::BusParts parts;
    if (!Names::SplitBusName(whole.View(), parts))
        return false;
    base = StringBase<char>(parts.base);
    left = StringBase<char>(parts.left);
    right = StringBase<char>(parts.right);
    return true;
}

bool Bus::ParseBusName(StringBase<char> const &name, StringBase<char> &base, int &left,
                       int &right) {
    Names::BusParts parts;
    if (!Names::SplitBusName(name.View(), parts))
        return false;
    left = Names::ToInt(parts.left);
    right = Names::ToInt(parts.right);
    base = StringBase<char>(parts.base); // last: it may be the name itself
    return true;
}

bool Bus::ParseBusName(StringBase<char> const &name, StringArray &bits) {
    std::string_view base;
    Names::Bounds bounds;
    if (!Names::ParseBus(name.View(), base, bounds))
        return false;
    // The test is at the end: a bus over all int values has one bit more than the counter can
    // count.
    for (unsigned int position = 0;; ++position) {
        bits.Add(Names::BitName(base, bounds.IndexAt(position)));
        if (position == bounds.Distance())
            return true;
    }
}

/// Computes what an expansion of the bus into its bits would show, since a bus of 2^31 bits is a
/// few characters of input.
StringBase<char> Bus::GetBusSliceName(StringBase<char> const &name, int start, int count) {
    std::string_view base;
    Names::Bounds bounds;
    if (!Names::ParseBus(name.View(), base, bounds))
        return {};
    long long const bits = static_cast<long long>(bounds.Distance()) + 1;
    long long const end = static_cast<long long>(start) + count;
    if (start < 0 || start >= bits || end > bits)
        return {};
    auto const first = static_cast<unsigned int>(start);
    if (count < 2)
        return Names::BitName(base, bounds.IndexAt(first));
    return Names::BusName(base, bounds.IndexAt(first),
                          bounds.IndexAt(static_cast<unsigned int>(end - 1)));
}

} // namespace Vesk_Hdl
