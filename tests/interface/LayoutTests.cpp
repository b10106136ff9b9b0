// What a compiled client has built in besides the signatures: virtual slots, sizes, bases, numbers.

#include <cstdint>
#include <cstring>
#include <numeric>
#include <vector>

#include <gtest/gtest.h>

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

/// The slot of a virtual operation in the table of its class, as a pointer to member holds it (the
/// C++ ABI of Itanium: the offset in the table, marked by an odd bit in one of two words).
template <class Operation> int SlotOf(Operation operation) {
    std::intptr_t words[2];
    static_assert(sizeof words == sizeof operation);
    std::memcpy(words, &operation, sizeof words);
    if (words[0] % 2 == 0 && words[1] % 2 == 0)
        return -1; // not virtual
    return static_cast<int>(words[0] / static_cast<std::intptr_t>(sizeof(void *)));
}

/// Its one operation comes behind all slots of the class.
template <class Class> struct Behind : Class {
    virtual void Next() {}
};
template <class Class> int SlotCount() { return SlotOf(&Behind<Class>::Next); }

template <class... Operations> std::vector<int> SlotsOf(Operations... operations) {
    return {SlotOf(operations)...};
}

struct SlotRow {
    char const *name;
    int count;
    std::vector<int> slots;
};
/// The virtual operations of a class in the order of their slots, behind the destructor's two.
#define SLOTS(Class, ...)                                                                          \
    SlotRow { #Class, SlotCount < Class>(), SlotsOf(__VA_ARGS__) }

void (StreamDst::*const writeText)(char const *) = &StreamDst::Write;
void (StreamDst::*const writeInt)(int) = &StreamDst::Write;
Basis::StringBase<char> (Pin::*const pinBaseName)() const = &Pin::GetBaseName;

TEST(Interface, VirtualSlots) {
    using E = Basis::Exception;
    using H = AttributeHolder;
    using A = Attribute;
    using S = Signal;
    using AV = AttributeVisitor;
    using SV = SignalVisitor;
    using OV = ObjectVisitor;
    for (SlotRow const &row : std::vector<SlotRow>{
             SLOTS(E, &E::getLocalized, &E::report),
             SLOTS(Model),
             SLOTS(Command, &Command::ParseArguments, &Command::Execute, &Command::GetKeyword),
             SLOTS(StreamDst, &StreamDst::Flush, &StreamDst::WriteNewLine, writeText, writeInt),
             SLOTS(Basis::FileName),
             SLOTS(PtrArrayBase),
             SLOTS(OwnPtrArray<Pin *>),
             SLOTS(Iterator<Pin *>),
             SLOTS(IStringPtrMapBase),
             SLOTS(IStringPtrMap<Pin *>),
             SLOTS(OutStream),
             SLOTS(TextFileOutStream),
             SLOTS(TextMemOutStream),
             SLOTS(Object, &Object::GetObjectType, &Object::AcceptObject, &Object::SetName),
             SLOTS(A, &A::GetObjectType, &A::AcceptObject, &A::SetName, &A::AcceptAttribute,
                   &A::CloneAttribute, &A::SetValue, &A::GetValueString, &A::GetValueType),
             SLOTS(H, &H::AddAttr, &H::GetAttr),
             SLOTS(S, &S::GetObjectType, &S::AcceptObject, &S::SetName, &S::GetSignalType,
                   &S::SetPortPolarity, &S::AcceptSignal, &S::GetPortPolarity, &S::GetWidth,
                   &S::IsPort, &S::IsNeededToDeclared, &S::GetDummySignalName),
             SLOTS(Pin, &Pin::GetObjectType, &Pin::AcceptObject, &Pin::SetName, &Pin::GetPinType,
                   &Pin::ClonePin, &Pin::AcceptPin, pinBaseName),
             SLOTS(Component, &Component::GetObjectType, &Component::AcceptObject,
                   &Component::SetName),
             SLOTS(Instance, &Instance::GetObjectType, &Instance::AcceptObject, &Instance::SetName),
             SLOTS(Netlist, &Netlist::GetObjectType, &Netlist::AcceptObject, &Netlist::SetName),
             SLOTS(OV, &OV::VisitAttribute, &OV::VisitSignal, &OV::VisitComponent, &OV::VisitPin,
                   &OV::VisitInstance, &OV::VisitNetlist),
             SLOTS(AV, &AV::VisitAttribute, &AV::VisitAttributeString, &AV::VisitAttributeInteger,
                   &AV::VisitAttributeFloat, &AV::VisitAttributeBit, &AV::VisitAttributeBitVector,
                   &AV::VisitAttributeBoolean, &AV::VisitAttributeUser),
             SLOTS(SV, &SV::VisitSignal, &SV::VisitScalarSignal, &SV::VisitBus, &SV::VisitBusSlice,
                   &SV::VisitBusIndex, &SV::VisitCompoundBus),
             SLOTS(PinVisitor, &PinVisitor::VisitPin, &PinVisitor::VisitScalarPin,
                   &PinVisitor::VisitBusPin, &PinVisitor::VisitBusIndexPin)}) {
        std::vector<int> inOrder(row.slots.size());
        std::iota(inOrder.begin(), inOrder.end(), 2);
        EXPECT_EQ(inOrder, row.slots) << row.name;
        EXPECT_EQ(2 + row.slots.size(), row.count) << row.name;
    }
}

template <class Base, class... Derived> void ExpectNoSlotsAdded() {
    for (int const count : {SlotCount<Derived>()...})
        EXPECT_EQ(SlotCount<Base>(), count);
}

TEST(Interface, TheValueClassesAddNoSlots) {
    ExpectNoSlotsAdded<Attribute, AttributeString, AttributeInteger, AttributeFloat,
                       AttributeBoolean, AttributeBit, AttributeBitVector, AttributeUser>();
    ExpectNoSlotsAdded<Signal, ScalarSignal, Bus, BusSlice, BusIndex, CompoundBus>();
    ExpectNoSlotsAdded<Pin, ScalarPin, BusPin, BusIndexPin>();
    ExpectNoSlotsAdded<Basis::Exception, Exception>();
}

// Sizes, in pointers: a pointer to the private record, another for each base that has one, and a
// pointer to each table of virtual operations.

template <std::size_t pointers, class... Classes>
constexpr bool TakePointers = ((sizeof(Classes) == pointers * sizeof(void *)) && ...);

static_assert(TakePointers<1, Engine, CommandManager, StringArray, StringSet, StringSetIterator,
                           BitVectorValue, VhdlStatements, VerilogStatements>);
static_assert(TakePointers<2, Model, Command, PtrArrayBase, PtrArray<Pin *>, OwnPtrArray<Pin *>,
                           IStringPtrMapBase, IStringPtrMap<Pin *>, OutStream, TextFileOutStream,
                           TextMemOutStream, Object, AttributeHolder, VerilogNetlister>);
static_assert(TakePointers<3, Attribute, Iterator<Pin *>>);
static_assert(TakePointers<4, AttributeString, AttributeInteger, AttributeFloat, AttributeBoolean,
                           AttributeBit, AttributeBitVector, AttributeUser>);
static_assert(
    TakePointers<5, Signal, Pin, ScalarPin, BusPin, BusIndexPin, Component, Instance, Netlist>);
static_assert(TakePointers<6, ScalarSignal, Bus, BusSlice, BusIndex, CompoundBus>);
static_assert(TakePointers<9, NetlistHeader>);
static_assert(sizeof(Polarity) == sizeof(int));
static_assert(sizeof(Exception) == sizeof(Basis::Exception));

/// How far behind the object its attributes stand.
template <class Class> std::ptrdiff_t HolderOffset(Class const &object) {
    auto const at = [](auto const *part) { return reinterpret_cast<char const *>(part); };
    EXPECT_EQ(at(&object), at(static_cast<Object const *>(&object)));
    return at(static_cast<AttributeHolder const *>(&object)) - at(&object);
}

TEST(Interface, ObjectComesBeforeAttributeHolder) {
    Netlist const netlist("n");
    Component const component("c");
    for (std::ptrdiff_t const offset :
         {HolderOffset<Signal>(ScalarSignal("s")), HolderOffset<Pin>(ScalarPin("p", Polarity())),
          HolderOffset(component), HolderOffset(Instance("i", nullptr)), HolderOffset(netlist)})
        EXPECT_EQ(static_cast<std::ptrdiff_t>(sizeof(Object)), offset);
}

// Numbers and constants.

template <auto... values> constexpr bool CountFrom(int first) {
    return ((static_cast<int>(values) == first++) && ...);
}
static_assert(sizeof(Object::ObjectType) == 4 && sizeof(Polarity::Value) == 4);
static_assert(sizeof(Attribute::ValueType) == 4 && sizeof(Signal::SignalType) == 4);
static_assert(
    CountFrom<Object::OBJECT_ATTRIBUTE, Object::OBJECT_SIGNAL, Object::OBJECT_PIN,
              Object::OBJECT_COMPONENT, Object::OBJECT_INSTANCE, Object::OBJECT_NETLIST>(100));
static_assert(
    CountFrom<Polarity::INVALID, Polarity::INPUT, Polarity::OUTPUT, Polarity::BIDIRECTIONAL>(-1));
static_assert(CountFrom<Attribute::VALUE_STRING, Attribute::VALUE_INTEGER, Attribute::VALUE_FLOAT,
                        Attribute::VALUE_BOOLEAN, Attribute::VALUE_BIT, Attribute::VALUE_BIT_VECTOR,
                        Attribute::VALUE_USER>(0));
static_assert(CountFrom<Signal::SIGNAL_SCALAR, Signal::SIGNAL_BUS, Signal::SIGNAL_BUS_SLICE,
                        Signal::SIGNAL_BUS_INDEX, Signal::SIGNAL_COMPOUND_BUS>(50));
static_assert(CountFrom<Pin::PIN_SCALAR, Pin::PIN_BUS, Pin::PIN_BUS_INDEX>(1));
static_assert(CountFrom<OutStream::NEW_LINE, OutStream::FLUSH>(0));
using String = Basis::StringBase<char>;
static_assert(CountFrom<String::COMPARE_EXACT, String::COMPARE_IGNORING_CASE>(0));
static_assert(CountFrom<String::PARSE_KEEPING_EMPTY, String::PARSE_SKIPPING_EMPTY>(0));
static_assert(CountFrom<Basis::Stream::ACCESS_READ, Basis::Stream::ACCESS_REPLACE>(1));
static_assert(String::TRIM_BOTH_ENDS == 2 && Basis::Stream::ACCESS_APPEND == 6);
using Verilog = HdlOptions::VerilogOption;
static_assert(CountFrom<Verilog::SYNTHESIS_QRT, Verilog::SYNTHESIS_EXEMPLAR,
                        Verilog::SYNTHESIS_SYNPLICITY, Verilog::SYNTHESIS_SYNOPSYS,
                        Verilog::SYNTHESIS_VERILOG2001, Verilog::SYNTHESIS_PRECISION>(0));
static_assert(CountFrom<Verilog::CASE_DEFAULT, Verilog::CASE_UPPER, Verilog::CASE_LOWER>(10));

TEST(Interface, Constants) {
    EXPECT_STREQ("HDL_NETLIST", Netlist::DEFAULT_NETLIST_NAME);
    EXPECT_STREQ("String", Attribute::DEFAULT_ATTRTYPE);
    EXPECT_EQ(0U, Attribute::DEFAULT_GENERIC);
    EXPECT_EQ(0U, Attribute::DEFAULT_SYNATTR);
}

} // namespace
