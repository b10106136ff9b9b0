#include "vesk_hdl/netlist/Signal.h"

#include <limits>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/ListIndex.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/text/LentPtrArray.h"
#include "vesk_hdl/text/basis/Tokens.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// What bus and slice read off their own names.

void BoundsOf(Object const &bus, StringBase<char> &left, StringBase<char> &right) {
    Names::BusParts parts;
    if (Names::SplitBusName(bus.GetNameRef().View(), parts)) {
        left = StringBase<char>(parts.left);
        right = StringBase<char>(parts.right);
    }
}

bool RunsDown(Object const &bus) {
    Names::Bounds bounds;
    return Names::ParseBounds(bus.GetNameRef().View(), bounds) && bounds.IsDownTo();
}

StringBase<char> BaseNameOf(Object const &object) {
    return Object::GetBaseName(object.GetNameRef());
}

/// BASE_DUMMY(LEFT:RIGHT).
StringBase<char> DummyBusName(Object const &bus) {
    StringBase<char> left;
    StringBase<char> right;
    BoundsOf(bus, left, right);
    StringBase<char> name = BaseNameOf(bus);
    name += Names::DUMMY_TAG;
    name += '(';
    name += left;
    name += ':';
    name += right;
    name += ')';
    return name;
}

void AddIfAbsent(StringSet &names, StringBase<char> const &name) {
    if (!names.IContains(name.View()))
        names.Add(name);
}

} // namespace

/// Three pins find room here: one that drives and two that read, as most nets of a design have.
struct Signal::Record {
    BitVectorValue constantValue;
    InlinePtrArray<Pin *, 3> pins;
    PtrArray<Signal *> signals;
    std::unique_ptr<ListIndex> index; ///< of both lists, once one of them was long when searched
    int unknownReferences = 0;
    bool tied = false;

    template <class T> bool Contains(PtrArray<T *> const &list, T *item) {
        if (list.GetSize() <= ListIndex::LONGEST_SCAN)
            return list.Contains(item);
        if (!index) {
            index = std::make_unique<ListIndex>();
            index->AddAll(pins);
            index->AddAll(signals);
        }
        return index->Contains(item);
    }

    template <class T> void Append(PtrArray<T *> &list, T *item) {
        list.Add(item);
        if (index)
            index->Add(item);
    }

    template <class T> void Remove(PtrArray<T *> &list, T *item) {
        if (list.Remove(item) && index && !list.Contains(item))
            index->Remove(item);
    }
};

Signal::Signal() : record(std::make_unique<Record>()) { SetObjectType(OBJECT_SIGNAL); }
Signal::Signal(char const *name) : record(std::make_unique<Record>()) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_SIGNAL);
}

Signal::~Signal() = default;

Object::ObjectType Signal::GetObjectType() const { return GetStoredObjectType(); }
void Signal::AcceptObject(ObjectVisitor &visitor) { visitor.VisitSignal(this); }
void Signal::SetName(char const *name) { Object::SetName(name); }

void Signal::NoteReference() { ++record->unknownReferences; }
void Signal::NoteKnownReference() { --record->unknownReferences; }
void Signal::NoteTie() { record->tied = true; }
int Signal::GetUnknownReferences() const { return record->unknownReferences; }
bool Signal::IsTied() const { return record->tied; }

void Signal::Connect(Pin *pin) {
    if (!pin || (pin->MayBeListed() && record->Contains(record->pins, pin)))
        return;
    record->Append(record->pins, pin);
    pin->SetListedSignal(this);
}

void Signal::Connect(Signal *other) {
    if (!other || record->Contains(record->signals, other))
        return;
    record->Append(record->signals, other);
    other->NoteReference();
}

void Signal::ReplaceAssigned(Signal *former, Signal *now) {
    PtrArray<Signal *> &signals = record->signals;
    for (int i = 0; i < signals.GetSize(); ++i)
        if (signals.GetAt(i) == former)
            signals.SetAt(i, now);
    if (record->index && record->index->Remove(former))
        record->index->Add(now);
}

void Signal::Disconnect(Pin *pin) {
    if (!pin)
        return;
    record->Remove(record->pins, pin);
    pin->Disconnect();
}

void Signal::Disconnect(Signal *other) { record->Remove(record->signals, other); }

void Signal::DisconnectAll() {
    ForEach(record->pins, [](Pin *pin) { pin->Disconnect(); });
    record->pins.Empty();
    record->signals.Empty();
    record->index.reset();
}

void Signal::CloneConnection(Signal *source) {
    DisconnectAll();
    if (!source)
        return;
    ForEach(source->record->pins, [this](Pin *pin) { record->Append(record->pins, pin); });
    ForEach(source->record->signals, [this](Signal *s) { record->Append(record->signals, s); });
    source->DisconnectAll();
    ForEach(record->pins, [this](Pin *pin) { pin->SetListedSignal(this); });
}

void Signal::AssignConstantValue(char const *text) { record->constantValue.SetValue(text); }
void Signal::AssignConstantValue(BitVectorValue const &value) { record->constantValue = value; }
BitVectorValue Signal::GetConstantValue() const { return record->constantValue; }
bool Signal::HasConstantValue() const { return !record->constantValue.IsEmpty(); }

bool Signal::HasMultiDriver() const {
    int drivers = 0;
    PtrArray<Pin *> const &pins = record->pins;
    for (int i = 0; i < pins.GetSize() && drivers < 2; ++i)
        if (Pin const *const pin = pins.GetAt(i))
            drivers += pin->GetPolarity() == Polarity::OUTPUT ? 1 : 0;
    return drivers > 1;
}

Iterator<Pin *> Signal::GetPinIterator() const { return Iterator<Pin *>(&record->pins); }

Iterator<Signal *> Signal::GetSignalIterator() const {
    return Iterator<Signal *>(&record->signals);
}

void Signal::GetBaseName(StringSet &names) const {
    if (auto const *const compound = As<CompoundBus>(this)) {
        AddIfAbsent(names, GetNameRef());
        ForEach(compound->GetBusMemberIterator(),
                [&names](Signal *member) { AddIfAbsent(names, BaseNameOf(*member)); });
    } else {
        AddIfAbsent(names, BaseNameOf(*this));
    }
}

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

StringBase<char> ScalarSignal::GetDummySignalName() const {
    StringBase<char> name = GetNameRef();
    if (!Names::EndsInDummyTag(name.View()))
        name += Names::DUMMY_TAG;
    return name;
}

ScalarSignal *ScalarSignal::CreateDummySignal() const {
    return new ScalarSignal(GetDummySignalName());
}

struct Bus::Record {
    PtrArray<Signal *> busSlices;
    Polarity portPolarity;
    std::shared_ptr<Bus *> cell; ///< null while the bus has no slices
};

Bus::Bus(char const *name) : Signal(name), record(std::make_unique<Record>()) {}
Bus::~Bus() {
    if (record->cell)
        *record->cell = nullptr;
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
    return Names::EndsInDummyTag(base.View()) ? base : DummyBusName(*this);
}

std::shared_ptr<Bus *> const &Bus::GetCell() {
    if (!record->cell)
        record->cell = std::make_shared<Bus *>(this);
    return record->cell;
}

/// Becomes the parent of all slices of another bus at one stroke, before it has any of its own.
void Bus::TakeCell(Bus &narrow) {
    record->cell = narrow.GetCell();
    *record->cell = this;
    narrow.record->cell.reset();
}

void Bus::AddBusSlice(Signal *slice) { record->busSlices.Add(slice); }
void Bus::RemoveBusSlice(Signal *slice) { record->busSlices.Remove(slice); }
void Bus::EmptyBusSlice() { record->busSlices.Empty(); }

Iterator<Signal *> Bus::GetBusSliceIterator() const {
    return Iterator<Signal *>(&record->busSlices);
}

void Bus::GetIndex(StringBase<char> &left, StringBase<char> &right) const {
    BoundsOf(*this, left, right);
}
void Bus::GetIndex(int, int) const {}
bool Bus::IsDownTo() const { return RunsDown(*this); }
StringBase<char> Bus::GetBaseName() const { return BaseNameOf(*this); }
Bus *Bus::CreateDummySignal() const { return new Bus(GetDummySignalName()); }

bool Bus::IsBusName(StringBase<char> const &name) { return Names::IsBusName(name.View()); }

bool Bus::ParseBusName(StringBase<char> const &name, StringBase<char> &base, StringBase<char> &left,
                       StringBase<char> &right) {
    StringBase<char> const whole(name); // an output may be the name itself
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
    base = StringBase<char>(parts.base);
    return true;
}

bool Bus::ParseBusName(StringBase<char> const &name, StringArray &bits) {
    Names::BusParts parts;
    Names::Bounds bounds;
    if (!Names::IsBusName(name.View()) || !Names::SplitBusName(name.View(), parts) ||
        !Names::ParseBounds(name.View(), bounds))
        return false;
    for (unsigned int position = 0;; ++position) {
        bits.Add(Names::BitName(parts.base, bounds.IndexAt(position)));
        if (position == bounds.Distance())
            return true;
    }
}

StringBase<char> Bus::GetBusSliceName(StringBase<char> const &name, int start, int count) {
    Names::BusParts parts;
    Names::Bounds bounds;
    if (!Names::IsBusName(name.View()) || !Names::SplitBusName(name.View(), parts) ||
        !Names::ParseBounds(name.View(), bounds))
        return {};
    long long const bits = static_cast<long long>(bounds.Distance()) + 1;
    long long const end = static_cast<long long>(start) + count;
    if (start < 0 || start >= bits || end > bits)
        return {};
    auto const first = static_cast<unsigned int>(start);
    if (count < 2)
        return Names::BitName(parts.base, bounds.IndexAt(first));
    StringBase<char> slice(parts.base);
    int const last = bounds.IndexAt(static_cast<unsigned int>(end - 1));
    return slice += StringBase<char>::doFormat("(%d:%d)", bounds.IndexAt(first), last);
}

struct BusSlice::Record {
    std::shared_ptr<Bus *> parent;
};

BusSlice::BusSlice(char const *name, Bus *parent)
    : Signal(name), record(new Record{parent ? parent->GetCell() : nullptr}) {
    if (parent)
        parent->AddBusSlice(this);
}
BusSlice::~BusSlice() = default;

Bus *BusSlice::GetParent() const { return record->parent ? *record->parent : nullptr; }

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
StringBase<char> BusSlice::GetDummySignalName() const { return DummyBusName(*this); }

void BusSlice::GetIndex(StringBase<char> &left, StringBase<char> &right) const {
    BoundsOf(*this, left, right);
}
bool BusSlice::IsDownTo() const { return RunsDown(*this); }
StringBase<char> BusSlice::GetBaseName() const { return BaseNameOf(*this); }

bool BusSlice::IsSameDirectionAsParent() const {
    Bus const *const parent = GetParent();
    return (parent && RunsDown(*parent)) == RunsDown(*this);
}

BusSlice *BusSlice::CreateDummySignal(Bus *parent) const {
    return new BusSlice(GetDummySignalName(), parent);
}

struct BusIndex::Record {
    std::shared_ptr<Bus *> parent;
    Polarity portPolarity;
};

BusIndex::BusIndex(char const *name, Bus *parent)
    : Signal(name), record(new Record{parent ? parent->GetCell() : nullptr, Polarity()}) {
    if (parent)
        parent->AddBusSlice(this);
}
BusIndex::~BusIndex() = default;

Bus *BusIndex::GetParent() const { return record->parent ? *record->parent : nullptr; }

Signal::SignalType BusIndex::GetSignalType() const { return SIGNAL_BUS_INDEX; }

void BusIndex::SetPortPolarity(Polarity const &polarity) {
    record->portPolarity = polarity;
    if (Bus *const parent = GetParent())
        parent->SetPortPolarity(polarity);
}

void BusIndex::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitBusIndex(this);
    visitor.VisitSignal(this);
}

Polarity BusIndex::GetPortPolarity() const {
    Bus const *const parent = GetParent();
    return parent ? parent->GetPortPolarity() : record->portPolarity;
}

int BusIndex::GetWidth() const { return 1; }
bool BusIndex::IsPort() const { return GetPortPolarity() != Polarity::INVALID; }
bool BusIndex::IsNeededToDeclared() const { return false; }

StringBase<char> BusIndex::GetDummySignalName() const {
    StringBase<char> name = GetBaseName();
    name += Names::DUMMY_TAG;
    name += '(';
    name += GetIndex();
    name += ')';
    return name;
}

StringBase<char> BusIndex::GetIndex() const {
    std::string_view base;
    std::string_view index;
    Names::SplitBusIndexName(GetNameRef().View(), base, index);
    return StringBase<char>(index);
}

StringBase<char> BusIndex::GetBaseName() const { return BaseNameOf(*this); }

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

struct CompoundBus::Record {
    PtrArray<Signal *> members;
};

CompoundBus::CompoundBus(char const *name) : Signal(name), record(std::make_unique<Record>()) {}

CompoundBus::CompoundBus(char const *name, PtrArray<Signal *> const &members) : CompoundBus(name) {
    for (int i = 0; i < members.GetSize(); ++i)
        AddBusMember(members.GetAt(i));
}

CompoundBus::~CompoundBus() = default;

Signal::SignalType CompoundBus::GetSignalType() const { return SIGNAL_COMPOUND_BUS; }

void CompoundBus::SetPortPolarity(Polarity const &polarity) {
    ForEach(record->members, [&polarity](Signal *member) { member->SetPortPolarity(polarity); });
}

void CompoundBus::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitCompoundBus(this);
    visitor.VisitSignal(this);
}

Polarity CompoundBus::GetPortPolarity() const {
    Signal const *const first = GetSize() < 2 ? nullptr : GetAt(0);
    return first ? first->GetPortPolarity() : Polarity();
}

int CompoundBus::GetWidth() const {
    long long width = 0;
    ForEach(record->members, [&width](Signal const *member) { width += member->GetWidth(); });
    return static_cast<int>(std::min<long long>(width, std::numeric_limits<int>::max()));
}

bool CompoundBus::IsPort() const { return false; }
bool CompoundBus::IsNeededToDeclared() const { return false; }

StringBase<char> CompoundBus::GetDummySignalName() const {
    StringBase<char> name;
    ForEach(record->members, [&name](Signal const *member) {
        if (!name.IsEmpty())
            name += ',';
        name += member->GetDummySignalName();
    });
    return name;
}

void CompoundBus::AddBusMember(Signal *signal) {
    if (IsIn(signal))
        return;
    record->members.Add(signal);
    if (signal)
        signal->NoteReference();
}

void CompoundBus::SetAt(int index, Signal *signal) {
    if (IsIn(signal))
        return;
    record->members.SetAt(index, signal);
    if (signal)
        signal->NoteReference();
}

bool CompoundBus::IsIn(Signal const *signal) const {
    if (!signal || signal->GetSignalType() != SIGNAL_COMPOUND_BUS)
        return false;
    bool isIn = signal == this;
    if (auto const *const compound = As<CompoundBus>(signal); compound && !isIn)
        ForEach(compound->record->members,
                [this, &isIn](Signal const *member) { isIn = isIn || IsIn(member); });
    return isIn;
}

Signal *CompoundBus::GetAt(int index) const { return record->members.GetAt(index); }
int CompoundBus::GetSize() const { return record->members.GetSize(); }

Iterator<Signal *> CompoundBus::GetBusMemberIterator() const {
    return Iterator<Signal *>(&record->members);
}

CompoundBus *CompoundBus::CreateDummySignal() const {
    return new CompoundBus(GetDummySignalName());
}

bool CompoundBus::IsCompoundBusName(StringBase<char> const &name) {
    return Names::IsCompoundBusName(name.View());
}

void CompoundBus::ParseCompoundBusName(StringBase<char> const &name, StringArray &members,
                                       bool expandBuses) {
    if (!IsCompoundBusName(name))
        return;
    // Neither separator stands in a member, so that one walk gives what two nested ones would.
    for (Basis_Range range = {1, 0}; Basis::NextToken(name.View(), range, ",\\", true);) {
        StringBase<char> const member(Basis::TokenIn(name.View(), range));
        if (!expandBuses || !Bus::ParseBusName(member, members))
            members.Add(member);
    }
}

SignalVisitor::~SignalVisitor() = default;

} // namespace Vesk_Hdl
