#include <type_traits>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/Owners.h"

using namespace Vesk_Hdl;

namespace {

using Text = char const *;

/// The names by which an owner is found; it takes none of them, the first, or both.
struct Names {
    Text holder;
    Text pin;
};

template <class Operation, class... Rest>
void Call(Model &model, Operation operation, Names const &names, Rest... rest) {
    if constexpr (std::is_invocable_v<Operation, Model &, Rest...>)
        (model.*operation)(rest...);
    else if constexpr (std::is_invocable_v<Operation, Model &, Text, Rest...>)
        (model.*operation)(names.holder, rest...);
    else
        (model.*operation)(names.holder, names.pin, rest...);
}

using Set = void (*)(Model &, Names const &, Text name, Text word);

/// The operations on an owner, and how they tell that there is none of the name "none".
struct Grid : Owner {
    void (*add)(Model &, Names const &, Text name, Text value, Text type);
    Set setGeneric, setSyn, setValue, setUserType;
    void (*comment)(Model &, Names const &, Text text);
    std::string missing;
    std::string missingOptions; ///< the same of the two options, for an attribute A

    Names Known() const { return {holder, pin}; }
};

#define SETTER(operation)                                                                          \
    [](Model &m, Names const &n, Text a, Text w) { Call(m, &Model::operation, n, a, w); }
#define ROW(index, Name, Comment, missing, missingOptions)                                         \
    {                                                                                              \
        Owners()[index],                                                                           \
            [](Model &m, Names const &n, Text a, Text v, Text t) {                                 \
                Call(m, &Model::Add##Name##Attr, n, a, v, t);                                      \
            },                                                                                     \
            SETTER(Set##Name##GenericAttrValue), SETTER(Set##Name##SynAttrValue),                  \
            SETTER(Set##Name##AttrValue), SETTER(Set##Name##UserType),                             \
            [](Model &m, Names const &n, Text t) { Call(m, &Model::Comment, n, t); }, missing,     \
            missingOptions                                                                         \
    }

std::vector<Grid> const &Grids() {
    static std::vector<Grid> const grids = {
        ROW(0, Module, AddNotes, "", ""),
        ROW(1, Component, AddComponentComment, "\"none\" not found.\n", "\"none\" not found.\n"),
        ROW(2, Instance, AddInstanceComment, "\"none\" not found.\n",
            "Attribute \"A\" not found.\n"),
        ROW(3, Signal, AddSignalComment, "\"none\" not found.\n", "\"none\" not found.\n"),
        ROW(4, ComponentPin, AddComponentPinComment, "Pin \"A\" not found.\n",
            "Pin \"A\" not found.\n"),
        ROW(5, InstancePin, AddInstancePinComment, "Pin \"A\" not found.\n",
            "Pin \"A\" not found.\n")};
    return grids;
}

/// Six owners without attributes, in a model that counts as unchanged.
struct Bare : Design {
    Bare() : Design(CellsAnd({"ADD SIGNAL s"})) { model.SetModifiedFlag(false); }

    /// Whether the model changed since the last call.
    bool TakeModified() {
        bool const modified = model.IsModified();
        model.SetModifiedFlag(false);
        return modified;
    }
};

TEST(ModelAttributes, EachOperationChangesItsOwnerAlone) {
    for (Grid const &owner : Grids()) {
        Bare design;
        Model &m = design.model;
        owner.add(m, owner.Known(), "A[1]", "x", "user");
        EXPECT_TRUE(design.TakeModified()) << owner.words;
        owner.setValue(m, owner.Known(), "a(1)", "y");
        EXPECT_TRUE(design.TakeModified()) << owner.words;
        owner.setGeneric(m, owner.Known(), "a(1)", "nosyn");
        EXPECT_TRUE(design.TakeModified()) << owner.words;
        owner.setSyn(m, owner.Known(), "a(1)", "assignnodec");
        EXPECT_TRUE(design.TakeModified()) << owner.words;
        owner.setUserType(m, owner.Known(), "a(1)", "STATE");
        EXPECT_TRUE(design.TakeModified()) << owner.words;
        for (Owner const &other : Owners())
            EXPECT_EQ(other.words == owner.words ? "A(1)(STATE)=y NOSYN ASSIGNNODEC" : "",
                      AttrsOf(other.Attrs(m)))
                << owner.words << " " << other.words;
    }
}

TEST(ModelAttributes, AddSetsTheValueOfTheOneThatIsThere) {
    for (Grid const &owner : Grids()) {
        Bare design;
        Model &m = design.model;
        owner.add(m, owner.Known(), "W", "8", "Integer");
        owner.setGeneric(m, owner.Known(), "W", "SYN");
        for (Text const type : {"String", "no type", "", static_cast<Text>(nullptr)}) {
            owner.add(m, owner.Known(), "w", "0", nullptr);
            m.SetModifiedFlag(false);
            owner.add(m, owner.Known(), "w", "9", type);
            EXPECT_TRUE(design.TakeModified()) << owner.words;
            EXPECT_EQ("W=9 SYN NONE", AttrsOf(owner.Attrs(m))) << owner.words;
        }
    }
}

TEST(ModelAttributes, NullValuesAreEmptyAndAnEmptyNameIsAName) {
    for (Grid const &owner : Grids()) {
        Bare design;
        Model &m = design.model;
        owner.add(m, owner.Known(), "", nullptr, nullptr); // a string, without a type
        owner.add(m, owner.Known(), "U", "on", "User");
        owner.setUserType(m, owner.Known(), "U", "STATE");
        owner.setValue(m, owner.Known(), nullptr, "v");
        EXPECT_EQ("=v NONE NONE; U(STATE)=on NONE NONE", AttrsOf(owner.Attrs(m))) << owner.words;
        owner.setUserType(m, owner.Known(), "U", nullptr);
        owner.setValue(m, owner.Known(), "U", nullptr);
        owner.add(m, owner.Known(), "", nullptr, nullptr);
        EXPECT_EQ("= NONE NONE; U()= NONE NONE", AttrsOf(owner.Attrs(m))) << owner.words;
        EXPECT_EQ(Attribute::VALUE_STRING, owner.Attrs(m).GetAttr("")->GetValueType());
    }
}

TEST(ModelAttributes, RefusalsChangeNothing) {
    struct Row {
        Text name;
        void (*call)(Model &, Grid const &);
        Text message;
    };
#define REFUSED(call, message) {#call, [](Model &m, Grid const &o) { o.call; }, message}
    std::vector<Row> const rows = {
        REFUSED(add(m, o.Known(), nullptr, "v", "String"), "Invalid Name.\n"),
        REFUSED(add(m, {"none", "none"}, nullptr, "v", "String"), "Invalid Name.\n"),
        REFUSED(add(m, o.Known(), "N", "v", ""), "Invalid attribute type.\n"),
        REFUSED(add(m, o.Known(), "N", "v", "Word"), "Invalid attribute type.\n"),
        REFUSED(setGeneric(m, o.Known(), "W", "ASSIGN"), "Invalid generic value.\n"),
        REFUSED(setGeneric(m, o.Known(), "W", nullptr), "Invalid generic value.\n"),
        REFUSED(setGeneric(m, o.Known(), "N", "SYN"), "Attribute \"N\" not found.\n"),
        REFUSED(setGeneric(m, o.Known(), nullptr, "SYN"), "Attribute \"\" not found.\n"),
        REFUSED(setSyn(m, o.Known(), "W", "SYN"), "Invalid generic value.\n"),
        REFUSED(setSyn(m, o.Known(), "W", nullptr), "Invalid generic value.\n"),
        REFUSED(setSyn(m, o.Known(), "N", "ASSIGN"), "Attribute \"N\" not found.\n"),
        REFUSED(setValue(m, o.Known(), "%s%n", "1"), "Attribute \"%s%n\" not found.\n"),
        REFUSED(setValue(m, o.Known(), nullptr, "1"), "Attribute \"\" not found.\n"),
        REFUSED(setUserType(m, o.Known(), "W", "T"), "Invalid attribute type.\n"),
        REFUSED(setUserType(m, o.Known(), "N", "T"), "Attribute \"N\" not found.\n")};
#undef REFUSED
    for (Grid const &owner : Grids())
        for (Row const &row : rows) {
            Bare design;
            owner.add(design.model, owner.Known(), "W", "8", "Integer");
            design.model.SetModifiedFlag(false);
            EXPECT_EQ(row.message, MessageOf([&] { row.call(design.model, owner); }))
                << owner.words << " " << row.name;
            EXPECT_FALSE(design.model.IsModified()) << owner.words << " " << row.name;
            EXPECT_EQ("W=8 NONE NONE", AttrsOf(owner.Attrs(design.model))) << row.name;
        }
}

TEST(ModelAttributes, MissingOwners) {
    for (Grid const &owner : Grids()) {
        if (owner.missing.empty())
            continue;
        Bare design;
        Model &m = design.model;
        Names const none = {"none", "A"};
        EXPECT_EQ(owner.missing, MessageOf([&] { owner.add(m, none, "A", "v", "Word"); }));
        EXPECT_EQ(owner.missingOptions, MessageOf([&] { owner.setGeneric(m, none, "A", "?"); }));
        EXPECT_EQ(owner.missingOptions, MessageOf([&] { owner.setSyn(m, none, "A", "?"); }));
        EXPECT_EQ(owner.missing, MessageOf([&] { owner.setValue(m, none, "A", "v"); }));
        EXPECT_EQ(owner.missing, MessageOf([&] { owner.setUserType(m, none, "A", "t"); }));
        EXPECT_EQ(owner.missing, MessageOf([&] { owner.comment(m, none, "c"); }));
        EXPECT_EQ("", MessageOf([&] { owner.comment(m, none, nullptr); }));
        EXPECT_EQ(*owner.pin ? "Pin \"\" not found.\n" : "\"\" not found.\n", MessageOf([&] {
            owner.setValue(m, {nullptr, nullptr}, "A", "v");
        }));
        EXPECT_EQ(*owner.pin ? "Pin \"none\" not found.\n" : "", MessageOf([&] {
            owner.comment(m, {owner.holder, "none"}, "c");
        }));
        EXPECT_FALSE(m.IsModified()) << owner.words;
    }
}

TEST(ModelAttributes, CommentsAreNoChange) {
    for (Grid const &owner : Grids()) {
        Bare design;
        for (Text const text : {"a", static_cast<Text>(nullptr), "b\nc", ""})
            owner.comment(design.model, owner.Known(), text);
        for (Owner const &other : Owners())
            EXPECT_STREQ(other.words == owner.words ? "a\nb\nc\n\n" : "",
                         other.find(design.model).GetComment())
                << owner.words << " " << other.words;
        EXPECT_FALSE(design.model.IsModified()) << owner.words;
    }
}

TEST(ModelAttributes, AnInstanceChangesItsOwnCopy) {
    struct Row {
        void (*call)(Model &);
        Text message;
        Text own; ///< of the instance afterwards
    };
    for (Row const &row : std::vector<Row>{
             {[](Model &m) { m.SetInstanceAttrValue("u1", "w", "9"); }, "", "W=9 SYN ASSIGN"},
             {[](Model &m) { m.SetInstanceGenericAttrValue("u1", "w", "none"); }, "",
              "W=8 NONE ASSIGN"},
             {[](Model &m) { m.SetInstanceSynAttrValue("u1", "w", "none"); }, "", "W=8 SYN NONE"},
             // Refused, and yet the copy stays.
             {[](Model &m) { m.SetInstanceUserType("u1", "w", "T"); }, "Invalid attribute type.\n",
              "W=8 SYN ASSIGN"},
             {[](Model &m) { m.SetInstanceGenericAttrValue("u1", "w", "x"); },
              "Invalid generic value.\n", "W=8 SYN ASSIGN"},
             {[](Model &m) { m.SetInstanceSynAttrValue("u1", "w", "x"); },
              "Invalid generic value.\n", "W=8 SYN ASSIGN"}}) {
        Bare design;
        Model &m = design.model;
        m.AddComponentAttr("CELL", "W", "8", "Integer");
        m.SetComponentGenericAttrValue("CELL", "W", "SYN");
        m.SetComponentSynAttrValue("CELL", "W", "ASSIGN");
        m.SetModifiedFlag(false);
        for (int times = 0; times < 2; ++times) { // the second call changes the same copy
            EXPECT_EQ(row.message, MessageOf([&] { row.call(m); })) << row.own;
            EXPECT_EQ(*row.message == '\0', design.TakeModified()) << row.own;
            EXPECT_EQ(row.own, AttrsOf(*m.GetInstance("u1")));
        }
        EXPECT_EQ("W=8 SYN ASSIGN", AttrsOf(*m.GetComponent("CELL"))) << row.own;
        EXPECT_EQ("", AttrsOf(*m.GetInstance("u2"))) << row.own;
        m.SetComponentAttrValue("CELL", "W", "7"); // no longer reaches the copy
        EXPECT_EQ(row.own, AttrsOf(*m.GetInstance("u1")));
    }
}

TEST(ModelAttributes, WhatAnInstanceTakesFromItsComponent) {
    Bare design;
    Model &m = design.model;
    m.AddComponentAttr("CELL", "U", "on", "User");
    m.SetComponentUserType("CELL", "U", "STATE");
    m.GetComponent("CELL")->GetAttr("U")->AddComment("c");
    m.SetInstanceAttrValue("u1", "U", "off");
    EXPECT_EQ("U(STATE)=off NONE NONE", AttrsOf(*m.GetInstance("u1")));
    EXPECT_STREQ("c\n", m.GetInstance("u1")->GetAttr("U")->GetComment());
    m.SetInstanceUserType("u2", "U", "T");
    EXPECT_EQ("U(T)=on NONE NONE", AttrsOf(*m.GetInstance("u2")));
    m.AddInstanceAttr("u3", "U", "x", nullptr); // does not look at the component
    EXPECT_EQ("U=x NONE NONE", AttrsOf(*m.GetInstance("u3")));
    m.AddComponentPinAttr("CELL", "A", "P", "1", nullptr); // u1 has its pins already
    m.AddInstance("u9", "CELL");
    m.SetInstancePinAttrValue("u9", "A", "P", "2");
    EXPECT_EQ("Attribute \"P\" not found.\n",
              MessageOf([&] { m.SetInstancePinAttrValue("u1", "A", "P", "2"); }));
    EXPECT_EQ("P=1 NONE NONE", AttrsOf(*m.GetComponent("CELL")->GetPin("A")));
}

TEST(ModelAttributes, BaseOperationsIgnoreANullHolder) {
    Bare design;
    Model &m = design.model;
    m.AddAttr(nullptr, "A", "v", "Word");
    for (auto const set : {&Model::SetGenericAttrValue, &Model::SetSynAttrValue,
                           &Model::SetAttrValue, &Model::SetUserType})
        (m.*set)(nullptr, "A", "x");
    EXPECT_FALSE(m.IsModified());
    Netlist other("other"); // of no model: the holder decides where an attribute goes
    m.AddAttr(&other, "A", "v", nullptr);
    m.SetSynAttrValue(&other, "a", "ASSIGN");
    EXPECT_EQ("A=v NONE ASSIGN", AttrsOf(other));
    EXPECT_TRUE(m.IsModified());
}

} // namespace
