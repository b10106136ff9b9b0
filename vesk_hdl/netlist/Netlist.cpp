// The contents of a netlist. docs/architecture.md, "Who owns what", says who points at what it
// holds.

#include "vesk_hdl/netlist/Netlist.h"

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/NaturalOrder.h"
#include "vesk_hdl/netlist/NetlistRecord.h"
#include "vesk_hdl/text/ForEachAhead.h"

namespace Vesk_Hdl {

using Basis::StringBase;

char const Netlist::DEFAULT_NETLIST_NAME[] = "HDL_NETLIST";

namespace {

int Length(StringBase<char> const &name) { return static_cast<int>(name.GetLength()); }

/// Adds an object to both array and table. If memory runs out, it is in neither and is deleted.
template <class T> void File(ObjectArray<T> &array, NameTable<T> &map, T *object) {
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

/// Removes an object from both. False if it was not in the array; the table is asked all the same,
/// since whatever it finds by that name must not be found any more.
template <class T> bool Unfile(ObjectArray<T> &array, NameTable<T> &map, T *object) {
    bool const wasThere = array.Remove(object);
    map.Remove(object->GetNameRef(), object);
    return wasThere;
}

/// The longest name of the signals that pass a test, where a bus counts by its base name.
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
    // Required: another default than that of Model::SetName.
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
    StringBase<char> const &name = signal->GetNameRef();
    record->signals.Add(signal);
    try {
        record->signalMap.Add(name, signal);
        // Last: until here a lookup still finds the bus that a wider one of the same base name
        // replaces.
        if (auto const *const bus = As<Bus>(signal))
            record->busMap.Add(bus->GetBaseName(), signal);
    } catch (...) {
        record->signals.RemoveTail();
        // The table may not have got that far, or may find an older signal of the name.
        if (record->signalMap.Get(Names::Key(name.View())) == signal)
            record->signalMap.Remove(name, signal);
        if (As<BusSlice>(signal) || As<BusIndex>(signal))
            if (Bus *const parent = GetParentBus(name))
                parent->RemoveBusSlice(signal);
        throw;
    }
    held.release();
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
    if (!Unfile(record->signals, record->signalMap, signal))
        record->widenedSlices.Remove(signal); // a client can find one through its bus
    signal->DisconnectAll();                  // its pins must not point at a signal that is gone
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

Signal *Netlist::GetSignal(char const *name) const {
    return record->signalMap.Get(Names::Key(name));
}
Instance *Netlist::GetInstance(char const *name) const {
    return record->instanceMap.Get(Names::Key(name));
}
Component *Netlist::GetComponent(char const *name) const {
    return record->componentMap.Get(Names::Key(name));
}

/// The cast is safe: only objects of class Bus are filed by base name, see Add.
Bus *Netlist::GetParentBus(char const *name) const {
    Names::NormalName const whole(name);
    return static_cast<Bus *>(record->busMap.Get(Names::Key(Names::BaseName(whole.View()))));
}

Iterator<Signal *> Netlist::GetSignalIterator() const { return record->signals.GetIterator(); }
Iterator<Instance *> Netlist::GetInstanceIterator() const {
    return record->instances.GetIterator();
}
Iterator<Component *> Netlist::GetComponentIterator() const {
    return record->components.GetIterator();
}

PtrArray<Signal *> const &Netlist::GetSignals() const { return record->signals.Get(); }
PtrArray<Instance *> const &Netlist::GetInstances() const { return record->instances.Get(); }
PtrArray<Component *> const &Netlist::GetComponents() const { return record->components.Get(); }

void Netlist::GetInstances(Component const *component, PtrArray<Instance *> &found) const {
    found.Empty();
    if (!component)
        return;
    ForEachAhead(GetInstances(), [component, &found](Instance *instance) {
        if (instance->GetComponent() == component)
            found.Add(instance);
    });
}

void Netlist::GetInstances(char const *componentName, PtrArray<Instance *> &found) const {
    GetInstances(GetComponent(componentName), found);
}

/// Components keep the order of their pins: it is that of their declaration in the text.
void Netlist::SortNetlist() {
    auto const noPolarity = [](Object const *) { return Polarity(); };
    SortNaturally(record->signals.GetForSort(),
                  [](Signal const *signal) { return signal->GetPortPolarity(); });
    SortNaturally(record->components.GetForSort(), noPolarity);
    SortNaturally(record->instances.GetForSort(), noPolarity);
    ForEachAhead(GetInstances(), [](Instance *instance) { instance->SortPinName(); });
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
    ForEachAhead(netlist->GetSignals(), [&longest](Signal const *signal) {
        if (signal->GetPortPolarity() == Polarity::INVALID && signal->IsNeededToDeclared())
            GetLongestAttrName(signal, longest);
    });
    Component const *last = nullptr; // instances of one component are mostly neighbours
    ForEachAhead(netlist->GetInstances(), [&longest, &last](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (component != last)
            GetLongestAttrName(component, longest);
        last = component;
        GetLongestAttrName(instance, longest);
    });
    return longest;
}

} // namespace Vesk_Hdl
