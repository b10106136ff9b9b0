#pragma once

#include <string>

#include "tool/check/Design.h"

namespace Checks {

/// One statement that an attribute is written by. An attribute of both options has two uses.
struct AttributeUse {
    enum Kind { MODULE, COMPONENT, INSTANCE, SIGNAL };

    Vesk_Hdl::Attribute const *attribute;
    Kind kind;
    Vesk_Hdl::Object const *owner;
    bool
        generic; ///< a generic or parameter; otherwise an attribute statement, a comment in Verilog
};

/// How VHDL calls the type of an attribute.
std::string VhdlTypeOf(Vesk_Hdl::Attribute const &attribute);

/// Calls `act` with each use that is written: those of the module's generics, of components with
/// instances, of instances, and of nets that are declared.
template <class Act> void ForEachAttribute(Design const &design, Act act) {
    using namespace Vesk_Hdl;
    auto const ofHolder = [&act](AttributeHolder const &holder, Object const &owner,
                                 AttributeUse::Kind kind) {
        if (!holder.HasAttrs())
            return;
        ForEach(holder.GetAttrIterator(), [&](Attribute const *attribute) {
            if (kind != AttributeUse::SIGNAL &&
                (attribute->IsGenericSyn() || attribute->IsGenericNoSyn()))
                act(AttributeUse{attribute, kind, &owner, true});
            if (kind != AttributeUse::MODULE && attribute->IsSynAssigned())
                act(AttributeUse{attribute, kind, &owner, false});
        });
    };
    ofHolder(design.netlist, design.netlist, AttributeUse::MODULE);
    design.ForEachUsedComponent([&](Component const *component) {
        ofHolder(*component, *component, AttributeUse::COMPONENT);
    });
    design.ForEachInstance(
        [&](Instance const *instance) { ofHolder(*instance, *instance, AttributeUse::INSTANCE); });
    design.ForEachSignal([&](Signal const *signal) {
        if (signal->IsNeededToDeclared())
            ofHolder(*signal, *signal, AttributeUse::SIGNAL);
    });
}

} // namespace Checks
