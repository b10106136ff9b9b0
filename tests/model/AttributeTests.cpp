// The attribute operations of Model. What each command makes of its words is tested with the
// command language.

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/Owners.h"

using namespace Vesk_Hdl;

namespace {

/// Six owners without attributes, in a model that counts as unchanged.
struct Bare : Design {
    Bare() : Design(CellsAnd("sig s")) { model.SetModifiedFlag(false); }
};

TEST(ModelAttributes, MissingOwners) {
    Bare design;
    for (Owner const &owner : Owners()) {
        if (owner.words == "MODULE")
            continue;
        std::string const missing = *owner.pin ? "Pin \"A\" not found.\n" : "\"none\" not found.\n";
        bool const isInstance = owner.words == "INSTANCE";
        for (auto const &[pattern, message] : std::vector<std::pair<char const *, std::string>>{
                 {"ADD @ ATTRIBUTE % -TYPE=Word W v", missing},
                 {"SET @ ATTRIBUTE OPTION % W -GENERIC=?",
                  isInstance ? "Attribute \"W\" not found.\n" : missing},
                 {"SET @ ATTRIBUTE OPTION % W -SYNATTR=?",
                  isInstance ? "Attribute \"W\" not found.\n" : missing},
                 {"SET @ ATTRIBUTE VALUE % W v", missing},
                 {"SET @ ATTRIBUTE USERTYPE % W t", missing},
                 {"ADD @ COMMENT % c", missing}}) {
            std::string const name = *owner.pin ? "none.A" : "none";
            std::string const line = Owner::Put(owner.Words(pattern), '%', name);
            EXPECT_EQ(message, Refusal(design.model, {line})) << line;
        }
    }
    EXPECT_FALSE(design.model.IsModified());
}

TEST(ModelAttributes, NullArguments) {
    struct Row {
        char const *name;
        void (*call)(Model &);
        char const *message;
    };
#define CALL(call, message) {#call, [](Model &m) { m.call; }, message}
    std::vector<Row> const rows = {
        // The name is checked before the owner.
        CALL(AddModuleAttr(nullptr, "v", "?"), "Invalid Name.\n"),
        CALL(AddComponentAttr("none", nullptr, "v", "?"), "Invalid Name.\n"),
        CALL(AddInstanceAttr("none", nullptr, "v", "?"), "Invalid Name.\n"),
        CALL(AddSignalAttr("none", nullptr, "v", "?"), "Invalid Name.\n"),
        CALL(AddComponentPinAttr("none", "A", nullptr, "v", "?"), "Invalid Name.\n"),
        CALL(AddInstancePinAttr("none", "A", nullptr, "v", "?"), "Invalid Name.\n"),
        CALL(SetSignalAttrValue(nullptr, "A", "v"), "\"\" not found.\n"),
        CALL(SetInstancePinAttrValue(nullptr, nullptr, "A", "v"), "Pin \"\" not found.\n"),
        CALL(SetModuleAttrValue(nullptr, "v"), "Attribute \"\" not found.\n"),
        CALL(SetModuleAttrValue("%s%n", "v"), "Attribute \"%s%n\" not found.\n"),
        CALL(AddNotes(nullptr), ""),
        CALL(AddComponentComment("none", nullptr), ""),
        CALL(AddInstanceComment("none", nullptr), ""),
        CALL(AddSignalComment("none", nullptr), ""),
        CALL(AddComponentPinComment("none", "A", nullptr), ""),
        CALL(AddInstancePinComment("none", "A", nullptr), ""),
        CALL(AddAttr(nullptr, "A", "v", "?"), ""),
        CALL(SetGenericAttrValue(nullptr, "A", "?"), ""),
        CALL(SetSynAttrValue(nullptr, "A", "?"), ""),
        CALL(SetAttrValue(nullptr, "A", "v"), ""),
        CALL(SetUserType(nullptr, "A", "t"), "")};
#undef CALL
    Bare design;
    for (Row const &row : rows)
        EXPECT_EQ(row.message, MessageOf([&] { row.call(design.model); })) << row.name;
    EXPECT_FALSE(design.model.IsModified());
    Model &m = design.model;
    m.AddModuleAttr("", nullptr, nullptr); // a string, without a type
    m.AddModuleAttr("U", "on", "User");
    m.SetModuleUserType("U", "STATE");
    m.SetModuleAttrValue(nullptr, "v"); // an empty name is a name
    EXPECT_EQ("Invalid generic value.\n",
              MessageOf([&] { m.SetModuleGenericAttrValue("U", nullptr); }));
    EXPECT_EQ("=v NONE NONE; U(STATE)=on NONE NONE", AttrsOf(design.netlist));
    m.SetModuleUserType("U", nullptr);
    m.SetModuleAttrValue("U", nullptr);
    EXPECT_EQ("=v NONE NONE; U()= NONE NONE", AttrsOf(design.netlist));
}

TEST(ModelAttributes, AnInstanceChangesItsOwnCopy) {
    // Line, message, and the attributes of the instance afterwards. A refused word leaves the copy,
    // too.
    using Row = std::tuple<char const *, char const *, char const *>;
    for (auto const &[line, message, own] :
         {Row{"VALUE u1 w 9", "", "W=9 SYN ASSIGN"},
          Row{"OPTION u1 w -GENERIC=none", "", "W=8 NONE ASSIGN"},
          Row{"OPTION u1 w -SYNATTR=none", "", "W=8 SYN NONE"},
          Row{"USERTYPE u1 w T", "Invalid attribute type.\n", "W=8 SYN ASSIGN"},
          Row{"OPTION u1 w -GENERIC=x", "Invalid generic value.\n", "W=8 SYN ASSIGN"},
          Row{"OPTION u1 w -SYNATTR=x", "Invalid generic value.\n", "W=8 SYN ASSIGN"}}) {
        SCOPED_TRACE(line);
        Bare design;
        Model &m = design.model;
        EXPECT_EQ("", Refusal(m, {"ADD COMPONENT ATTRIBUTE CELL -TYPE=Integer W 8",
                                  "SET COMPONENT ATTRIBUTE OPTION CELL W -GENERIC=SYN "
                                  "-SYNATTR=ASSIGN"}));
        for (int times = 0; times < 2; ++times) { // the second changes the same copy
            m.SetModifiedFlag(false);
            EXPECT_EQ(message, Refusal(m, {std::string("SET INSTANCE ATTRIBUTE ") + line}));
            EXPECT_EQ(*message == '\0', m.IsModified());
            EXPECT_EQ(own, AttrsOf(*m.GetInstance("u1")));
        }
        EXPECT_EQ("", AttrsOf(*m.GetInstance("u2")));
        m.SetComponentAttrValue("CELL", "W", "7"); // no longer reaches the copy
        EXPECT_EQ("W=7 SYN ASSIGN", AttrsOf(*m.GetComponent("CELL")));
        EXPECT_EQ(own, AttrsOf(*m.GetInstance("u1")));
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
    m.AddInstanceAttr("u3", "U", "x", nullptr); // does not look at the component
    EXPECT_EQ("U=x NONE NONE", AttrsOf(*m.GetInstance("u3")));
    m.AddComponentPinAttr("CELL", "A", "P", "1", nullptr); // u1 has its pins already
    EXPECT_EQ("Attribute \"P\" not found.\n",
              MessageOf([&] { m.SetInstancePinAttrValue("u1", "A", "P", "2"); }));
}

} // namespace
