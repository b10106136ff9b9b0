// Macros: designs with a generic INIT, by whose name the writers know them. They hand their INIT on
// to their instances.

#include "tool/check/Attributes.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

bool NameHas(Design const &design, char const *mark) {
    return design.netlist.GetNameRef().View().find(mark) != std::string_view::npos;
}

/// Null if there is none. Only this spelling makes a macro.
Attribute const *InitOf(AttributeHolder const &holder) {
    Attribute const *const attribute = holder.HasAttrs() ? holder.GetAttr("INIT") : nullptr;
    return attribute && attribute->GetNameRef() == "INIT" ? attribute : nullptr;
}

bool IsGeneric(Attribute const &attribute) {
    return attribute.IsGenericSyn() || attribute.IsGenericNoSyn();
}

/// The INIT that VHDL hands on; null if the design is no macro there.
Attribute const *HandedInitOf(Design const &design) {
    Attribute const *const init = NameHas(design, "MORVANE") ? InitOf(design.netlist) : nullptr;
    return init && IsGeneric(*init) ? init : nullptr;
}

/// The INIT of the component has to be one that takes the macro's.
void CheckComponent(Design const &design, Component const &component, Attribute const &handed) {
    Attribute const *const init = component.HasAttrs() ? component.GetAttr("INIT") : nullptr;
    if (!init || design.options.vhdlOption.suppressComponent)
        return;
    std::string detail;
    if (!IsGeneric(*init))
        detail = "it is no generic";
    else if (VhdlTypeOf(*init) != VhdlTypeOf(handed) &&
             init->GetValueType() != Attribute::VALUE_USER &&
             handed.GetValueType() != Attribute::VALUE_USER)
        detail = VhdlTypeOf(*init) + " for " + VhdlTypeOf(handed);
    if (detail.empty())
        return;
    CompactLocation const spot = design.MadeAt(init);
    design.findings.Add({Id::HANDED_INIT,
                         spot.line > 0 ? spot : design.MadeAt(&component),
                         "attribute \"INIT\" of " + Quoted(component.GetNameRef().View()),
                         {{&handed, "the INIT of the macro is here"}},
                         BOTH,
                         std::move(detail)});
}

/// Verilog hands on the INIT of an instance, and writes one of option NOSYN as well.
void CheckInstance(Design const &design, Instance const &instance) {
    Attribute const *const init = InitOf(instance);
    if (!init || !init->IsGenericNoSyn())
        return;
    CompactLocation const spot = design.MadeAt(init);
    design.findings.Add({Id::DOUBLE_DEFPARAM, spot.line > 0 ? spot : design.MadeAt(&instance),
                         "attribute \"INIT\" of " + Quoted(instance.GetNameRef().View())});
}

} // namespace

bool HandsInitOn(Design const &design) { return HandedInitOf(design) != nullptr; }

bool TakesInitOfMacro(Design const &design, Component const &component) {
    return HandsInitOn(design) && component.GetAttr("INIT");
}

void CheckMacro(Design const &design) {
    if (Attribute const *const handed = HandedInitOf(design))
        design.ForEachUsedComponent(
            [&](Component const *component) { CheckComponent(design, *component, *handed); });
    Attribute const *const init = InitOf(design.netlist);
    if (init && init->IsGenericSyn() && (NameHas(design, "MORVANE") || NameHas(design, "HORVANE")))
        design.ForEachInstance([&](Instance const *instance) { CheckInstance(design, *instance); });
}

} // namespace Checks
