// The classes for parts of a bus: slices and indices. Both find their bus through a record that
// they share with it, see BusRecord.h.

#include <utility>

#include "vesk_hdl/netlist/BusRecord.h"
#include "vesk_hdl/netlist/BusText.h"
#include "vesk_hdl/netlist/Names.h"

namespace Vesk_Hdl {

using Basis::StringBase;

/// It joins the record last: if memory runs out in between, no destructor leaves it.
BusSlice::BusSlice(char const *name, Bus *parent) : Signal(name), parentRecord(nullptr) {
    if (!parent)
        return;
    parent->AddBusSlice(this);
    parentRecord = Bus::Record::Join(parent->record);
}

/// For a slice that takes the address of a widened bus. The list of slices already has that
/// address.
BusSlice::BusSlice(BusSlice &&made) noexcept
    : Signal(std::move(made)), parentRecord(std::exchange(made.parentRecord, nullptr)) {}

BusSlice::~BusSlice() { Bus::Record::Leave(parentRecord); }

Bus *BusSlice::GetParent() const { return parentRecord ? parentRecord->bus : nullptr; }

Signal::SignalType BusSlice::GetSignalType() const { return SIGNAL_BUS_SLICE; }

void BusSlice::SetPortPolarity(Polarity const &polarity) {
    if (Bus *const parent = GetParent())
        parent->SetPortPolarity(polarity);
}

void BusSlice::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitBusSlice(this);
    visitor.VisitSignal(this);
}

Polarity BusSlice::GetPortPolarity() const {
    Bus const *const parent = GetParent();
    return parent ? parent->GetPortPolarity() : Polarity();
}

int BusSlice::GetWidth() const { return Names::BusWidth(GetNameRef().View()); }
bool BusSlice::IsPort() const { return false; }
bool BusSlice::IsNeededToDeclared() const { return false; }
StringBase<char> BusSlice::GetDummySignalName() const { return GetDummyBusName(*this); }

void BusSlice::GetIndex(StringBase<char> &left, StringBase<char> &right) const {
    GetBounds(*this, left, right);
}
bool BusSlice::IsDownTo() const { return RunsDown(*this); }
StringBase<char> BusSlice::GetBaseName() const { return Object::GetBaseName(GetNameRef()); }

/// A parent that is gone counts as one that does not count down.
bool BusSlice::IsSameDirectionAsParent() const {
    Bus const *const parent = GetParent();
    return (parent && RunsDown(*parent)) == RunsDown(*this);
}

BusSlice *BusSlice::CreateDummySignal(Bus *parent) const {
    return new BusSlice(GetDummySignalName(), parent);
}

BusIndex::BusIndex(char const *name, Bus *parent)
    : Signal(name), parentRecord(parent ? nullptr : new Bus::Record(nullptr)) {
    // Without a parent the record holds the polarity of the index itself.
    if (!parent)
        return;
    parent->AddBusSlice(this);
    parentRecord = Bus::Record::Join(parent->record);
}

BusIndex::~BusIndex() { Bus::Record::Leave(parentRecord); }

Bus *BusIndex::GetParent() const { return parentRecord->bus; }

Signal::SignalType BusIndex::GetSignalType() const { return SIGNAL_BUS_INDEX; }

/// A port that is declared by one bit makes the whole bus a port: only whole buses can be declared.
void BusIndex::SetPortPolarity(Polarity const &polarity) {
    if (Bus *const parent = GetParent())
        parent->SetPortPolarity(polarity);
    else
        parentRecord->portPolarity = polarity;
}

void BusIndex::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitBusIndex(this);
    visitor.VisitSignal(this);
}

Polarity BusIndex::GetPortPolarity() const {
    Bus const *const parent = GetParent();
    return parent ? parent->GetPortPolarity() : parentRecord->portPolarity;
}

int BusIndex::GetWidth() const { return 1; }
bool BusIndex::IsPort() const { return GetPortPolarity() != Polarity::INVALID; }
bool BusIndex::IsNeededToDeclared() const { return false; }

/// Required: a base that ends in the mark gets another one, unlike that of a bus.
StringBase<char> BusIndex::GetDummySignalName() const {
    StringBase<char> base = GetBaseName();
    base += Names::DUMMY_TAG;
    return Names::BitName(base.View(), GetIndex().View());
}

StringBase<char> BusIndex::GetIndex() const {
    std::string_view base;
    std::string_view index; // stays empty if the name has another form
    Names::SplitBusIndexName(GetNameRef().View(), base, index);
    return StringBase<char>(index);
}

StringBase<char> BusIndex::GetBaseName() const { return Object::GetBaseName(GetNameRef()); }

BusIndex *BusIndex::CreateDummySignal(Bus *parent) const {
    return new BusIndex(GetDummySignalName(), parent);
}

bool BusIndex::IsBusIndexName(StringBase<char> const &name) {
    std::string_view base;
    std::string_view index;
    return Names::SplitBusIndexName(name.View(), base, index);
}

bool BusIndex::ParseBusIndexName(StringBase<char> const &name, StringBase<char> &base,
                                 StringBase<char> &index) {
    StringBase<char> const whole(name); // an output may be the name itself
    std::string_view basePart;
    std::string_view indexPart;
    if (!Names::SplitBusIndexName(whole.View(), basePart, indexPart))
        return false;
    base = StringBase<char>(basePart);
    index = StringBase<char>(indexPart);
    return true;
}

bool BusIndex::ParseBusIndexName(StringBase<char> const &name, StringBase<char> &base, int &index) {
    StringBase<char> indexText;
    if (!ParseBusIndexName(name, base, indexText))
        return false;
    index = Names::ToInt(indexText.View());
    return true;
}

} // namespace Vesk_Hdl
