#include "vesk_hdl/model/HdlModel.h"

#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Netlist.h"

#define RAISE(...) VESK_HDL_RAISE("HdlModel", __VA_ARGS__)

namespace Vesk_Hdl {

using Basis::StringBase;

/// Names are shared by components, instances and signals; those of pins and attributes are not.
bool Model::IsNamedUsed(char const *name) { return GetNetlist()->IsNameUsed(Names::Key(name)); }

bool Model::AddComponent(char const *name) {
    if (!name)
        RAISE(Messages::INVALID_NAME);
    if (IsNamedUsed(name))
        RAISE(Messages::NAME_TAKEN, name);
    GetNetlist()->Add(new Component(name));
    SetModifiedFlag(true);
    return true;
}

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
    if (netlist.IsNameUsed(key))
        RAISE(Messages::NAME_TAKEN, instanceName);
    Component *const component = GetComponent(componentName);
    if (!component)
        RAISE(Messages::COMPONENT_NOT_FOUND, componentName);
    if (netlist.FindInstance(key)) // a guard: the identifier check has caught this
        RAISE(Messages::INSTANCE_EXISTS, instanceName);
    netlist.Add(new Instance(instanceName, component));
    SetModifiedFlag(true);
    return true;
}

bool Model::AddSignal(char const *name) {
    if (!name)
        RAISE(Messages::INVALID_NAME);
    Netlist &netlist = *GetNetlist();
    Names::Key const key(name);
    if (netlist.IsNameUsed(key))
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
