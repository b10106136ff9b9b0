// Model's declarations and lookups. Each operation checks first and changes afterwards, so that a
// refusal leaves the design as it was. Reserved words are no matter of a model: the languages
// differ in them.

#include "vesk_hdl/model/HdlModel.h"

#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/NetlistEdit.h"

#define RAISE(...) VESK_HDL_RAISE("HdlModel", __VA_ARGS__)

namespace Vesk_Hdl {

using Basis::StringBase;

/// Components, instances and signals share one space of names, since both languages declare them in
/// one region. Pins and attributes have their own.
bool Model::IsNamedUsed(char const *name) {
    return NetlistEdit(*GetNetlist()).IsNameUsed(Names::Key(name));
}

bool Model::AddComponent(char const *name) {
    if (!name)
        RAISE(Messages::INVALID_NAME);
    if (IsNamedUsed(name))
        RAISE(Messages::NAME_TAKEN, name);
    GetNetlist()->Add(new Component(name));
    SetModifiedFlag(true);
    return true;
}

/// The pins of a component are no identifiers of the design: any name that the component does not
/// have is free.
bool Model::AddPin(char const *pinName, Polarity const &polarity, char const *componentName,
                   char const *initialValue) {
    if (!pinName)
        RAISE(Messages::INVALID_NAME);
    Component *const component = GetComponent(componentName);
    if (!component)
        RAISE(Messages::COMPONENT_NOT_FOUND, componentName);
    if (component->GetPin(pinName))
        RAISE(Messages::PIN_TAKEN, componentName, pinName);
    component->AddPin(pinName, polarity, initialValue);
    SetModifiedFlag(true);
    return true;
}

bool Model::AddInstance(char const *instanceName, char const *componentName) {
    if (!instanceName)
        RAISE(Messages::INVALID_NAME);
    Netlist &netlist = *GetNetlist();
    Names::Key const key(instanceName);
    if (NetlistEdit(netlist).IsNameUsed(key))
        RAISE(Messages::NAME_TAKEN, instanceName);
    Component *const component = GetComponent(componentName);
    if (!component)
        RAISE(Messages::COMPONENT_NOT_FOUND, componentName);
    // The test above has caught this case. The guard and its message are part of the interface.
    if (NetlistEdit(netlist).FindInstance(key))
        RAISE(Messages::INSTANCE_EXISTS, instanceName);
    netlist.Add(new Instance(instanceName, component));
    SetModifiedFlag(true);
    return true;
}

/// Required: only the form of a bus makes another class. A declared D(3) or A,B is a single net of
/// that name.
bool Model::AddSignal(char const *name) {
    if (!name)
        RAISE(Messages::INVALID_NAME);
    Netlist &netlist = *GetNetlist();
    Names::Key const key(name);
    if (NetlistEdit(netlist).IsNameUsed(key))
        RAISE(Messages::NAME_TAKEN, name);
    if (Names::IsBusName(key.View())) {
        if (netlist.GetParentBus(name))
            RAISE(Messages::BUS_DECLARED, name);
        netlist.Add(new Bus(name));
    } else {
        netlist.Add(new ScalarSignal(name));
    }
    SetModifiedFlag(true);
    return true;
}

Component *Model::GetComponent(char const *name) const { return GetNetlist()->GetComponent(name); }
Instance *Model::GetInstance(char const *name) const { return GetNetlist()->GetInstance(name); }
Signal *Model::GetSignal(char const *name) const { return GetNetlist()->GetSignal(name); }

Pin *Model::GetPin(char const *name, Component const *component) const {
    return component ? component->GetPin(name) : nullptr;
}

Pin *Model::GetPin(char const *name, Instance const *instance) const {
    return instance ? instance->GetPin(name) : nullptr;
}

Attribute *Model::GetAttr(char const *name, AttributeHolder const *holder) const {
    return holder ? holder->GetAttr(name) : nullptr;
}

} // namespace Vesk_Hdl
