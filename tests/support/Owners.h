#pragma once

#include <string>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

/// A thing that carries attributes and comments: its words in keywords and in names of operations,
/// the names that find it in the design of Cells() with a signal s, and itself.
struct Owner {
    std::string words;
    std::string className;
    char const *holder;
    char const *pin;
    Vesk_Hdl::Object &(*find)(Vesk_Hdl::Model const &);

    /// HOLDER.PIN, as a line names it.
    std::string Name() const { return *pin ? holder + std::string(".") + pin : holder; }
    Vesk_Hdl::AttributeHolder &Attrs(Vesk_Hdl::Model const &model) const {
        return dynamic_cast<Vesk_Hdl::AttributeHolder &>(find(model));
    }
};

/// All six, in the order in which commands list them.
inline std::vector<Owner> const &Owners() {
    using M = Vesk_Hdl::Model const &;
    using Vesk_Hdl::Object;
    static std::vector<Owner> const owners = {
        {"MODULE", "Module", "", "", [](M m) -> Object & { return *m.GetNetlist(); }},
        {"COMPONENT", "Component", "CELL", "",
         [](M m) -> Object & { return *m.GetComponent("CELL"); }},
        {"INSTANCE", "Instance", "u1", "", [](M m) -> Object & { return *m.GetInstance("u1"); }},
        {"SIGNAL", "Signal", "s", "", [](M m) -> Object & { return *m.GetSignal("s"); }},
        {"COMPONENT PIN", "ComponentPin", "CELL", "A",
         [](M m) -> Object & { return *m.GetPin("A", m.GetComponent("CELL")); }},
        {"INSTANCE PIN", "InstancePin", "u1", "A",
         [](M m) -> Object & { return *m.GetPin("A", m.GetInstance("u1")); }}};
    return owners;
}

/// "W=9 SYN NONE" for each attribute; a user attribute with its type, "U(STATE)=on NONE NONE".
inline std::string AttrsOf(Vesk_Hdl::AttributeHolder const &holder) {
    std::string text;
    ForEach(holder.GetAttrIterator(), [&text](Vesk_Hdl::Attribute *attribute) {
        auto const *const user = dynamic_cast<Vesk_Hdl::AttributeUser *>(attribute);
        text += (text.empty() ? "" : "; ") + std::string(attribute->GetName());
        text += user ? "(" + std::string(user->GetUserType()) + ")" : "";
        text += "=" + std::string(attribute->GetValueString());
        text += " " + std::string(attribute->GetGeneric());
        text += " " + std::string(attribute->GetSynAttr());
    });
    return text;
}
