#include "vesk_hdl/netlist/Pin.h"

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

TEST(Component, TheNameAsTypedDecidesTheClassOfAPin) {
    struct Row {
        char const *typed;
        Pin::PinType type;
        char const *name;
        char const *baseName;
    };
    for (Row const &row : std::vector<Row>{{"A(3:0)", Pin::PIN_BUS, "A(3:0)", "A"},
                                           {"A(3)", Pin::PIN_BUS_INDEX, "A(3)", "A"},
                                           {"A", Pin::PIN_SCALAR, "A", "A"},
                                           {"A[3:0]", Pin::PIN_SCALAR, "A(3:0)", "A(3:0)"},
                                           {"A<3-0>", Pin::PIN_SCALAR, "A(3:0)", "A(3:0)"},
                                           {"A[3]", Pin::PIN_SCALAR, "A(3)", "A(3)"},
                                           {"A(:3:0)", Pin::PIN_SCALAR, "A(:3:0)", "A(:3:0)"},
                                           {"A()3)", Pin::PIN_BUS_INDEX, "A()3)", "A"},
                                           {nullptr, Pin::PIN_SCALAR, "", ""}}) {
        Component component("c");
        component.AddPin(row.typed, Polarity::INPUT, "");
        Pin const *const pin = component.GetPin(row.name);
        ASSERT_TRUE(pin) << row.name;
        EXPECT_EQ(row.type, pin->GetPinType()) << row.name;
        EXPECT_STREQ(row.name, pin->GetName());
        EXPECT_STREQ(row.baseName, pin->GetBaseName()) << row.name;
        EXPECT_EQ(Object::OBJECT_PIN, pin->GetObjectType());
    }
}

TEST(Component, PinsKeepOrderAndDuplicates) {
    Component component("C[1]");
    for (char const *const name : {"B", "A(3)", "b", "A(2)"})
        component.AddPin(name, Polarity::INPUT, "");
    EXPECT_STREQ("C(1)", component.GetName());
    EXPECT_EQ("B A(3) b A(2)", NamesOf(component.GetPinIterator()));
    EXPECT_STREQ("B", component.GetPin("b")->GetName()); // the first
    EXPECT_STREQ("A(3)", component.GetPin("a[3]")->GetName());
    EXPECT_EQ(nullptr, component.GetPin("A"));
    EXPECT_EQ(nullptr, component.GetPin(nullptr));
}

TEST(Component, DefaultValuesAndCopiesOfPins) {
    Component component("C");
    component.AddPin("A", Polarity::INPUT, "1:b:1");
    component.AddPin("B", Polarity::OUTPUT, static_cast<char const *>(nullptr));
    EXPECT_EQ(1, component.GetPin("A")->GetDefaultValue().GetLength());
    EXPECT_TRUE(component.GetPin("A")->GetDefaultValue().HasBaseAndLength());
    EXPECT_STREQ("", component.GetPin("B")->GetDefaultValue().GetValue());
    ScalarPin source("D[3]", Polarity::BIDIRECTIONAL);
    source.SetDefaultValue("0");
    source.AddAttr(new AttributeString("X", "x"));
    source.AddComment("c");
    component.AddPin(source);
    Pin const *const added = component.GetPin("D(3)");
    EXPECT_EQ(Pin::PIN_BUS_INDEX, added->GetPinType()); // decided anew
    EXPECT_STREQ("0", added->GetDefaultValue().GetValue());
    EXPECT_EQ(Polarity::BIDIRECTIONAL, added->GetPolarity().GetValue());
    EXPECT_FALSE(added->HasAttrs() || added->HasComment());
}

TEST(Pin, CopiesShareTheSignalButAreNotListed) {
    ScalarSignal signal("s");
    BusPin source("B(3:0)", Polarity::INPUT);
    source.AddAttr(new AttributeString("X", "x"));
    source.AddComment("c");
    signal.Connect(&source);
    std::unique_ptr<Pin> const clone(source.ClonePin());
    source.GetAttr("X")->SetValue("changed");
    EXPECT_EQ(Pin::PIN_BUS, clone->GetPinType());
    EXPECT_EQ(&signal, clone->GetSignal());
    EXPECT_EQ("B(3:0)", NamesOf(signal.GetPinIterator()));
    EXPECT_STREQ("x", clone->GetAttr("x")->GetValueString());
    EXPECT_STREQ("c\n", clone->GetComment());
    BusPin target("Z(1:0)", Polarity::OUTPUT);
    target = source;
    target = *&target;
    EXPECT_TRUE(target.GetSignal() == &signal && target.GetPolarity() == Polarity::INPUT);
    EXPECT_STREQ("changed", target.GetAttr("X")->GetValueString());
}

TEST(Pin, WhatCopiesShareChangesForOneAlone) {
    Component component("C");
    component.AddPin("A", Polarity::INPUT, "1");
    Instance first("u1", &component);
    Instance second("u2", &component);
    Pin *const changed = first.GetPin("A");
    Pin *const kept = second.GetPin("A");
    Basis::StringBase<char> const former = changed->GetName();
    changed->SetPolarity(Polarity::OUTPUT);
    changed->SetDefaultValue("0");
    changed->AddComment("c");
    changed->SetName("B");
    EXPECT_STREQ("A", former);
    EXPECT_TRUE(changed->GetPolarity() == Polarity::OUTPUT && changed->HasComment());
    EXPECT_STREQ("0", changed->GetDefaultValue().GetValue());
    for (Pin const *const pin : {component.GetPin("A"), kept}) {
        EXPECT_TRUE(pin->GetPolarity() == Polarity::INPUT && !pin->HasComment());
        EXPECT_STREQ("1", pin->GetDefaultValue().GetValue());
        EXPECT_STREQ("A", pin->GetName());
    }
    static_cast<Object &>(*kept) = *changed; // the name and comment alone
    EXPECT_STREQ("B", kept->GetName());
    EXPECT_TRUE(kept->GetPolarity() == Polarity::INPUT && kept->HasComment());
    EXPECT_STREQ("1", kept->GetDefaultValue().GetValue());
}

TEST(Pin, IsListedOnceHoweverItCameToItsSignal) {
    ScalarSignal signal("s");
    ScalarSignal other("t");
    ScalarPin pin("P", Polarity::INPUT);
    signal.Connect(&pin);
    pin.Connect(&other); // one way: the signal goes on listing it
    signal.Connect(&pin);
    EXPECT_EQ(&other, pin.GetSignal());
    pin.Disconnect();
    signal.Connect(&pin);
    EXPECT_EQ(nullptr, pin.GetSignal());
    EXPECT_EQ("P", NamesOf(signal.GetPinIterator()));
    signal.Disconnect(&pin);
    signal.Connect(&pin);
    EXPECT_EQ(&signal, pin.GetSignal());
    EXPECT_EQ("P", NamesOf(signal.GetPinIterator()));
}

TEST(Instance, IsASnapshotOfItsComponent) {
    Component component("C");
    component.AddPin("B", Polarity::INPUT, "1");
    component.AddPin("A", Polarity::OUTPUT, "");
    component.GetPin("B")->AddAttr(new AttributeString("X", "x"));
    component.AddAttr(new AttributeString("OWN", "o"));
    Instance instance("u[1]", &component);
    component.AddPin("late", Polarity::INPUT, "");
    component.GetPin("A")->AddAttr(new AttributeString("LATE", ""));
    component.GetPin("B")->GetAttr("X")->SetValue("changed");
    EXPECT_EQ("B A", NamesOf(instance.GetPinIterator()));
    EXPECT_STREQ("x", instance.GetPin("b")->GetAttr("X")->GetValueString());
    EXPECT_STREQ("1", instance.GetPin("B")->GetDefaultValue().GetValue());
    EXPECT_EQ(nullptr, instance.GetPin("A")->GetAttr("LATE"));
    EXPECT_EQ(nullptr, instance.GetAttr("OWN"));
    EXPECT_EQ(component.GetAttr("OWN"), instance.GetComponentAttr("own"));
    EXPECT_STREQ("C", instance.GetComponentName());
    EXPECT_STREQ("u(1)", instance.GetName());
    instance.SortPinName();
    EXPECT_EQ("B A", NamesOf(instance.GetPinIterator())); // inputs before outputs
}

TEST(Instance, WithoutAComponent) {
    Instance instance("u1", nullptr);
    EXPECT_FALSE(instance.GetPinIterator().HasMore());
    EXPECT_STREQ("", instance.GetComponentName());
    EXPECT_EQ(nullptr, instance.GetComponentAttr("x"));
    PtrArray<Pin *> found;
    EXPECT_FALSE(instance.GetOpenPin(found, false));
}

TEST(Instance, PinsThatReadOrDriveAPort) {
    struct Row {
        Polarity::Value port;
        char const *readers;
        char const *drivers;
    };
    for (Row const &row : std::vector<Row>{{Polarity::OUTPUT, "i b", ""},
                                           {Polarity::INPUT, "", "o b"},
                                           {Polarity::BIDIRECTIONAL, "", ""},
                                           {Polarity::INVALID, "", ""}}) {
        Component component("C");
        for (char const *const name : {"i", "o", "b", "open"})
            component.AddPin(name, Polarity(name), "");
        Instance const instance("u", &component);
        ScalarSignal signal("s");
        signal.SetPortPolarity(row.port);
        for (char const *const name : {"i", "o", "b"})
            signal.Connect(instance.GetPin(name));
        PtrArray<Pin *> readers;
        PtrArray<Pin *> drivers;
        instance.GetOutPortConnectedToInPin(readers);
        instance.GetInPortConnectedToOutPin(drivers);
        EXPECT_EQ(row.readers, NamesOf(readers)) << row.port;
        EXPECT_EQ(row.drivers, NamesOf(drivers)) << row.port;
    }
}

TEST(Instance, OpenPins) {
    Component component("C");
    for (char const *const name : {"i", "o", "b", "in"})
        component.AddPin(name, Polarity(name), "");
    Instance const instance("u", &component);
    ScalarSignal signal("s");
    signal.Connect(instance.GetPin("i"));
    PtrArray<Pin *> found;
    EXPECT_TRUE(instance.GetOpenPin(found, true));
    EXPECT_EQ("in", NamesOf(found));
    EXPECT_TRUE(instance.GetOpenPin(found, false));
    EXPECT_EQ("in o b in", NamesOf(found)); // gathered, never emptied
    for (char const *const name : {"o", "b", "in"})
        signal.Connect(instance.GetPin(name));
    EXPECT_TRUE(instance.GetOpenPin(found, true)); // of earlier calls
    found.Empty();
    EXPECT_FALSE(instance.GetOpenPin(found, false));
}

} // namespace
