// What a compiled client relies on besides the names of operations, which check-exports compares:
// virtual slots, sizes, fields, bases, numbers, types of results. If a line here no longer
// compiles, clients break.

#include <algorithm>
#include <array>
#include <bit>
#include <cstdint>
#include <cstring>
#include <type_traits>
#include <typeinfo>

#include <gtest/gtest.h>

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

using String = Basis::StringBase<char>;
using A = Attribute;
using L = HdlOptions::VerilogOption;
using O = Object;
using P = Pin;
using S = Signal;
using AV = AttributeVisitor;
using OV = ObjectVisitor;
using SV = SignalVisitor;

/// The slot of a virtual operation in the table of its class. In the Itanium C++ ABI a pointer to a
/// virtual member holds the offset in the table, perhaps with a mark added; a pointer to any other
/// member gives a number that is no slot.
template <class Operation> int SlotOf(Operation operation) {
    auto const words = std::bit_cast<std::array<std::intptr_t, 2>>(operation);
    return static_cast<int>(words[0] / static_cast<std::intptr_t>(sizeof(void *)));
}

/// Has one more virtual operation, whose slot follows those of the class.
template <class Class> struct Extended : Class {
    virtual void Next() {}
};

/// These are the virtual operations of the class, in this order, after the two of the destructor.
template <class Class, class... Operations> void ExpectSlots(Operations... operations) {
    for (int next = 2; int const slot : {SlotOf(operations)..., SlotOf(&Extended<Class>::Next)})
        EXPECT_EQ(next++, slot) << typeid(Class).name();
}

void (StreamDst::*const writeText)(char const *) = &StreamDst::Write;
void (StreamDst::*const writeInt)(int) = &StreamDst::Write;

TEST(Interface, VirtualSlots) {
    ExpectSlots<Basis::FileName>();
    ExpectSlots<Command>(&Command::ParseArguments, &Command::Execute, &Command::GetKeyword);
    ExpectSlots<StreamDst>(&StreamDst::Flush, &StreamDst::WriteNewLine, writeText, writeInt);
    ExpectSlots<Basis::Exception>(&Basis::Exception::getLocalized, &Basis::Exception::report);
    ExpectSlots<AttributeHolder>(&AttributeHolder::AddAttr, &AttributeHolder::GetAttr);
    ExpectSlots<O>(&O::GetObjectType, &O::AcceptObject, &O::SetName);
    ExpectSlots<A>(&A::GetObjectType, &A::AcceptObject, &A::SetName, &A::AcceptAttribute,
                   &A::CloneAttribute, &A::SetValue, &A::GetValueString, &A::GetValueType);
    ExpectSlots<S>(&S::GetObjectType, &S::AcceptObject, &S::SetName, &S::GetSignalType,
                   &S::SetPortPolarity, &S::AcceptSignal, &S::GetPortPolarity, &S::GetWidth,
                   &S::IsPort, &S::IsNeededToDeclared, &S::GetDummySignalName);
    ExpectSlots<P>(&P::GetObjectType, &P::AcceptObject, &P::SetName, &P::GetPinType, &P::ClonePin,
                   &P::AcceptPin, static_cast<String (P::*)() const>(&P::GetBaseName));
    ExpectSlots<OV>(&OV::VisitAttribute, &OV::VisitSignal, &OV::VisitComponent, &OV::VisitPin,
                    &OV::VisitInstance, &OV::VisitNetlist);
    ExpectSlots<AV>(&AV::VisitAttribute, &AV::VisitAttributeString, &AV::VisitAttributeInteger,
                    &AV::VisitAttributeFloat, &AV::VisitAttributeBit, &AV::VisitAttributeBitVector,
                    &AV::VisitAttributeBoolean, &AV::VisitAttributeUser);
    ExpectSlots<SV>(&SV::VisitSignal, &SV::VisitScalarSignal, &SV::VisitBus, &SV::VisitBusSlice,
                    &SV::VisitBusIndex, &SV::VisitCompoundBus);
    ExpectSlots<PinVisitor>(&PinVisitor::VisitPin, &PinVisitor::VisitScalarPin,
                            &PinVisitor::VisitBusPin, &PinVisitor::VisitBusIndexPin);
}

// Sizes in pointers: one to the private record of each base, one to each table of operations.

template <class... Classes> void ExpectSize(std::size_t pointers) {
    for (std::size_t const size : {sizeof(Classes)...})
        EXPECT_EQ(pointers * sizeof(void *), size);
}

/// The classes have these sizes, and no slots of their own.
template <class Base, class... Classes> void ExpectLike(std::size_t pointers) {
    ExpectSize<Classes...>(pointers);
    for (int const next : {SlotOf(&Extended<Classes>::Next)...})
        EXPECT_EQ(SlotOf(&Extended<Base>::Next), next) << typeid(Base).name();
}

TEST(Interface, SizesAndClassesWithoutSlotsOfTheirOwn) {
    ExpectSize<Engine, CommandManager, CommandFactory, AttributeFactory, StringArray, StringSet,
               StringSetIterator, BitVectorValue, VhdlStatements, VerilogStatements>(1);
    ExpectSize<Command, AttributeHolder, O, VerilogNetlister>(2);
    ExpectLike<Basis::FileName, Model, PtrArrayBase, OwnPtrArray<P *>, IStringPtrMapBase,
               IStringPtrMap<P *>, OutStream, TextFileOutStream, TextMemOutStream>(2);
    ExpectLike<Basis::FileName, Iterator<P *>>(3);
    ExpectSize<A, VhdlNetlister>(3);
    ExpectLike<A, AttributeString, AttributeInteger, AttributeFloat, AttributeBoolean, AttributeBit,
               AttributeBitVector, AttributeUser>(4);
    ExpectLike<O, Component, Instance, Netlist>(5);
    ExpectLike<P, P, ScalarPin, BusPin, BusIndexPin>(5);
    ExpectSize<S>(5);
    ExpectLike<S, ScalarSignal, Bus, BusSlice, BusIndex, CompoundBus>(6);
    ExpectSize<NetlistHeader>(9);
    ExpectLike<Basis::Exception, Exception>(sizeof(Basis::Exception) / sizeof(void *));
}

template <class Class> bool Follows(Class const &whole) {
    Object const *const object = &whole;
    AttributeHolder const *const holder = &whole;
    return static_cast<void const *>(&whole) == object &&
           static_cast<void const *>(object + 1) == holder;
}

TEST(Interface, ObjectComesBeforeAttributeHolder) {
    EXPECT_TRUE(Follows(ScalarSignal("s")) && Follows(ScalarPin("p", "in")) &&
                Follows(Component("c")));
    EXPECT_TRUE(Follows(Instance("i", nullptr)) && Follows(Netlist("n")));
}

/// A number of type `Word` in the memory that starts at `base`.
template <class Word> Word WordAt(void const *base, std::size_t bytes) {
    Word word;
    std::memcpy(&word, static_cast<char const *>(base) + bytes, sizeof word);
    return word;
}

// Memory that inline functions of the headers read: these offsets are compiled into clients.

TEST(Interface, MemoryOfArraysAndStrings) {
    int item = 0;
    PtrArray<int *> array;
    EXPECT_EQ(nullptr, WordAt<void *>(&array, sizeof(void *))); // no block before the first element
    array.Add(nullptr);
    array.Add(&item);
    void const *const block = WordAt<void *>(&array, sizeof(void *));
    EXPECT_EQ(2, WordAt<int>(block, 0)); // the size, the capacity, and the elements
    EXPECT_EQ(&item, WordAt<int *>(block, 8 + sizeof(void *)));

    String const text("abc");
    String const copy(text);
    void const *const rep = WordAt<void *>(&text, 0);
    EXPECT_EQ(2U, WordAt<unsigned int>(rep, 0)); // owners, length, capacity, and the characters
    EXPECT_EQ(3U, WordAt<unsigned int>(rep, 4));
    EXPECT_EQ(text.GetText(), static_cast<char const *>(rep) + 12);
    EXPECT_EQ(text.GetText(), copy.GetText());
}

template <auto... values> constexpr bool CountFrom(int first) {
    return ((sizeof values == 4 && static_cast<int>(values) == first++) && ...);
}
#define COUNT(first, ...) static_assert(CountFrom<__VA_ARGS__>(first))
static_assert(sizeof(Polarity) == 4);
COUNT(100, O::OBJECT_ATTRIBUTE, O::OBJECT_SIGNAL, O::OBJECT_PIN, O::OBJECT_COMPONENT,
      O::OBJECT_INSTANCE, O::OBJECT_NETLIST);
COUNT(-1, Polarity::INVALID, Polarity::INPUT, Polarity::OUTPUT, Polarity::BIDIRECTIONAL);
COUNT(0, A::VALUE_STRING, A::VALUE_INTEGER, A::VALUE_FLOAT, A::VALUE_BOOLEAN, A::VALUE_BIT,
      A::VALUE_BIT_VECTOR, A::VALUE_USER);
COUNT(50, S::SIGNAL_SCALAR, S::SIGNAL_BUS, S::SIGNAL_BUS_SLICE, S::SIGNAL_BUS_INDEX,
      S::SIGNAL_COMPOUND_BUS);
COUNT(1, P::PIN_SCALAR, P::PIN_BUS, P::PIN_BUS_INDEX);
COUNT(0, OutStream::NEW_LINE, OutStream::FLUSH);
COUNT(0, String::COMPARE_EXACT, String::COMPARE_IGNORING_CASE);
COUNT(0, String::PARSE_KEEPING_EMPTY, String::PARSE_SKIPPING_EMPTY);
COUNT(1, Basis::Stream::ACCESS_READ, Basis::Stream::ACCESS_REPLACE);
static_assert(String::TRIM_BOTH_ENDS == 2 && Basis::Stream::ACCESS_APPEND == 6);
COUNT(0, L::SYNTHESIS_QRT, L::SYNTHESIS_EXEMPLAR, L::SYNTHESIS_SYNPLICITY, L::SYNTHESIS_SYNOPSYS,
      L::SYNTHESIS_VERILOG2001, L::SYNTHESIS_PRECISION);
COUNT(10, L::CASE_DEFAULT, L::CASE_UPPER, L::CASE_LOWER);

// The type of a result is not part of an exported name.

template <class Result> struct Giving {
    template <class C, class... Arguments> constexpr Giving(Result (C::*)(Arguments...) const) {}
    template <class C, class... Arguments> constexpr Giving(Result (C::*)(Arguments...)) {}
    template <class... Arguments> constexpr Giving(Result (*)(Arguments...)) {}
};
using M = Model;
using N = Netlist;
[[maybe_unused]] constexpr Giving<String> STRINGS[] = {&String::Extract,
                                                       &Basis::FileName::GetTail,
                                                       &Basis::Version::getValue,
                                                       &StringArray::GetAt,
                                                       &StringArray::operator[],
                                                       &StringArray::Concatenate,
                                                       &StringSetIterator::operator*,
                                                       &TextFileOutStream::GetFileName,
                                                       &TextMemOutStream::GetValue,
                                                       &M::GetName,
                                                       &M::GetSourceFileName,
                                                       &N::GetSourceFileName,
                                                       &O::GetName,
                                                       &O::GetComment,
                                                       &O::GetBaseName,
                                                       &Polarity::GetValueName,
                                                       &BitVectorValue::GetValue,
                                                       &A::GetValueString,
                                                       &A::GetValueTypeName,
                                                       &A::GetGeneric,
                                                       &A::GetSynAttr,
                                                       &AttributeUser::GetUserType,
                                                       &AttributeString::GetValue,
                                                       &AttributeBit::GetValue,
                                                       &S::GetDummySignalName,
                                                       &Bus::GetBusSliceName,
                                                       &BusIndex::GetIndex,
                                                       &P::GetPolarityName,
                                                       &Instance::GetComponentName,
                                                       &HdlUtilities::CurrentTimeString,
                                                       &HdlUtilities::GetVersion,
                                                       &HdlUtilities::AddDummySuffix,
                                                       &HdlUtilities::RemoveQuotes};
[[maybe_unused]] constexpr Giving<bool> FLAGS[] = {&Engine::UseModel,
                                                   &Engine::RemoveModel,
                                                   &Engine::CreateAndAddModel,
                                                   &Engine::ReadCommandFile,
                                                   &Engine::WriteCommandFile,
                                                   &Command::ParseArguments,
                                                   &CommandManager::CreateAndExecute,
                                                   &M::Read,
                                                   &M::Write,
                                                   &M::AddPin,
                                                   &M::AddInstance,
                                                   &M::AddSignal,
                                                   &M::AddComponent,
                                                   &M::ConnectSignalToPin,
                                                   &M::ConnectSignals,
                                                   &M::AssignConstantToPin,
                                                   &M::IsModified,
                                                   &A::SetGeneric,
                                                   &A::SetSynAttr,
                                                   &O::IsNamed,
                                                   &S::IsPort,
                                                   &S::HasMultiDriver,
                                                   &S::IsNeededToDeclared,
                                                   &Bus::IsBusName,
                                                   &CompoundBus::IsCompoundBusName,
                                                   &BusIndex::IsBusIndexName,
                                                   &Instance::GetOpenPin,
                                                   &StringArray::GetIntAt,
                                                   &BitVectorValue::HasBaseAndLength,
                                                   &PtrArray<S *>::Contains,
                                                   &PtrArray<S *>::Remove,
                                                   &Iterator<S *>::HasMore,
                                                   &Basis::File::close,
                                                   &Basis::strtol};
[[maybe_unused]] constexpr Giving<int> NUMBERS[] = {&PtrArrayBase::GetSize,
                                                    &PtrArray<S *>::Add,
                                                    &PtrArray<S *>::GetIndex,
                                                    &StringArray::GetSize,
                                                    &StreamDst::GetIndentLevel,
                                                    &BitVectorValue::GetBase,
                                                    &BitVectorValue::GetLength,
                                                    &S::GetWidth,
                                                    &CompoundBus::GetSize,
                                                    &N::GetLongestPortName,
                                                    &N::GetLongestSignalName,
                                                    &N::GetLongestPinName,
                                                    &CommandManager::GetDoneCommandCount,
                                                    &Basis::stricmp,
                                                    &Basis::strnicmp};
[[maybe_unused]] constexpr Giving<Polarity> POLARITIES[] = {&S::GetPortPolarity, &P::GetPolarity};
[[maybe_unused]] constexpr Giving<BitVectorValue> VALUES[] = {
    &S::GetConstantValue, &P::GetDefaultValue, &AttributeBitVector::GetBitVectorValue};

// Types and order of the fields that clients set.

using V = HdlOptions::VhdlOption;
using H = HdlOptions;
[[maybe_unused]] constexpr bool H::*SWITCHES[] = {&H::writeHeader, &H::portOnePerLine,
                                                  &H::macroNetlist};
[[maybe_unused]] constexpr String H::*TEXTS[] = {&H::application, &H::commandStr, &H::device,
                                                 &H::purpose, &H::reference};
[[maybe_unused]] constexpr bool V::*VHDL_SWITCHES[] = {
    &V::suppressConfiguration, &V::flattenBus, &V::useDefaultLibrary,
    &V::useAttrType,           &V::openPin,    &V::suppressComponent};
[[maybe_unused]] constexpr StringArray V::*LIBRARIES[] = {&V::libraries, &V::useLibraries};
[[maybe_unused]] constexpr L::CaseType L::*CASES[] = {&L::signalCase, &L::instanceCase,
                                                      &L::componentCase};
constexpr bool Ascend(std::initializer_list<std::size_t> o) { return std::ranges::is_sorted(o); }
static_assert(Ascend({offsetof(H, vhdlOption), offsetof(H, verilogOption), offsetof(H, writeHeader),
                      offsetof(H, application), offsetof(H, commandStr), offsetof(H, device),
                      offsetof(H, purpose), offsetof(H, reference), offsetof(H, portOnePerLine),
                      offsetof(H, macroNetlist)}));
static_assert(Ascend({offsetof(V, suppressConfiguration), offsetof(V, flattenBus),
                      offsetof(V, useDefaultLibrary), offsetof(V, libraries),
                      offsetof(V, useLibraries), offsetof(V, useAttrType), offsetof(V, openPin),
                      offsetof(V, suppressComponent)}));
static_assert(Ascend({offsetof(L, synthesisType), offsetof(L, signalCase),
                      offsetof(L, instanceCase), offsetof(L, componentCase),
                      offsetof(L, includes)}));

// Bases, and what is abstract.

template <class... C> constexpr bool AreAbstract = (std::is_abstract_v<C> && ...);
template <class Base, class... C> constexpr bool Extend = (std::is_base_of_v<Base, C> && ...);
static_assert(AreAbstract<Command, StreamDst, O, A, S, P>);
static_assert(Extend<O, A, S, P, Component, Instance, N> &&
              Extend<AttributeHolder, S, P, Component, Instance, N> &&
              Extend<S, ScalarSignal, Bus, BusSlice, BusIndex, CompoundBus> &&
              Extend<P, ScalarPin, BusPin, BusIndexPin> && Extend<Basis::Exception, Exception> &&
              Extend<OutStream, TextFileOutStream, TextMemOutStream> &&
              Extend<PtrArrayBase, PtrArray<S *>> && Extend<PtrArray<S *>, OwnPtrArray<S *>>);

} // namespace
