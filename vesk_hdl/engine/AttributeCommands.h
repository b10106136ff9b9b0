#pragma once

#include <string>

#include "vesk_hdl/engine/CommandOf.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Vocabulary.h"

// The commands that attach attributes and comments: five families, each with a member for each kind
// of owner. The template of a family reads what follows the owner; a member is an instance of it
// with the operation of Model that it calls. So the grammar of a family is in one place.

namespace Vesk_Hdl::Commands {

using Text = Basis::StringBase<char>;

// The owners. Each reads TOKENS tokens and calls an operation of Model that takes its names first.

/// The module, which a line does not name.
struct ModuleOwner {
    static constexpr int TOKENS = 0;
    bool Parse(Text const &) { return true; }
    template <class... Rest> void Call(Model &model, auto operation, Rest const &...rest) const {
        (model.*operation)(rest...);
    }
};

/// A component, an instance or a signal.
struct NamedOwner {
    static constexpr int TOKENS = 1;
    bool Parse(Text const &token) {
        name = token;
        return true;
    }
    template <class... Rest> void Call(Model &model, auto operation, Rest const &...rest) const {
        (model.*operation)(name, rest...);
    }

    Text name;
};

/// A pin of a component or an instance, HOLDER.PIN in one token.
struct PinOwner {
    static constexpr int TOKENS = 1;
    bool Parse(Text const &token) { return SplitPinReference(token.View(), holder, pin); }
    template <class... Rest> void Call(Model &model, auto operation, Rest const &...rest) const {
        (model.*operation)(holder.c_str(), pin.c_str(), rest...);
    }

    std::string holder;
    std::string pin;
};

/// Whether a token begins with a prefix, in any case. The rest of it is then in `rest`.
inline bool TakePrefixed(Text const &token, char const *prefix, Text &rest) {
    Text pattern(prefix);
    unsigned int const length = pattern.GetLength();
    pattern += '*';
    if (!Basis::strimatch(token, pattern))
        return false;
    rest = Text(token.View().substr(length));
    return true;
}

/// owner [-TYPE=type] attribute [value]. The type is not checked here: Model refuses an unknown
/// one.
template <class Owner, auto OPERATION> struct AddAttr {
    Owner owner;
    Text attrType;
    Text attrName;
    Text value;

    bool Parse(StringArray const &tokens, int first) {
        int next = first + Owner::TOKENS;
        if (tokens.GetSize() < next + 1)
            return false;
        attrType = Attribute::DEFAULT_ATTRTYPE;
        if (!owner.Parse(tokens.At(first)))
            return false;
        if (TakePrefixed(tokens.At(next), Vocabulary::TYPE.prefix, attrType))
            ++next; // the option moves all tokens after it by one
        attrName = tokens.At(next);
        value = tokens.At(next + 1);
        return tokens.GetSize() >= next + 1; // with the option a name must still follow it
    }
    void Run(Model &model) const { owner.Call(model, OPERATION, attrName, value, attrType); }
};
using AddModuleAttrCommand =
    CommandOf<"ADD MODULE ATTRIBUTE", AddAttr<ModuleOwner, &Model::AddModuleAttr>>;
using AddComponentAttrCommand =
    CommandOf<"ADD COMPONENT ATTRIBUTE", AddAttr<NamedOwner, &Model::AddComponentAttr>>;
using AddInstanceAttrCommand =
    CommandOf<"ADD INSTANCE ATTRIBUTE", AddAttr<NamedOwner, &Model::AddInstanceAttr>>;
using AddSignalAttrCommand =
    CommandOf<"ADD SIGNAL ATTRIBUTE", AddAttr<NamedOwner, &Model::AddSignalAttr>>;
using AddComponentPinAttrCommand =
    CommandOf<"ADD COMPONENT PIN ATTRIBUTE", AddAttr<PinOwner, &Model::AddComponentPinAttr>>;
using AddInstancePinAttrCommand =
    CommandOf<"ADD INSTANCE PIN ATTRIBUTE", AddAttr<PinOwner, &Model::AddInstancePinAttr>>;

/// owner attribute value, and owner attribute usertype
template <class Owner, auto OPERATION> struct SetAttr {
    Owner owner;
    Text attrName;
    Text value;

    bool Parse(StringArray const &tokens, int first) {
        int const next = first + Owner::TOKENS;
        attrName = tokens.At(next);
        value = tokens.At(next + 1);
        return tokens.GetSize() >= next + 2 && owner.Parse(tokens.At(first));
    }
    void Run(Model &model) const { owner.Call(model, OPERATION, attrName, value); }
};
using SetModuleAttrValueCommand =
    CommandOf<"SET MODULE ATTRIBUTE VALUE", SetAttr<ModuleOwner, &Model::SetModuleAttrValue>>;
using SetComponentAttrValueCommand =
    CommandOf<"SET COMPONENT ATTRIBUTE VALUE", SetAttr<NamedOwner, &Model::SetComponentAttrValue>>;
using SetInstanceAttrValueCommand =
    CommandOf<"SET INSTANCE ATTRIBUTE VALUE", SetAttr<NamedOwner, &Model::SetInstanceAttrValue>>;
using SetSignalAttrValueCommand =
    CommandOf<"SET SIGNAL ATTRIBUTE VALUE", SetAttr<NamedOwner, &Model::SetSignalAttrValue>>;
using SetComponentPinAttrValueCommand =
    CommandOf<"SET COMPONENT PIN ATTRIBUTE VALUE",
              SetAttr<PinOwner, &Model::SetComponentPinAttrValue>>;
using SetInstancePinAttrValueCommand =
    CommandOf<"SET INSTANCE PIN ATTRIBUTE VALUE",
              SetAttr<PinOwner, &Model::SetInstancePinAttrValue>>;

using SetModuleAttrUserTypeCommand =
    CommandOf<"SET MODULE ATTRIBUTE USERTYPE", SetAttr<ModuleOwner, &Model::SetModuleUserType>>;
using SetComponentAttrUserTypeCommand =
    CommandOf<"SET COMPONENT ATTRIBUTE USERTYPE",
              SetAttr<NamedOwner, &Model::SetComponentUserType>>;
using SetInstanceAttrUserTypeCommand =
    CommandOf<"SET INSTANCE ATTRIBUTE USERTYPE", SetAttr<NamedOwner, &Model::SetInstanceUserType>>;
using SetSignalAttrUserTypeCommand =
    CommandOf<"SET SIGNAL ATTRIBUTE USERTYPE", SetAttr<NamedOwner, &Model::SetSignalUserType>>;
using SetComponentPinAttrUserTypeCommand =
    CommandOf<"SET COMPONENT PIN ATTRIBUTE USERTYPE",
              SetAttr<PinOwner, &Model::SetComponentPinUserType>>;
using SetInstancePinAttrUserTypeCommand =
    CommandOf<"SET INSTANCE PIN ATTRIBUTE USERTYPE",
              SetAttr<PinOwner, &Model::SetInstancePinUserType>>;

/// owner attribute setting [setting], where a setting is -GENERIC=word or -SYNATTR=word. Required:
/// the generic option is set first, whatever the order on the line, and stays if the other one is
/// then refused.
template <class Owner, auto SET_GENERIC, auto SET_SYNATTR> struct SetAttrOption {
    Owner owner;
    Text attrName;
    Text genericValue;
    Text synValue;
    bool hasGeneric = false;
    bool hasSyn = false;

    bool Parse(StringArray const &tokens, int first) {
        hasGeneric = hasSyn = false;
        int const next = first + Owner::TOKENS;
        if (tokens.GetSize() < next + 2 || !owner.Parse(tokens.At(first)))
            return false;
        attrName = tokens.At(next);
        return ParseOption(tokens.At(next + 1)) &&
               (tokens.GetSize() < next + 3 || ParseOption(tokens.At(next + 2)));
    }
    bool ParseOption(Text const &token) {
        bool const isGeneric = TakePrefixed(token, Vocabulary::GENERIC.prefix, genericValue);
        bool const isSyn = !isGeneric && TakePrefixed(token, Vocabulary::SYNATTR.prefix, synValue);
        hasGeneric |= isGeneric;
        hasSyn |= isSyn;
        return isGeneric || isSyn;
    }
    void Run(Model &model) const {
        if (hasGeneric)
            owner.Call(model, SET_GENERIC, attrName, genericValue);
        if (hasSyn)
            owner.Call(model, SET_SYNATTR, attrName, synValue);
    }
};
using SetModuleAttrOptionCommand = CommandOf<
    "SET MODULE ATTRIBUTE OPTION",
    SetAttrOption<ModuleOwner, &Model::SetModuleGenericAttrValue, &Model::SetModuleSynAttrValue>>;
using SetComponentAttrOptionCommand =
    CommandOf<"SET COMPONENT ATTRIBUTE OPTION",
              SetAttrOption<NamedOwner, &Model::SetComponentGenericAttrValue,
                            &Model::SetComponentSynAttrValue>>;
using SetInstanceAttrOptionCommand =
    CommandOf<"SET INSTANCE ATTRIBUTE OPTION",
              SetAttrOption<NamedOwner, &Model::SetInstanceGenericAttrValue,
                            &Model::SetInstanceSynAttrValue>>;
using SetSignalAttrOptionCommand = CommandOf<
    "SET SIGNAL ATTRIBUTE OPTION",
    SetAttrOption<NamedOwner, &Model::SetSignalGenericAttrValue, &Model::SetSignalSynAttrValue>>;
using SetComponentPinAttrOptionCommand =
    CommandOf<"SET COMPONENT PIN ATTRIBUTE OPTION",
              SetAttrOption<PinOwner, &Model::SetComponentPinGenericAttrValue,
                            &Model::SetComponentPinSynAttrValue>>;
using SetInstancePinAttrOptionCommand =
    CommandOf<"SET INSTANCE PIN ATTRIBUTE OPTION",
              SetAttrOption<PinOwner, &Model::SetInstancePinGenericAttrValue,
                            &Model::SetInstancePinSynAttrValue>>;

/// owner text... Required: the words are joined by single blanks, so that a comment loses its
/// quotes.
template <class Owner, auto OPERATION> struct AddComment {
    Owner owner;
    Text text;

    bool Parse(StringArray const &tokens, int first) {
        int const next = first + Owner::TOKENS;
        text.Empty();
        if (tokens.GetSize() < next + 1 || !owner.Parse(tokens.At(first)))
            return false;
        text = JoinTokens(tokens, next);
        return true;
    }
    void Run(Model &model) const { owner.Call(model, OPERATION, text); }
};
using AddNotesCommand = CommandOf<"ADD NOTES", AddComment<ModuleOwner, &Model::AddNotes>>;
using AddModuleCommentCommand =
    CommandOf<"ADD MODULE COMMENT", AddComment<ModuleOwner, &Model::AddNotes>>;
using AddComponentCommentCommand =
    CommandOf<"ADD COMPONENT COMMENT", AddComment<NamedOwner, &Model::AddComponentComment>>;
using AddInstanceCommentCommand =
    CommandOf<"ADD INSTANCE COMMENT", AddComment<NamedOwner, &Model::AddInstanceComment>>;
using AddSignalCommentCommand =
    CommandOf<"ADD SIGNAL COMMENT", AddComment<NamedOwner, &Model::AddSignalComment>>;
using AddComponentPinCommentCommand =
    CommandOf<"ADD COMPONENT PIN COMMENT", AddComment<PinOwner, &Model::AddComponentPinComment>>;
using AddInstancePinCommentCommand =
    CommandOf<"ADD INSTANCE PIN COMMENT", AddComment<PinOwner, &Model::AddInstancePinComment>>;

} // namespace Vesk_Hdl::Commands
