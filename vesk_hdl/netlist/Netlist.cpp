#include "vesk_hdl/netlist/Netlist.h"

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/NaturalOrder.h"
#include "vesk_hdl/netlist/NetlistRecord.h"

namespace Vesk_Hdl {

using Basis::StringBase;

char const Netlist::DEFAULT_NETLIST_NAME[] = "HDL_NETLIST";

namespace {

int Length(StringBase<char> const &name) { return static_cast<int>(name.GetLength()); }

/// Enters an object whole or, when memory runs out, not at all; then it is deleted.
template <class T> void File(OwnPtrArray<T *> &array, NameTable<T> &map, T *object) {
    std::unique_ptr<T> held(object);
    array.Add(object);
    try {
        map.Add(object->GetNameRef(), object);
    } catch (...) {
        array.RemoveTail();
        throw;
    }
    held.release();
}

template <class T> void Unfile(OwnPtrArray<T *> &array, NameTable<T> &map, T *object) {
    if (array.GetTail() == object)
        array.RemoveTail();
    else
        array.Remove(object);
    map.Remove(object->GetNameRef(), object);
}

/// The longest name of the signals that pass a test, a bus counted by its base name.
template <class Test> int LongestName(Iterator<Signal *> &signals, Test test) {
    int longest = 0;
    for (signals.Rewind(); signals.HasMore(); signals.Advance()) {
        Signal const *const signal = signals.Current();
        if (!signal || !test(*signal))
            continue;
        auto const *const bus = As<Bus>(signal);
        longest = std::max(longest, Length(bus ? bus->GetBaseName() : signal->GetNameRef()));
    }
    return longest;
}

} // namespace

Netlist::Netlist(char const *name) : record(std::make_unique<Record>()) {
    SetNameText(name ? name : "hdlNetlist");
    SetObjectType(OBJECT_NETLIST);
}

Netlist::~Netlist() = default;

Object::ObjectType Netlist::GetObjectType() const { return GetStoredObjectType(); }
void Netlist::AcceptObject(ObjectVisitor &visitor) { visitor.VisitNetlist(this); }
void Netlist::SetName(char const *name) { SetNameText(name); }

void Netlist::SetSourceFileName(char const *fileName) { record->sourceFileName = fileName; }
StringBase<char> Netlist::GetSourceFileName() const { return record->sourceFileName; }

void Netlist::Add(Signal *signal) {
    if (!signal)
        return;
    std::unique_ptr<Signal> held(signal);
    record->signals.Add(signal);
    try {
        if (auto const *const bus = As<Bus>(signal))
            record->busMap.Add(bus->GetBaseName(), signal);
        else if (auto const *const compound = As<CompoundBus>(signal))
            ForEach(compound->GetBusMemberIterator(),
                    [this, signal](Signal *member) { KnowReferrer(member, signal); });
        record->signalMap.Add(signal->GetNameRef(), signal);
    } catch (...) {
        record->signals.RemoveTail();
        Forget(signal);
        throw;
    }
    held.release();
}

/// Everything that finds a signal but the array and the map of names.
void Netlist::Forget(Signal *signal) {
    record->referrers.Forget(signal);
    if (auto const *const bus = As<Bus>(signal)) {
        record->busMap.Remove(bus->GetBaseName(), signal);
    } else if (As<BusSlice>(signal) || As<BusIndex>(signal)) {
        if (Bus *const parent = GetParentBus(signal->GetNameRef()))
            parent->RemoveBusSlice(signal);
    }
}

void Netlist::Add(Instance *instance) {
    if (instance)
        File(record->instances, record->instanceMap, instance);
}

void Netlist::Add(Component *component) {
    if (component)
        File(record->components, record->componentMap, component);
}

void Netlist::Remove(Signal *signal) {
    if (!signal)
        return;
    Unfile(record->signals, record->signalMap, signal);
    record->referrers.Forget(signal);
    signal->DisconnectAll();
    if (auto const *const bus = As<Bus>(signal))
        record->busMap.Remove(bus->GetBaseName(), signal);
    delete signal;
}

void Netlist::Remove(Instance *instance) {
    if (!instance)
        return;
    Unfile(record->instances, record->instanceMap, instance);
    delete instance;
}

void Netlist::Remove(Component *component) {
    if (!component)
        return;
    Unfile(record->components, record->componentMap, component);
    delete component;
}

bool Netlist::IsNameUsed(Names::Key const &key) const {
    return FindComponent(key) || FindInstance(key) || FindSignal(key);
}

Signal *Netlist::FindSignal(Names::Key const &key) const { return record->signalMap.Get(key); }

Instance *Netlist::FindInstance(Names::Key const &key) const {
    return record->instanceMap.Get(key);
}

Component *Netlist::FindComponent(Names::Key const &key) const {
    return record->componentMap.Get(key);
}

Bus *Netlist::FindBus(Names::Key const &key) const {
    return static_cast<Bus *>(record->busMap.Get(key));
}

Signal *Netlist::GetSignal(char const *name) const { return FindSignal(Names::Key(name)); }
Instance *Netlist::GetInstance(char const *name) const { return FindInstance(Names::Key(name)); }
Component *Netlist::GetComponent(char const *name) const { return FindComponent(Names::Key(name)); }

Bus *Netlist::GetParentBus(char const *name) const {
    Names::NormalName const whole(name);
    return FindBus(Names::Key(Names::BaseName(whole.View())));
}

Iterator<Signal *> Netlist::GetSignalIterator() const {
    return Iterator<Signal *>(&record->signals);
}

Iterator<Instance *> Netlist::GetInstanceIterator() const {
    return Iterator<Instance *>(&record->instances);
}

Iterator<Component *> Netlist::GetComponentIterator() const {
    return Iterator<Component *>(&record->components);
}

void Netlist::GetInstances(Component const *component, PtrArray<Instance *> &found) const {
    found.Empty();
    if (!component)
        return;
    ForEach(record->instances, [component, &found](Instance *instance) {
        if (instance->GetComponent() == component)
            found.Add(instance);
    });
}

void Netlist::GetInstances(char const *componentName, PtrArray<Instance *> &found) const {
    GetInstances(GetComponent(componentName), found);
}

Bus *Netlist::Widen(Bus *bus, char const *name, PtrArray<Signal *> &inHand) {
    auto wide = std::make_unique<Bus>(name);
    wide->TakeCell(*bus);
    auto slice = std::make_unique<BusSlice>(bus->GetNameRef(), wide.get());
    BusSlice *const stand = slice.get();
    record->widenedSlices.Add(stand);
    slice.release();
    MoveConnections(bus, stand);
    ForEach(bus->GetBusSliceIterator(), [&wide](Signal *moved) { wide->AddBusSlice(moved); });
    ReplaceReferences(bus, stand);
    for (int i = 0; i < inHand.GetSize(); ++i)
        if (inHand.GetAt(i) == bus)
            inHand.SetAt(i, stand);
    Remove(bus);
    Bus *const result = wide.get();
    Add(wide.release());
    return result;
}

void Netlist::Link(Signal *left, Signal *right) {
    int const before = right->GetUnknownReferences();
    left->Connect(right);
    if (right->GetUnknownReferences() != before)
        KnowReferrer(right, left);
}

void Netlist::MoveConnections(Signal *from, Signal *to) {
    record->referrers.Copy(from, to);
    to->CloneConnection(from);
}

/// Notes who lists a signal, if it is one that can be widened.
void Netlist::KnowReferrer(Signal *target, Signal *referrer) {
    if (target->GetSignalType() == Signal::SIGNAL_BUS)
        record->referrers.Note(target, referrer);
    target->NoteKnownReference();
}

void Netlist::ReplaceReferencesIn(Signal *referrer, Signal *former, Signal *now) {
    referrer->ReplaceAssigned(former, now);
    if (auto *const compound = As<CompoundBus>(referrer))
        for (int i = 0; i < compound->GetSize(); ++i)
            if (compound->GetAt(i) == former)
                compound->SetAt(i, now);
}

/// Whatever may point at a signal one way: links, members of compounds, pins that it does not list.
/// Where a link or member was made behind the netlist's back, it looks at all signals there are.
void Netlist::ReplaceReferences(Signal *former, Signal *now) {
    Referrers::Set const known = record->referrers.TakeReferrers(former);
    auto const replaceIn = [&](Signal *referrer) { ReplaceReferencesIn(referrer, former, now); };
    if (former->GetUnknownReferences() == 0) {
        for (Signal *const referrer : known)
            replaceIn(referrer);
    } else {
        ForEach(record->signals, replaceIn);
        ForEach(record->widenedSlices, replaceIn);
    }
    if (!former->IsTied())
        return;
    auto const reconnect = [former, now](Pin *pin) {
        if (pin->GetSignal() == former)
            pin->Connect(now);
    };
    ForEach(record->instances,
            [&](Instance *instance) { ForEach(instance->GetPinIterator(), reconnect); });
    ForEach(record->components,
            [&](Component *component) { ForEach(component->GetPinIterator(), reconnect); });
}

void Netlist::SortNetlist() {
    auto const noPolarity = [](Object const *) { return Polarity(); };
    SortNaturally(record->signals, [](Signal const *s) { return s->GetPortPolarity(); });
    SortNaturally(record->components, noPolarity);
    SortNaturally(record->instances, noPolarity);
    ForEach(record->instances, [](Instance *instance) { instance->SortPinName(); });
}

int Netlist::GetLongestPinName(Iterator<Pin *> &pins) {
    int longest = 0;
    for (pins.Rewind(); pins.HasMore(); pins.Advance())
        if (Pin const *const pin = pins.Current())
            longest = std::max(longest, Length(pin->GetBaseName()));
    return longest;
}

int Netlist::GetLongestPortName(Iterator<Signal *> &signals) {
    return LongestName(signals,
                       [](Signal const &s) { return s.IsPort() && s.IsNeededToDeclared(); });
}

int Netlist::GetLongestSignalName(Iterator<Signal *> &signals) {
    return LongestName(signals, [](Signal const &s) { return s.IsNeededToDeclared(); });
}

void Netlist::GetLongestAttrName(AttributeHolder const *holder, int &longest) {
    if (holder && holder->HasAttrs())
        ForEach(holder->GetAttrIterator(), [&longest](Attribute const *attribute) {
            longest = std::max(longest, Length(attribute->GetNameRef()));
        });
}

int Netlist::GetLongestAttrName(Netlist const *netlist) {
    int longest = 0;
    if (!netlist)
        return longest;
    ForEach(netlist->record->signals, [&longest](Signal const *signal) {
        if (signal->GetPortPolarity() == Polarity::INVALID && signal->IsNeededToDeclared())
            GetLongestAttrName(signal, longest);
    });
    Component const *last = nullptr; // a look at the same one again tells nothing new
    ForEach(netlist->record->instances, [&longest, &last](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (component != last)
            GetLongestAttrName(component, longest);
        last = component;
        GetLongestAttrName(instance, longest);
    });
    return longest;
}

} // namespace Vesk_Hdl
