// The commands that attach attributes and comments. They are five families with a member for each
// kind of owner: what a family reads is told once, as a struct with a Parse, and its members are a
// table of rows: class, owner, index of the first token behind the keyword, operations of Model.

#include <string>

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/text/basis/Functions.h"

namespace Vesk_Hdl {

using Text = Basis::StringBase<char>;

namespace {

// The owners. Each reads its tokens and calls an operation of Model that takes its names first.

/// The module is not named.
struct ModuleOwner {
    static constexpr int TOKENS = 0;
    bool Parse(Text const &) { return true; }
    template <class Operation, class... Rest> void Call(Model &model, Operation op, Rest... rest) {
        (model.*op)(rest...);
    }
};

/// A component, an instance or a signal.
struct NamedOwner {
    static constexpr int TOKENS = 1;
    bool Parse(Text const &token) {
        name = token;
        return true;
    }
    template <class Operation, class... Rest> void Call(Model &model, Operation op, Rest... rest) {
        (model.*op)(name, rest...);
    }

    Text name;
};

/// A pin of a component or an instance, HOLDER.PIN.
struct PinOwner {
    static constexpr int TOKENS = 1;
    bool Parse(Text const &token) { return SplitPinReference(token.View(), holder, pin); }
    template <class Operation, class... Rest> void Call(Model &model, Operation op, Rest... rest) {
        (model.*op)(holder.c_str(), pin.c_str(), rest...);
    }

    std::string holder;
    std::string pin;
};

/// If the token begins with the prefix, in any case, the rest of it goes into `rest`.
bool TakePrefixed(Text const &token, char const *prefix, Text &rest) {
    Text pattern(prefix);
    unsigned int const length = pattern.GetLength();
    pattern += '*';
    if (!Basis::strimatch(token, pattern))
        return false;
    rest = Text(token.View().substr(length));
    return true;
}

/// ADD ... ATTRIBUTE owner [-TYPE=type] name [value]
template <class Owner> struct AddAttrArguments {
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
        if (TakePrefixed(tokens.At(next), "-TYPE=", attrType))
            ++next; // what follows is one token further on
        attrName = tokens.At(next);
        value = tokens.At(next + 1);
        return tokens.GetSize() >= next + 1;
    }
};

/// SET ... ATTRIBUTE VALUE owner name value, and USERTYPE alike
template <class Owner> struct SetAttrArguments {
    Owner owner;
    Text attrName;
    Text value;

    bool Parse(StringArray const &tokens, int first) {
        int const next = first + Owner::TOKENS;
        attrName = tokens.At(next);
        value = tokens.At(next + 1);
        return tokens.GetSize() >= next + 2 && owner.Parse(tokens.At(first));
    }
};

/// SET ... ATTRIBUTE OPTION owner name option [option], an option being -GENERIC=word or
/// -SYNATTR=word. The generic option is set first whatever the order on the line.
template <class Owner> struct AttrOptionArguments {
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
        bool const isGeneric = TakePrefixed(token, "-GENERIC=", genericValue);
        bool const isSyn = !isGeneric && TakePrefixed(token, "-SYNATTR=", synValue);
        hasGeneric |= isGeneric;
        hasSyn |= isSyn;
        return isGeneric || isSyn;
    }
};

/// ADD ... COMMENT owner word...
template <class Owner> struct CommentArguments {
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
};

} // namespace

// What a row of any family declares.
#define ARGUMENTS(Class, Family, Owner, first)                                                     \
    VESK_HDL_COMMAND(Class, Family<Owner>)                                                         \
    bool Class::ParseArguments(StringArray const &tokens) { return arguments.Parse(tokens, first); }

#define ADD_ATTR(Class, Owner, first, operation)                                                   \
    ARGUMENTS(Class, AddAttrArguments, Owner, first)                                               \
    void Class::Execute() {                                                                        \
        auto &a = arguments;                                                                       \
        a.owner.Call(RequireModel(), &Model::operation, a.attrName, a.value, a.attrType);          \
    }
ADD_ATTR(AddModuleAttrCommand, ModuleOwner, 3, AddModuleAttr)
ADD_ATTR(AddComponentAttrCommand, NamedOwner, 3, AddComponentAttr)
ADD_ATTR(AddInstanceAttrCommand, NamedOwner, 3, AddInstanceAttr)
ADD_ATTR(AddSignalAttrCommand, NamedOwner, 3, AddSignalAttr)
ADD_ATTR(AddComponentPinAttrCommand, PinOwner, 4, AddComponentPinAttr)
ADD_ATTR(AddInstancePinAttrCommand, PinOwner, 4, AddInstancePinAttr)

#define SET_ATTR(Class, Owner, first, operation)                                                   \
    ARGUMENTS(Class, SetAttrArguments, Owner, first)                                               \
    void Class::Execute() {                                                                        \
        auto &a = arguments;                                                                       \
        a.owner.Call(RequireModel(), &Model::operation, a.attrName, a.value);                      \
    }
SET_ATTR(SetModuleAttrValueCommand, ModuleOwner, 4, SetModuleAttrValue)
SET_ATTR(SetComponentAttrValueCommand, NamedOwner, 4, SetComponentAttrValue)
SET_ATTR(SetInstanceAttrValueCommand, NamedOwner, 4, SetInstanceAttrValue)
SET_ATTR(SetSignalAttrValueCommand, NamedOwner, 4, SetSignalAttrValue)
SET_ATTR(SetComponentPinAttrValueCommand, PinOwner, 5, SetComponentPinAttrValue)
SET_ATTR(SetInstancePinAttrValueCommand, PinOwner, 5, SetInstancePinAttrValue)

SET_ATTR(SetModuleAttrUserTypeCommand, ModuleOwner, 4, SetModuleUserType)
SET_ATTR(SetComponentAttrUserTypeCommand, NamedOwner, 4, SetComponentUserType)
SET_ATTR(SetInstanceAttrUserTypeCommand, NamedOwner, 4, SetInstanceUserType)
SET_ATTR(SetSignalAttrUserTypeCommand, NamedOwner, 4, SetSignalUserType)
SET_ATTR(SetComponentPinAttrUserTypeCommand, PinOwner, 5, SetComponentPinUserType)
SET_ATTR(SetInstancePinAttrUserTypeCommand, PinOwner, 5, SetInstancePinUserType)

#define ATTR_OPTION(Class, Owner, first, genericOperation, synOperation)                           \
    ARGUMENTS(Class, AttrOptionArguments, Owner, first)                                            \
    void Class::Execute() {                                                                        \
        Model &owningModel = RequireModel();                                                       \
        auto &a = arguments;                                                                       \
        if (a.hasGeneric)                                                                          \
            a.owner.Call(owningModel, &Model::genericOperation, a.attrName, a.genericValue);       \
        if (a.hasSyn)                                                                              \
            a.owner.Call(owningModel, &Model::synOperation, a.attrName, a.synValue);               \
    }
ATTR_OPTION(SetModuleAttrOptionCommand, ModuleOwner, 4, SetModuleGenericAttrValue,
            SetModuleSynAttrValue)
ATTR_OPTION(SetComponentAttrOptionCommand, NamedOwner, 4, SetComponentGenericAttrValue,
            SetComponentSynAttrValue)
ATTR_OPTION(SetInstanceAttrOptionCommand, NamedOwner, 4, SetInstanceGenericAttrValue,
            SetInstanceSynAttrValue)
ATTR_OPTION(SetSignalAttrOptionCommand, NamedOwner, 4, SetSignalGenericAttrValue,
            SetSignalSynAttrValue)
ATTR_OPTION(SetComponentPinAttrOptionCommand, PinOwner, 5, SetComponentPinGenericAttrValue,
            SetComponentPinSynAttrValue)
ATTR_OPTION(SetInstancePinAttrOptionCommand, PinOwner, 5, SetInstancePinGenericAttrValue,
            SetInstancePinSynAttrValue)

#define COMMENT(Class, Owner, first, operation)                                                    \
    ARGUMENTS(Class, CommentArguments, Owner, first)                                               \
    void Class::Execute() {                                                                        \
        arguments.owner.Call(RequireModel(), &Model::operation, arguments.text);                   \
    }
COMMENT(AddModuleCommentCommand, ModuleOwner, 3, AddNotes)
COMMENT(AddNotesCommand, ModuleOwner, 2, AddNotes)
COMMENT(AddComponentCommentCommand, NamedOwner, 3, AddComponentComment)
COMMENT(AddInstanceCommentCommand, NamedOwner, 3, AddInstanceComment)
COMMENT(AddSignalCommentCommand, NamedOwner, 3, AddSignalComment)
COMMENT(AddComponentPinCommentCommand, PinOwner, 4, AddComponentPinComment)
COMMENT(AddInstancePinCommentCommand, PinOwner, 4, AddInstancePinComment)

} // namespace Vesk_Hdl
