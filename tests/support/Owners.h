#pragma once

#include <string>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

/// An object that has attributes and comments: its words in keywords, and its names in the design
/// of Cells() with a signal s.
struct Owner {
    std::string words;
    char const *holder;
    char const *pin;
    Vesk_Hdl::Object &(*find)(Vesk_Hdl::Model const &);

    /// HOLDER.PIN, as a line names it.
    std::string Name() const { return *pin ? holder + std::string(".") + pin : holder; }
    /// A pattern with the words in place of `@`; a line, which also has the name in place of `%`.
    std::string Words(std::string const &pattern) const { return Put(pattern, '@', words); }
    std::string Line(std::string const &pattern) const { return Put(Words(pattern), '%', Name()); }
    /// The text with `with` in place of the mark.
    static std::string Put(std::string text, char mark, std::string const &with) {
        std::size_t const at = text.find(mark);
        return at == std::string::npos ? text : text.replace(at, 1, with);
    }
    Vesk_Hdl::AttributeHolder &Attrs(Vesk_Hdl::Model const &model) const {
        return dynamic_cast<Vesk_Hdl::AttributeHolder &>(find(model));
    }
};

/// All six, in the order in which commands list them.
inline std::vector<Owner> const &Owners() {
    using M = Vesk_Hdl::Model const &;
    using Vesk_Hdl::Object;
    static std::vector<Owner> const owners = {
        {"MODULE", "", "", [](M m) -> Object & { return *m.GetNetlist(); }},
        {"COMPONENT", "CELL", "", [](M m) -> Object & { return *m.GetComponent("CELL"); }},
        {"INSTANCE", "u1", "", [](M m) -> Object & { return *m.GetInstance("u1"); }},
        {"SIGNAL", "s", "", [](M m) -> Object & { return *m.GetSignal("s"); }},
        {"COMPONENT PIN", "CELL", "A",
         [](M m) -> Object & { return *m.GetPin("A", m.GetComponent("CELL")); }},
        {"INSTANCE PIN", "u1", "A",
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
