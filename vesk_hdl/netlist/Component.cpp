// The class Component. Its pins are found by the index of their family once they are many.

#include "vesk_hdl/netlist/ComponentRecord.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/PinList.h"

namespace Vesk_Hdl {

namespace {

/// Required: the class follows from the name as it was typed. D[7:0] is no bus name before it is
/// rewritten, and so becomes a pin of one bit that is called D(7:0).
std::unique_ptr<Pin> MakePin(char const *name, Polarity const &polarity) {
    std::string_view const text(name ? name : "");
    std::string_view base;
    std::string_view index;
    if (Names::IsBusName(text))
        return std::make_unique<BusPin>(name, polarity);
    if (Names::SplitBusIndexName(text, base, index))
        return std::make_unique<BusIndexPin>(name, polarity);
    return std::make_unique<ScalarPin>(name, polarity);
}

} // namespace

Component::Component(char const *name) : record(std::make_unique<Record>(this)) {
    SetNormalizedName(name);
    SetObjectType(OBJECT_COMPONENT);
}

Component::~Component() = default;

Object::ObjectType Component::GetObjectType() const { return GetStoredObjectType(); }
void Component::AcceptObject(ObjectVisitor &visitor) { visitor.VisitComponent(this); }
void Component::SetName(char const *name) { Object::SetName(name); }

void Component::AddPin(char const *name, Polarity const &polarity,
                       BitVectorValue const &defaultValue) {
    std::unique_ptr<Pin> pin = MakePin(name, polarity);
    if (!defaultValue.IsEmpty())
        pin->SetDefaultValue(defaultValue);
    // The pin shares the family before it is added: it reports changes from the beginning.
    pin->Enter(record->family);
    record->pins.Add(pin.get());
    pin.release();
    record->family->AddPin(record->pins);
}

void Component::AddPin(char const *name, Polarity const &polarity, char const *defaultValue) {
    AddPin(name, polarity, BitVectorValue(defaultValue));
}

void Component::AddPin(Pin const &pin) {
    AddPin(pin.GetName(), pin.GetPolarity(), pin.GetDefaultValue());
}

Pin *Component::GetPin(char const *name) const {
    Names::NormalName const normal(name);
    return FindPin(record->pins, normal.View(), record->family->Find(normal.View()));
}

Iterator<Pin *> Component::GetPinIterator() const { return Iterator<Pin *>(&record->pins); }

} // namespace Vesk_Hdl
