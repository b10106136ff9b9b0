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

/// The attribute BOX_TYPE that a VHDL write gives to each cell of the vendor's library; null if the
/// component is none or has one.
Vesk_Hdl::Attribute const *ComingBoxTypeOf(Vesk_Hdl::Component const &component);

/// Whether the VHDL configuration takes the component, which has instances, from the library work.
bool IsConfigured(Design const &design, Vesk_Hdl::Component const &component);

/// Whether no VHDL is written of the attribute: that of a component that is not declared, that of
/// an instance that only repeats its component's, and INIT in place of which a macro hands its own
/// on.
bool IsLeftOut(Design const &design, AttributeUse const &use);

/// Adds a finding about an attribute, at the place where it was made.
void AddFinding(Design const &design, Id id, AttributeUse const &use, Languages languages = BOTH,
                std::string detail = {});

/// Whether the design is a macro that hands its generic INIT on to its instances in VHDL.
bool HandsInitOn(Design const &design);

/// Whether VHDL hands the generic INIT of the design on to each instance of the component, in place
/// of the instance's own.
bool TakesInitOfMacro(Design const &design, Vesk_Hdl::Component const &component);

/// Checks library and use clauses, and the types of the user's that declarations name: those of
/// `typed`.
void CheckLibraries(Design const &design, std::vector<AttributeUse> const &typed);

/// Calls `act` with each use that is written: those of the module's generics, of components with
/// instances, of instances, and of nets that are declared. Attributes that a write adds are among
/// them.
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
        if (Attribute const *const boxType = ComingBoxTypeOf(*component))
            act(AttributeUse{boxType, AttributeUse::COMPONENT, component, false});
    });
    design.ForEachInstance(
        [&](Instance const *instance) { ofHolder(*instance, *instance, AttributeUse::INSTANCE); });
    design.ForEachSignal([&](Signal const *signal) {
        if (signal->IsNeededToDeclared())
            ofHolder(*signal, *signal, AttributeUse::SIGNAL);
    });
}

} // namespace Checks
