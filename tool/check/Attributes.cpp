#include "tool/check/Attributes.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

bool IsVendorCell(Component const &component) {
    Attribute const *const level = component.HasAttrs() ? component.GetAttr("Level") : nullptr;
    return level && SameIgnoringCase(level->GetValueString().View(), "ORVANE");
}

} // namespace

Attribute const *ComingBoxTypeOf(Component const &component) {
    static AttributeString const boxType = [] {
        AttributeString attribute("BOX_TYPE", "BLACK_BOX");
        attribute.SetSynAttr("ASSIGN");
        return attribute;
    }();
    return IsVendorCell(component) && !component.GetAttr("BOX_TYPE") ? &boxType : nullptr;
}

bool IsLeftOut(Design const &design, AttributeUse const &use) {
    if (use.kind == AttributeUse::COMPONENT)
        return design.options.vhdlOption.suppressComponent;
    if (use.kind != AttributeUse::INSTANCE)
        return false;
    auto const &instance = static_cast<Instance const &>(*use.owner);
    if (use.generic)
        return use.attribute->GetNameRef() == "INIT" && instance.GetComponent() &&
               TakesInitOfMacro(design, *instance.GetComponent());
    Attribute const *const inherited = instance.GetComponentAttr(use.attribute->GetNameRef());
    return inherited && *use.attribute == *inherited;
}

void AddFinding(Design const &design, Id id, AttributeUse const &use, Languages languages,
                std::string detail) {
    CompactLocation const spot = design.MadeAt(use.attribute);
    design.findings.Add({id,
                         spot.line > 0 ? spot : design.MadeAt(use.owner),
                         "attribute " + Quoted(use.attribute->GetNameRef().View()) + " of " +
                             Quoted(use.owner->GetNameRef().View()),
                         {},
                         languages,
                         std::move(detail)});
}

bool IsConfigured(Design const &design, Component const &component) {
    return !design.options.vhdlOption.suppressConfiguration && !IsVendorCell(component);
}

} // namespace Checks
