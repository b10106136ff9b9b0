// Model's attributes and comments, as a grid: a block for each kind of owner, and in it an entry
// for each operation, which finds the owner, with the message for that owner, and calls a base
// operation. The grid is written out, since each entry is an operation of its own in the interface.

#include "vesk_hdl/model/HdlModel.h"

#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/netlist/Netlist.h"

#define RAISE(...) VESK_HDL_RAISE("HdlModel", __VA_ARGS__)

using namespace Vesk_Hdl;

namespace {

// The finders. They return no null: what is missing is refused with the required message.

template <class T, class... Names> T *Found(T *object, Message const &message, Names... names) {
    if (!object)
        RAISE(message, names...);
    return object;
}

Component *FindComponent(Model const &model, char const *name) {
    return Found(model.GetComponent(name), Messages::COMPONENT_MISSING, name);
}

Instance *FindInstance(Model const &model, char const *name) {
    return Found(model.GetInstance(name), Messages::INSTANCE_MISSING, name);
}

/// For the operations that set options. Required: a missing instance is reported as a missing
/// attribute.
Instance *FindInstanceToSet(Model const &model, char const *name, char const *attribute) {
    return Found(model.GetInstance(name), Messages::INSTANCE_OF_ATTRIBUTE_MISSING, attribute, name);
}

Signal *FindSignal(Model const &model, char const *name) {
    return Found(model.GetSignal(name), Messages::SIGNAL_MISSING, name);
}

Pin *FindComponentPin(Model const &model, char const *component, char const *pin) {
    auto *const owner =
        Found(model.GetComponent(component), Messages::COMPONENT_OF_PIN_MISSING, pin, component);
    return Found(owner->GetPin(pin), Messages::PIN_NOT_FOUND, pin);
}

Pin *FindInstancePin(Model const &model, char const *instance, char const *pin) {
    auto *const owner =
        Found(model.GetInstance(instance), Messages::INSTANCE_OF_PIN_MISSING, pin, instance);
    return Found(owner->GetPin(pin), Messages::PIN_NOT_FOUND, pin);
}

Attribute *FindAttr(AttributeHolder const *holder, char const *name) {
    return Found(holder->GetAttr(name), Messages::ATTRIBUTE_NOT_FOUND, name);
}

void RequireName(char const *name) {
    if (!name)
        RAISE(Messages::INVALID_NAME);
}

void SetGeneric(Attribute &attribute, char const *word) {
    if (!attribute.SetGeneric(word))
        RAISE(Messages::INVALID_GENERIC_WORD, word);
}

void SetSynAttr(Attribute &attribute, char const *word) {
    if (!attribute.SetSynAttr(word))
        RAISE(Messages::INVALID_SYNTHESIS_WORD, word);
}

void SetUserTypeOf(Attribute &attribute, char const *userType) {
    auto *const user = dynamic_cast<AttributeUser *>(&attribute);
    if (!user)
        RAISE(Messages::NOT_A_USER_ATTRIBUTE, attribute.GetNameRef());
    user->SetUserType(userType);
}

/// The attribute that a Set operation on an instance changes: its own, or a clone of its
/// component's, which the instance keeps, so that other instances keep the component's value.
/// `found` is either of the two.
Attribute *OwnAttr(Instance *instance, Attribute *found, char const *name) {
    Found(found, Messages::ATTRIBUTE_NOT_FOUND, name);
    // Required: the clone stays also if the operation is refused afterwards.
    if (instance->GetAttr(name) == found)
        return found;
    Attribute *const copy = found->CloneAttribute();
    instance->AddAttr(copy);
    return copy;
}

} // namespace

namespace Vesk_Hdl {

// The base operations.

void Model::AddAttr(AttributeHolder *holder, char const *name, char const *value,
                    char const *type) {
    if (!holder)
        return;
    if (Attribute *const attribute = holder->GetAttr(name)) {
        attribute->SetValue(value); // it keeps its type: `type` has no effect
    } else {
        Attribute *const added = AttributeFactory::GetInstance().CreateAttribute(type, name, value);
        if (!added)
            RAISE(Messages::INVALID_ATTRIBUTE_TYPE, type);
        holder->AddAttr(added);
    }
    SetModifiedFlag(true);
}

void Model::SetGenericAttrValue(AttributeHolder *holder, char const *name, char const *word) {
    if (!holder)
        return;
    SetGeneric(*FindAttr(holder, name), word);
    SetModifiedFlag(true);
}

void Model::SetSynAttrValue(AttributeHolder *holder, char const *name, char const *word) {
    if (!holder)
        return;
    SetSynAttr(*FindAttr(holder, name), word);
    SetModifiedFlag(true);
}

void Model::SetAttrValue(AttributeHolder *holder, char const *name, char const *value) {
    if (!holder)
        return;
    FindAttr(holder, name)->SetValue(value);
    SetModifiedFlag(true);
}

void Model::SetUserType(AttributeHolder *holder, char const *name, char const *userType) {
    if (!holder)
        return;
    SetUserTypeOf(*FindAttr(holder, name), userType);
    SetModifiedFlag(true);
}

// The module.

void Model::AddModuleAttr(char const *name, char const *value, char const *type) {
    RequireName(name);
    AddAttr(GetNetlist(), name, value, type);
}
void Model::SetModuleGenericAttrValue(char const *name, char const *word) {
    SetGenericAttrValue(GetNetlist(), name, word);
}
void Model::SetModuleSynAttrValue(char const *name, char const *word) {
    SetSynAttrValue(GetNetlist(), name, word);
}
void Model::SetModuleAttrValue(char const *name, char const *value) {
    SetAttrValue(GetNetlist(), name, value);
}
void Model::SetModuleUserType(char const *name, char const *userType) {
    SetUserType(GetNetlist(), name, userType);
}
void Model::AddNotes(char const *text) {
    if (text)
        GetNetlist()->AddComment(text);
}

// A component.

void Model::AddComponentAttr(char const *component, char const *name, char const *value,
                             char const *type) {
    RequireName(name);
    AddAttr(FindComponent(*this, component), name, value, type);
}
void Model::SetComponentGenericAttrValue(char const *component, char const *name,
                                         char const *word) {
    SetGenericAttrValue(FindComponent(*this, component), name, word);
}
void Model::SetComponentSynAttrValue(char const *component, char const *name, char const *word) {
    SetSynAttrValue(FindComponent(*this, component), name, word);
}
void Model::SetComponentAttrValue(char const *component, char const *name, char const *value) {
    SetAttrValue(FindComponent(*this, component), name, value);
}
void Model::SetComponentUserType(char const *component, char const *name, char const *userType) {
    SetUserType(FindComponent(*this, component), name, userType);
}
void Model::AddComponentComment(char const *component, char const *text) {
    if (text)
        FindComponent(*this, component)->AddComment(text);
}

// An instance.

/// The attribute that is in effect for an instance.
Attribute *Model::GetInstanceOrComponentAttr(char const *name, Instance *instance) const {
    if (!instance)
        return nullptr;
    Attribute *const own = instance->GetAttr(name);
    return own ? own : instance->GetComponentAttr(name);
}

void Model::AddInstanceAttr(char const *instance, char const *name, char const *value,
                            char const *type) {
    RequireName(name);
    AddAttr(FindInstance(*this, instance), name, value, type);
}
void Model::SetInstanceGenericAttrValue(char const *instance, char const *name, char const *word) {
    Instance *const owner = FindInstanceToSet(*this, instance, name);
    SetGeneric(*OwnAttr(owner, GetInstanceOrComponentAttr(name, owner), name), word);
    SetModifiedFlag(true);
}
void Model::SetInstanceSynAttrValue(char const *instance, char const *name, char const *word) {
    Instance *const owner = FindInstanceToSet(*this, instance, name);
    SetSynAttr(*OwnAttr(owner, GetInstanceOrComponentAttr(name, owner), name), word);
    SetModifiedFlag(true);
}
void Model::SetInstanceAttrValue(char const *instance, char const *name, char const *value) {
    Instance *const owner = FindInstance(*this, instance);
    OwnAttr(owner, GetInstanceOrComponentAttr(name, owner), name)->SetValue(value);
    SetModifiedFlag(true);
}
void Model::SetInstanceUserType(char const *instance, char const *name, char const *userType) {
    Instance *const owner = FindInstance(*this, instance);
    SetUserTypeOf(*OwnAttr(owner, GetInstanceOrComponentAttr(name, owner), name), userType);
    SetModifiedFlag(true);
}
void Model::AddInstanceComment(char const *instance, char const *text) {
    if (text)
        FindInstance(*this, instance)->AddComment(text);
}

// A signal.

void Model::AddSignalAttr(char const *signal, char const *name, char const *value,
                          char const *type) {
    RequireName(name);
    AddAttr(FindSignal(*this, signal), name, value, type);
}
void Model::SetSignalGenericAttrValue(char const *signal, char const *name, char const *word) {
    SetGenericAttrValue(FindSignal(*this, signal), name, word);
}
void Model::SetSignalSynAttrValue(char const *signal, char const *name, char const *word) {
    SetSynAttrValue(FindSignal(*this, signal), name, word);
}
void Model::SetSignalAttrValue(char const *signal, char const *name, char const *value) {
    SetAttrValue(FindSignal(*this, signal), name, value);
}
void Model::SetSignalUserType(char const *signal, char const *name, char const *userType) {
    SetUserType(FindSignal(*this, signal), name, userType);
}
void Model::AddSignalComment(char const *signal, char const *text) {
    if (text)
        FindSignal(*this, signal)->AddComment(text);
}

// The pin of a component.

void Model::AddComponentPinAttr(char const *component, char const *pin, char const *name,
                                char const *value, char const *type) {
    RequireName(name);
    AddAttr(FindComponentPin(*this, component, pin), name, value, type);
}
void Model::SetComponentPinGenericAttrValue(char const *component, char const *pin,
                                            char const *name, char const *word) {
    SetGenericAttrValue(FindComponentPin(*this, component, pin), name, word);
}
void Model::SetComponentPinSynAttrValue(char const *component, char const *pin, char const *name,
                                        char const *word) {
    SetSynAttrValue(FindComponentPin(*this, component, pin), name, word);
}
void Model::SetComponentPinAttrValue(char const *component, char const *pin, char const *name,
                                     char const *value) {
    SetAttrValue(FindComponentPin(*this, component, pin), name, value);
}
void Model::SetComponentPinUserType(char const *component, char const *pin, char const *name,
                                    char const *userType) {
    SetUserType(FindComponentPin(*this, component, pin), name, userType);
}
void Model::AddComponentPinComment(char const *component, char const *pin, char const *text) {
    if (text)
        FindComponentPin(*this, component, pin)->AddComment(text);
}

// The pin of an instance.

void Model::AddInstancePinAttr(char const *instance, char const *pin, char const *name,
                               char const *value, char const *type) {
    RequireName(name);
    AddAttr(FindInstancePin(*this, instance, pin), name, value, type);
}
void Model::SetInstancePinGenericAttrValue(char const *instance, char const *pin, char const *name,
                                           char const *word) {
    SetGenericAttrValue(FindInstancePin(*this, instance, pin), name, word);
}
void Model::SetInstancePinSynAttrValue(char const *instance, char const *pin, char const *name,
                                       char const *word) {
    SetSynAttrValue(FindInstancePin(*this, instance, pin), name, word);
}
void Model::SetInstancePinAttrValue(char const *instance, char const *pin, char const *name,
                                    char const *value) {
    SetAttrValue(FindInstancePin(*this, instance, pin), name, value);
}
void Model::SetInstancePinUserType(char const *instance, char const *pin, char const *name,
                                   char const *userType) {
    SetUserType(FindInstancePin(*this, instance, pin), name, userType);
}
void Model::AddInstancePinComment(char const *instance, char const *pin, char const *text) {
    if (text)
        FindInstancePin(*this, instance, pin)->AddComment(text);
}

} // namespace Vesk_Hdl
