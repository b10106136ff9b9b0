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

bool IsConfigured(Design const &design, Component const &component) {
    return !design.options.vhdlOption.suppressConfiguration && !IsVendorCell(component);
}

} // namespace Checks
