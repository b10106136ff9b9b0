#include "vesk_hdl/netlist/Attribute.h"

#include <memory>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

std::unique_ptr<Attribute> Make(char const *type, char const *name, char const *value) {
    return std::unique_ptr<Attribute>(
        AttributeFactory::GetInstance().CreateAttribute(type, name, value));
}

TEST(Attribute, ValuesOfTheSevenTypes) {
    struct Row {
        char const *type;
        char const *text;
        Attribute::ValueType valueType;
        char const *valueString;
    };
    for (Row const &row :
         std::vector<Row>{{"String", "a B", Attribute::VALUE_STRING, "a B"},
                          {"string", nullptr, Attribute::VALUE_STRING, ""},
                          {nullptr, "x", Attribute::VALUE_STRING, "x"},
                          {"Integer", "12abc", Attribute::VALUE_INTEGER, "12"},
                          {"INTEGER", "abc", Attribute::VALUE_INTEGER, "0"},
                          {"Integer", nullptr, Attribute::VALUE_INTEGER, "0"},
                          {"Integer", "-007", Attribute::VALUE_INTEGER, "-7"},
                          {"Float", "3.14", Attribute::VALUE_FLOAT, "3.14"},
                          {"Float", "2.50", Attribute::VALUE_FLOAT, "2.50"},
                          {"Float", "12", Attribute::VALUE_FLOAT, "12.0"},
                          {"Float", "-0.5", Attribute::VALUE_FLOAT, "-0.5"},
                          {"Float", ".5", Attribute::VALUE_FLOAT, "0.5"},
                          {"Float", "2.5e3", Attribute::VALUE_FLOAT, "2500.000"},
                          {"Float", "1e2", Attribute::VALUE_FLOAT, "100.0"},
                          {"Float", "abc", Attribute::VALUE_FLOAT, "  0.0"},
                          {"Float", "", Attribute::VALUE_FLOAT, "0.0"},
                          {"Float", nullptr, Attribute::VALUE_FLOAT, "0.0"},
                          {"Boolean", "TrUe", Attribute::VALUE_BOOLEAN, "TRUE"},
                          {"Boolean", "1", Attribute::VALUE_BOOLEAN, "FALSE"},
                          {"Boolean", nullptr, Attribute::VALUE_BOOLEAN, "FALSE"},
                          {"Bit", "1", Attribute::VALUE_BIT, "1"},
                          {"Bit", "2", Attribute::VALUE_BIT, "0"},
                          {"Bit", "11", Attribute::VALUE_BIT, "0"},
                          {"BITVECTOR", "8:h:FF", Attribute::VALUE_BIT_VECTOR, "FF"},
                          {"BitVector", "1010", Attribute::VALUE_BIT_VECTOR, "1010"},
                          {"User", "on", Attribute::VALUE_USER, "on"}}) {
        std::string const name =
            std::string(row.type ? row.type : "") + " " + (row.text ? row.text : "");
        std::unique_ptr<Attribute> const made = Make(row.type, "N[1]", row.text);
        ASSERT_TRUE(made) << name;
        EXPECT_STREQ("N(1)", made->GetName());
        EXPECT_EQ(Object::OBJECT_ATTRIBUTE, made->GetObjectType());
        EXPECT_EQ(row.valueType, made->GetValueType()) << name;
        EXPECT_STREQ(row.valueString, made->GetValueString()) << name;
        made->SetValue("7");
        made->SetValue(row.text);
        EXPECT_STREQ(row.valueString, made->GetValueString()) << name;
    }
    for (char const *const type : {"", "Strings", "Bit Vector", "Str"})
        EXPECT_FALSE(Make(type, "A", "x")) << type;
}

TEST(Attribute, TypedValues) {
    EXPECT_EQ(-7, AttributeInteger("A", "-7").GetValue());
    EXPECT_EQ(2.5, AttributeFloat("A", "2.50").GetValue());
    EXPECT_TRUE(AttributeBoolean("A", "true").GetValue());
    EXPECT_EQ(8, AttributeBitVector("A", "8:h:FF").GetBitVectorValue().GetLength());
    AttributeUser user("A", "on");
    EXPECT_STREQ("", user.GetUserType());
    user.SetUserType("STATE");
    AttributeUser const copy(user);
    user.SetUserType(nullptr);
    EXPECT_STREQ("", user.GetUserType());
    EXPECT_STREQ("STATE", copy.GetUserType());
    EXPECT_STREQ("on", copy.GetValue());
}

TEST(Attribute, AFloatKeepsItsLookButACopyDoesNot) {
    AttributeFloat const source("A", "12.300");
    EXPECT_STREQ("12.300", source.GetValueString());
    EXPECT_STREQ("12.3", AttributeFloat(source).GetValueString());
    AttributeFloat assigned("B", "100.12");
    assigned = source;
    EXPECT_STREQ(" 12.30", assigned.GetValueString()); // as wide as 100.12
    EXPECT_STREQ("A", assigned.GetName());
}

TEST(Attribute, OptionWords) {
    struct Row {
        char const *word;
        bool isGeneric;
        bool isSynAttr;
        char const *generic; ///< afterwards, with SYN before
        char const *synAttr; ///< afterwards, with ASSIGN before
    };
    for (Row const &row : std::vector<Row>{{"none", true, true, "NONE", "NONE"},
                                           {"nosyn", true, false, "NOSYN", "ASSIGN"},
                                           {"Syn", true, false, "SYN", "ASSIGN"},
                                           {"assign", false, true, "SYN", "ASSIGN"},
                                           {"AssignNoDec", false, true, "SYN", "ASSIGNNODEC"},
                                           {"X", false, false, "SYN", "ASSIGN"},
                                           {"", false, false, "SYN", "ASSIGN"},
                                           {nullptr, false, false, "SYN", "ASSIGN"}}) {
        char const *const name = row.word ? row.word : "null";
        AttributeString attribute("A", "x");
        EXPECT_STREQ("NONE", attribute.GetGeneric());
        EXPECT_STREQ("NONE", attribute.GetSynAttr());
        EXPECT_TRUE(attribute.SetGeneric("SYN") && attribute.SetSynAttr("ASSIGN"));
        EXPECT_EQ(row.isGeneric, attribute.SetGeneric(row.word)) << name;
        EXPECT_EQ(row.isSynAttr, attribute.SetSynAttr(row.word)) << name;
        EXPECT_STREQ(row.generic, attribute.GetGeneric()) << name;
        EXPECT_STREQ(row.synAttr, attribute.GetSynAttr()) << name;
    }
}

TEST(Attribute, Equality) {
    AttributeString const abc("A", "abc");
    EXPECT_TRUE(abc == AttributeString("A", "ABC"));
    EXPECT_FALSE(abc == AttributeString("A", "abd"));
    EXPECT_FALSE(abc == AttributeString("a", "abc"));
    EXPECT_FALSE(abc == AttributeUser("A", "abc"));
    for (auto const change :
         {+[](Attribute &a) { a.SetGeneric("SYN"); }, +[](Attribute &a) { a.SetSynAttr("ASSIGN"); },
          +[](Attribute &a) { a.AddComment("c"); }}) {
        std::unique_ptr<Attribute> const clone(abc.CloneAttribute());
        EXPECT_TRUE(abc == *clone);
        change(*clone);
        EXPECT_FALSE(abc == *clone);
        EXPECT_TRUE(*clone == *std::unique_ptr<Attribute>(clone->CloneAttribute()));
    }
}

TEST(AttributeHolder, KeepsDuplicatesAndFindsTheNewest) {
    AttributeHolder holder;
    holder.AddAttr(nullptr);
    EXPECT_EQ("", NamesOf(holder.GetAttrIterator()));
    EXPECT_EQ(nullptr, holder.GetAttr("a"));
    auto *const first = new AttributeString("b[1]", "1");
    auto *const second = new AttributeInteger("B(1)", "2");
    holder.AddAttr(first);
    EXPECT_EQ(first, holder.GetAttr("B(1)"));
    EXPECT_EQ(nullptr, holder.GetAttr("b[1]")); // looked up as it is typed
    holder.AddAttr(second);
    EXPECT_EQ(second, holder.GetAttr("b(1)"));
    EXPECT_EQ("b(1) B(1)", NamesOf(holder.GetAttrIterator()));
}

TEST(AttributeHolder, CopiesAreDeep) {
    AttributeHolder source;
    source.AddAttr(new AttributeString("A", "x"));
    source.AddAttr(new AttributeUser("B", "y"));
    AttributeHolder target(source);
    source.GetAttr("A")->SetValue("changed");
    EXPECT_STREQ("x", target.GetAttr("a")->GetValueString());
    target.AddAttr(new AttributeString("C", ""));
    target = source;
    EXPECT_EQ("A B", NamesOf(target.GetAttrIterator()));
    EXPECT_STREQ("changed", target.GetAttr("A")->GetValueString());
    EXPECT_EQ(Attribute::VALUE_USER, target.GetAttr("B")->GetValueType());
    target = *&target;
    EXPECT_EQ("A B", NamesOf(target.GetAttrIterator()));
}

} // namespace
