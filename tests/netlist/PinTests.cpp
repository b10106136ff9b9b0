#include "vesk_hdl/netlist/Pin.h"

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/Owners.h"
#include "tests/support/RandomText.h"

using namespace Vesk_Hdl;

namespace {

TEST(Component, TheNameAsTypedDecidesTheClassOfAPin) {
    using Row = std::tuple<char const *, Pin::PinType, char const *, char const *>;
    for (auto const &[typed, type, name, baseName] :
         {Row{"A(3:0)", Pin::PIN_BUS, "A(3:0)", "A"}, Row{"A(3)", Pin::PIN_BUS_INDEX, "A(3)", "A"},
          Row{"A", Pin::PIN_SCALAR, "A", "A"}, Row{"A<3-0>", Pin::PIN_SCALAR, "A(3:0)", "A(3:0)"},
          Row{"A[3]", Pin::PIN_SCALAR, "A(3)", "A(3)"},
          Row{"A(:3:0)", Pin::PIN_SCALAR, "A(:3:0)", "A(:3:0)"},
          Row{"A()3)", Pin::PIN_BUS_INDEX, "A()3)", "A"}, Row{nullptr, Pin::PIN_SCALAR, "", ""}}) {
        Component component("c");
        component.AddPin(typed, Polarity::INPUT, "");
        Pin const *const pin = component.GetPin(name);
        ASSERT_TRUE(pin) << name;
        EXPECT_EQ(type, pin->GetPinType()) << name;
        EXPECT_STREQ(baseName, pin->GetBaseName()) << name;
        EXPECT_EQ(Object::OBJECT_PIN, pin->GetObjectType());
    }
}

/// A walk over few pins and the index of many find the same pin.
TEST(Component, PinsKeepOrderAndTheFirstOfTwoIsFound) {
    for (int const more : {0, 40}) {
        Component component("C");
        for (char const *const name : {"B", "A(3)", "A(2)"})
            component.AddPin(name, Polarity::INPUT, "");
        for (int i = 0; i < more; ++i)
            component.AddPin(("p" + std::to_string(i)).c_str(), Polarity::OUTPUT, "");
        Instance unique("u", &component);
        unique.SortPinName();
        EXPECT_STREQ("A(3)", component.GetPin("a[3]")->GetName());
        EXPECT_STREQ("B", unique.GetPin("b")->GetName()); // no longer where C has it
        EXPECT_TRUE(!component.GetPin("A") && !component.GetPin(nullptr));
        component.AddPin("late", Polarity::OUTPUT, "");
        EXPECT_FALSE(unique.GetPin("late"));
        component.AddPin("b", Polarity::OUTPUT, "");
        EXPECT_STREQ("B", component.GetPin("b")->GetName());
        EXPECT_STREQ("B", Instance("v", &component).GetPin("b")->GetName());
    }
    Component renamed("C");
    for (int i = 0; i < 40; ++i)
        renamed.AddPin(("p" + std::to_string(i)).c_str(), Polarity::OUTPUT, "");
    renamed.GetPin("p1")->SetName(
        "Z"); // last, as from then on the index of this component is not used
    EXPECT_TRUE(renamed.GetPin("Z") && !renamed.GetPin("p1"));
}

TEST(Component, APinRenamedThroughItsBaseIsFoundByItsName) {
    Component component("C");
    for (int i = 0; i < 40; ++i)
        component.AddPin(("p" + std::to_string(i)).c_str(), Polarity::OUTPUT, "");
    static_cast<Object &>(*component.GetPin("p3")) = Component("Z");
    EXPECT_TRUE(component.GetPin("Z") && !component.GetPin("p3"));
}

/// Random instances, sorted twice: their pins' names. A pin that changed makes each instance sort
/// for itself; without one they share the order.
std::string SortedPins(bool aPinHasChanged) {
    std::mt19937 random(3);
    std::string names;
    for (int i = 0; i < 200; ++i) {
        Component component("C");
        // Names at random, some of them equal, or pairs that differ in case alone. With many pins a
        // second sort may exchange equal ones.
        for (unsigned long pin = random() % 40; pin > 0; --pin) {
            std::string const pair = (pin % 2 ? "p" : "P") + std::to_string(pin / 2 * 7 % 20);
            component.AddPin((i % 2 ? pair : RandomText(random, "aAb12", 3)).c_str(),
                             static_cast<Polarity::Value>(random() % 3), "");
        }
        Instance first("u", &component);
        component.AddPin("late", Polarity::INPUT, "");
        if (aPinHasChanged)
            component.GetPin("late")->SetPolarity(Polarity::INPUT);
        Instance second("v", &component);
        for (Instance *const instance : {&first, &second, &first, &second}) {
            instance->SortPinName();
            names += NamesOf(instance->GetPinIterator()) + "\n";
        }
    }
    return names;
}

/// The sorted order is found once for all instances, until a client changes a pin of the component.
TEST(Instance, BothWaysOfSortingGiveTheSame) {
    EXPECT_EQ(SortedPins(false), SortedPins(true));
    Component component("C");
    for (char const *const name : {"b", "c"})
        component.AddPin(name, Polarity::INPUT, "");
    Instance instance("u", &component);
    instance.SortPinName();
    instance.GetPin("b")->SetPolarity(Polarity::OUTPUT);
    instance.SortPinName();
    EXPECT_EQ("c b", NamesOf(instance.GetPinIterator()));
}

TEST(Component, TakesNamePolarityAndDefaultOfAPin) {
    Component component("C");
    component.AddPin("A", Polarity::INPUT, static_cast<char const *>(nullptr));
    EXPECT_TRUE(component.GetPin("A")->GetDefaultValue().IsEmpty());
    ScalarPin source("D[3]", Polarity::BIDIRECTIONAL);
    source.SetDefaultValue("1:b:0");
    source.AddAttr(new AttributeString("X", "x"));
    source.AddComment("c");
    component.AddPin(source);
    Pin const *const added = component.GetPin("D(3)");
    EXPECT_EQ(Pin::PIN_BUS_INDEX, added->GetPinType()); // decided anew
    EXPECT_TRUE(added->GetDefaultValue().HasBaseAndLength());
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
    BusPin target("B(3:0)", Polarity::OUTPUT);
    target = source;
    target = *&target;
    source.GetAttr("X")->SetValue("changed");
    source.AddComment("d");
    for (Pin const *const copy : {clone.get(), static_cast<Pin *>(&target)}) {
        EXPECT_EQ(Pin::PIN_BUS, copy->GetPinType());
        EXPECT_TRUE(copy->GetSignal() == &signal && copy->GetPolarity() == Polarity::INPUT);
        EXPECT_EQ("X=x NONE NONE", AttrsOf(*copy));
        EXPECT_STREQ("c\n", copy->GetComment());
    }
    EXPECT_EQ("B(3:0)", NamesOf(signal.GetPinIterator()));
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
    Instance const instance("u[1]", &component);
    component.AddPin("late", Polarity::INPUT, "");
    component.GetPin("B")->GetAttr("X")->SetValue("changed");
    EXPECT_EQ("B A", NamesOf(instance.GetPinIterator()));
    EXPECT_EQ("X=x NONE NONE", AttrsOf(*instance.GetPin("b")));
    EXPECT_STREQ("1", instance.GetPin("B")->GetDefaultValue().GetValue());
    EXPECT_TRUE(!instance.GetAttr("OWN") && instance.GetComponentAttr("own"));
    Instance const bare("u2", nullptr);
    EXPECT_FALSE(bare.GetPinIterator().HasMore() || bare.GetComponentAttr("x"));
    EXPECT_STREQ("", bare.GetComponentName());
}

TEST(Instance, PinsThatReadOrDriveAPortAndOpenOnes) {
    using Row = std::tuple<Polarity::Value, char const *, char const *>;
    for (auto const &[port, readers, drivers] :
         {Row{Polarity::OUTPUT, "i b", ""}, Row{Polarity::INPUT, "", "o b"},
          Row{Polarity::BIDIRECTIONAL, "", ""}, Row{Polarity::INVALID, "", ""}}) {
        Component component("C");
        for (char const *const name : {"i", "o", "b", "in", "out", "bi"})
            component.AddPin(name, Polarity(name), "");
        Instance const instance("u", &component);
        ScalarSignal signal("s");
        signal.SetPortPolarity(port);
        for (char const *const name : {"i", "o", "b"})
            signal.Connect(instance.GetPin(name));
        PtrArray<Pin *> reading, driving, open;
        instance.GetOutPortConnectedToInPin(reading);
        instance.GetInPortConnectedToOutPin(driving);
        EXPECT_EQ(readers, NamesOf(reading)) << port;
        EXPECT_EQ(drivers, NamesOf(driving)) << port;
        EXPECT_TRUE(instance.GetOpenPin(open, true) && instance.GetOpenPin(open, false));
        EXPECT_EQ("in in out bi", NamesOf(open)); // gathered, never emptied
        for (char const *const name : {"in", "out", "bi"})
            signal.Connect(instance.GetPin(name));
        EXPECT_TRUE(
            instance.GetOpenPin(open, true)); // the list still holds the pins of earlier calls
        open.Empty();
        EXPECT_FALSE(instance.GetOpenPin(open, false));
    }
}

} // namespace
