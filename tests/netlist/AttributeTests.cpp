#include "vesk_hdl/netlist/Attribute.h"

#include <memory>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/Owners.h"

using namespace Vesk_Hdl;

namespace {

std::unique_ptr<Attribute> Make(char const *type, char const *name, char const *value) {
    return std::unique_ptr<Attribute>(
        AttributeFactory::GetInstance().CreateAttribute(type, name, value));
}

TEST(Attribute, ValuesOfTheSevenTypes) {
    struct Row {
        char const *type, *values; ///< what is set, and what GetValueString returns
        char const *ofNull;
    };
    for (Row const &row :
         {Row{"string", "a B=a B", ""}, Row{"Integer", "12abc=12; abc=0; -007=-7", "0"},
          Row{"FLOAT", "2.50=2.50; 12=12.0; -0.5=-0.5; .5=0.5; 2.5e3=2500.000; abc=  0.0", "0.0"},
          Row{"Boolean", "TrUe=TRUE; 1=FALSE", "FALSE"}, Row{"Bit", "1=1; 11=0", "0"},
          Row{"BitVector", "8:h:FF=FF; 101=101", ""}, Row{"User", "on=on", ""}}) {
        std::unique_ptr<Attribute> const made = Make(row.type, "N[1]", nullptr);
        ASSERT_TRUE(made) << row.type;
        EXPECT_STREQ("N(1)", made->GetName());
        EXPECT_STRCASEEQ(row.type, made->GetValueTypeName());
        EXPECT_STREQ(row.ofNull, made->GetValueString()) << row.type;
        for (auto const &[text, value] : Pairs(row.values)) {
            made->SetValue(text.c_str());
            EXPECT_EQ(value, made->GetValueString().GetText()) << row.type << " " << text;
        }
        made->SetValue(nullptr);
        EXPECT_STREQ(row.ofNull, made->GetValueString()) << row.type;
    }
    EXPECT_EQ(Attribute::VALUE_STRING, Make(nullptr, "A", "x")->GetValueType());
    for (char const *const type : {"", "Strings", "Bit Vector", "Str"})
        EXPECT_FALSE(Make(type, "A", "x")) << type;
}

TEST(Attribute, AFloatKeepsItsLookButACopyDoesNot) {
    AttributeFloat const source("A", "12.300");
    EXPECT_STREQ("12.3", AttributeFloat(source).GetValueString());
    AttributeFloat assigned("B", "100.12");
    assigned = source;
    EXPECT_STREQ(" 12.30", assigned.GetValueString()); // as wide as 100.12
    EXPECT_STREQ("A", assigned.GetName());
}

TEST(Attribute, Equality) {
    AttributeString const abc("A", "abc");
    EXPECT_TRUE(abc == AttributeString("A", "ABC"));
    EXPECT_FALSE(abc == AttributeString("A", "abd") || abc == AttributeString("a", "abc"));
    EXPECT_FALSE(abc == AttributeUser("A", "abc"));
    int changes = 0;
    for (auto const change :
         {+[](Attribute &a) { a.SetGeneric("SYN"); }, +[](Attribute &a) { a.SetSynAttr("ASSIGN"); },
          +[](Attribute &a) { a.AddComment("c"); }}) {
        std::unique_ptr<Attribute> const clone(abc.CloneAttribute());
        EXPECT_TRUE(abc == *clone);
        change(*clone);
        EXPECT_FALSE(abc == *clone) << "change " << changes;
        ++changes;
    }
}

TEST(AttributeHolder, KeepsDuplicatesAndFindsTheNewest) {
    AttributeHolder holder;
    holder.AddAttr(nullptr);
    EXPECT_EQ(nullptr, holder.GetAttr("a"));
    holder.AddAttr(new AttributeString("b[1]", "1"));
    EXPECT_STREQ("1", holder.GetAttr("B(1)")->GetValueString());
    EXPECT_EQ(nullptr, holder.GetAttr("b[1]")); // looked up as it is typed
    holder.AddAttr(new AttributeInteger("B(1)", "2"));
    EXPECT_STREQ("2", holder.GetAttr("b(1)")->GetValueString());
    EXPECT_EQ("b(1)=1 NONE NONE; B(1)=2 NONE NONE", AttrsOf(holder));
}

TEST(AttributeHolder, CopiesAreDeep) {
    AttributeHolder source;
    source.AddAttr(new AttributeString("A", "x"));
    auto *const user = new AttributeUser("B", "y");
    user->SetUserType("T");
    source.AddAttr(user);
    AttributeHolder target(source);
    user->SetUserType(nullptr);
    EXPECT_EQ("A=x NONE NONE; B(T)=y NONE NONE", AttrsOf(target));
    target.AddAttr(new AttributeString("C", ""));
    Iterator<Attribute *> walk = target.GetAttrIterator();
    target = source;
    ASSERT_TRUE(
        walk.HasMore()); // an iterator stays at the holder's array when its elements are replaced
    EXPECT_STREQ("A", walk.Current()->GetName());
    target = *&target;
    EXPECT_EQ("A=x NONE NONE; B()=y NONE NONE", AttrsOf(target));
    EXPECT_EQ(nullptr, target.GetAttr("C"));
}

} // namespace
