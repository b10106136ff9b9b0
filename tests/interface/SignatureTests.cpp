// The exported operations, held to their exact signatures by the compiler: a client that was built
// against one release is to run on the next. A row that does not compile is a break of the
// interface. Additions need no row here.

#include <algorithm>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

// HAVE(Class, row, ...), with rows of two kinds. As<Type>(&Class::Operation, ...): the class itself
// declares each operation or field in just that type; functions and static operations are of no
// class. From<void(Argument, ...), ...>(): it can be made from these arguments, and a single
// argument converts to it.

template <class Class, class Arguments> constexpr bool made = false;
template <class Class, class... Arguments>
constexpr bool made<Class, void(Arguments...)> = std::is_constructible_v<Class, Arguments...>;
template <class Class, class Argument>
constexpr bool made<Class, void(Argument)> = std::is_convertible_v<Argument, Class>;
template <class... Signatures> struct From {
    template <class Class> static constexpr bool holds = (made<Class, Signatures> && ...);
};
template <class... Owners> struct Of {
    template <class Class> static constexpr bool holds = (std::is_same_v<Class, Owners> && ...);
};
template <class Type, class Owner> using Member = Type Owner::*;
template <class Type, class... C> constexpr Of<C...> As(Member<Type, C>...) { return {}; }
template <class Type, std::same_as<Type>... More> constexpr Of<> As(Type *, More *...) {
    return {};
}
template <class Class, class... Rows> constexpr bool Have(Rows...) {
    return (Rows::template holds<Class> && ...);
}
#define HAVE(Class, ...) static_assert(Have<Class>(__VA_ARGS__))

using Str = Basis::StringBase<char>;
using Index = unsigned int;
using Text = char const *;
using In = Str const &;
using Tokens = StringArray const &;
using Way = Polarity const &;
using Bits = BitVectorValue;
using InBits = Bits const &;
using Stream = Basis::Stream;

using E = Engine;
using F = CommandFactory;
using M = Model;
using A = Attribute;
using S = Signal;
using P = Pin;
using C = Component;
using I = Instance;
using N = Netlist;
using O = HdlOptions;
using SA = StringArray;
using OS = OutStream;
using PB = PtrArrayBase;
using Holder = AttributeHolder;
using Value = Polarity::Value;
using PinArray = PtrArray<P *>;
using InHolder = Holder const *;
using Pins = Iterator<P *>;
using Signals = Iterator<S *>;
using Attributes = Iterator<A *> const &;

template <class... C> constexpr bool AreAbstract = (std::is_abstract_v<C> && ...);
template <class Base, class... C> constexpr bool Extend = (std::is_base_of_v<Base, C> && ...);
template <class... C> constexpr bool Assign = (Have<C>(As<C &(C const &)>(&C::operator=)) && ...);
template <class... C>
constexpr bool AssignFromNonConst = (Have<C>(As<C &(C &)>(&C::operator=)) && ...);
template <class... C>
constexpr bool CopyFromNonConst = ((std::is_constructible_v<C, C &> &&
                                    !std::is_copy_constructible_v<C>)&&...);
constexpr bool Ascend(std::initializer_list<std::size_t> o) { return std::ranges::is_sorted(o); }

// Engine, commands, model, options.

HAVE(E, From<void()>(), As<bool(Text)>(&E::UseModel, &E::RemoveModel), As<void(Text)>(&E::Execute),
     As<bool(Text, Text)>(&E::CreateAndAddModel, &E::ReadCommandFile, &E::WriteCommandFile),
     As<void(Text, Text)>(&E::Execute), As<bool(Text)>(&E::IsVhdlKeyword, &E::IsVerilogKeyword),
     As<void(Text, Text, Text, Text, Text, Text, bool, Text)>(&E::WriteOrvaneHeader));

HAVE(Command, As<bool(Tokens)>(&Command::ParseArguments), As<void()>(&Command::Execute),
     As<Text() const>(&Command::GetKeyword), As<M *() const>(&Command::GetModel),
     As<void(M *)>(&Command::SetModel));

using Creator = Command *(*)(Model *, Tokens);
static_assert(std::is_same_v<Creator, CommandCreator>);
HAVE(F, From<void()>(), As<void(Text, Creator)>(&F::AddCommandCreator), As<M *()>(&F::CreateModel),
     As<void(Tokens, Creator)>(&F::AddCommandCreator),
     As<Creator(Tokens) const>(&F::GetCommandCreator),
     As<Creator(Text) const>(&F::GetCommandCreator),
     As<Command *(M *, Tokens) const>(&F::CreateCommand),
     As<Command *(M *, Text) const>(&F::CreateCommand));

using CM = CommandManager;
HAVE(CM, From<void()>(), As<bool(Tokens, M *, F *)>(&CM::CreateAndExecute), As<void()>(&CM::Clear),
     As<void(Command *)>(&CM::AddDoneCommand), As<int() const>(&CM::GetDoneCommandCount));

HAVE(Exception, From<void(Basis::Exception const &), void(Exception const &)>());

#define SETTERS(Owner)                                                                             \
    &M::Set##Owner##AttrValue, &M::Set##Owner##GenericAttrValue, &M::Set##Owner##SynAttrValue,     \
        &M::Set##Owner##UserType
HAVE(M, As<void(Text, Text, Text, Text, Text)>(&M::AddComponentPinAttr, &M::AddInstancePinAttr),
     As<void(Text, Text, Text, Text)>(&M::AddComponentAttr, &M::AddInstanceAttr, &M::AddSignalAttr),
     As<void(Text, Text)>(SETTERS(Module), &M::AddComponentComment, &M::AddInstanceComment),
     As<bool(Text, Text)>(&M::AddInstance, &M::ConnectSignals, &M::AssignConstantToSignal),
     As<void(Text, Text, Text)>(SETTERS(Component), SETTERS(Instance), SETTERS(Signal)),
     As<bool(Text)>(&M::Execute, &M::Read, &M::Write, &M::AddComponent, &M::AddSignal),
     As<void(Text, Text, Text, Text)>(SETTERS(ComponentPin), SETTERS(InstancePin)),
     As<bool(Text, Text, Text)>(&M::ConnectSignalToPin, &M::AssignConstantToPin),
     As<void(Text, Text, Text)>(&M::AddModuleAttr, &M::AddComponentPinComment),
     As<void(Text)>(&M::SetName, &M::SetSourceFileName, &M::AddNotes), From<void(), void(F *)>(),
     As<void(Text, Text, Text)>(&M::AddInstancePinComment), As<F *() const>(&M::GetCommandFactory),
     As<Str() const>(&M::GetName, &M::GetSourceFileName), As<void(Holder *, Text, Text)>(SETTERS()),
     As<void(Holder *, Text, Text, Text)>(&M::AddAttr), As<bool(Text, Way, Text, Text)>(&M::AddPin),
     As<A *(Text, Holder const *) const>(&M::GetAttr), As<P *(Text, C const *) const>(&M::GetPin),
     As<P *(Text, I const *) const>(&M::GetPin), As<void(Text, Text)>(&M::AddSignalComment),
     As<C *(Text) const>(&M::GetComponent), As<I *(Text) const>(&M::GetInstance),
     As<void(bool)>(&M::SetModifiedFlag), As<S *(Text) const>(&M::GetSignal),
     As<bool() const>(&M::IsModified), As<O *() const>(&M::GetOptions),
     As<N *() const>(&M::GetNetlist), As<bool(Tokens)>(&M::Execute));
#undef SETTERS

using H = HdlOptions::VhdlOption;
using L = HdlOptions::VerilogOption;
HAVE(L, From<void()>(), As<void(Text)>(&L::SetSynthesisType), As<SA>(&L::includes),
     As<L::CaseType(Text) const>(&L::GetCaseType), As<L::SynthesisType>(&L::synthesisType),
     As<bool() const>(&L::IsSemiColonWrittenBeforeAttr),
     As<L::CaseType>(&L::signalCase, &L::instanceCase, &L::componentCase));
HAVE(O, From<void()>(), As<bool>(&O::writeHeader, &O::portOnePerLine, &O::macroNetlist),
     As<Str>(&O::application, &O::commandStr, &O::device, &O::purpose, &O::reference));
HAVE(H, From<void()>(), As<SA>(&H::libraries, &H::useLibraries),
     As<bool>(&H::suppressConfiguration, &H::flattenBus, &H::useDefaultLibrary, &H::useAttrType),
     As<bool>(&H::openPin, &H::suppressComponent));
static_assert(Ascend({offsetof(O, vhdlOption), offsetof(O, verilogOption), offsetof(O, writeHeader),
                      offsetof(O, application), offsetof(O, commandStr), offsetof(O, device),
                      offsetof(O, purpose), offsetof(O, reference), offsetof(O, portOnePerLine),
                      offsetof(O, macroNetlist)}));
static_assert(Ascend({offsetof(H, suppressConfiguration), offsetof(H, flattenBus),
                      offsetof(H, useDefaultLibrary), offsetof(H, libraries),
                      offsetof(H, useLibraries), offsetof(H, useAttrType), offsetof(H, openPin),
                      offsetof(H, suppressComponent)}));
static_assert(Ascend({offsetof(L, synthesisType), offsetof(L, signalCase),
                      offsetof(L, instanceCase), offsetof(L, componentCase),
                      offsetof(L, includes)}));

// The base layer.

using Range = Basis_Range;
HAVE(Str, As<Text() const>(&Str::operator Text), As<Str &(char)>(&Str::operator+=),
     From<void(), void(Text), void(In), void(In, Range const &)>(),
     As<Str &(Text)>(&Str::operator=, &Str::operator+=), As<Str &(Text, Index)>(&Str::Append),
     As<Str &(In)>(&Str::operator+=, &Str::Append), As<Index(char, char)>(&Str::ReplaceChars),
     As<int(In, Str::CompareType) const>(&Str::Compare), As<void(Text, Str::TrimType)>(&Str::Trim),
     As<void()>(&Str::Empty, &Str::MakeUpper, &Str::MakeLower), As<bool(Stream *)>(&Str::ReadLine),
     As<int(Text, Str::CompareType) const>(&Str::Compare), As<void(Range const &)>(&Str::Remove),
     As<Index(char, char) const>(&Str::GetIndexOfFirstChar, &Str::GetIndexOfLastChar),
     As<Index(Text, Str::CompareType) const>(&Str::GetIndexOfString),
     As<Str(Range const &) const>(&Str::Extract), As<Str &(Text, ...)>(&Str::Format),
     As<Str(Text, ...)>(&Str::doFormat),
     As<bool(Range &, Text, Str::ParseType) const>(&Str::NextTokenRange),
     As<Range(Basis_Regexp const &) const>(&Str::GetRangeOfMatch));
HAVE(Range, As<Index>(&Range::first, &Range::last));
static_assert(made<Basis_Regexp, void(Text)> && made<Basis::FileInit, void()>);
HAVE(Stream, As<Stream &(Text)>(&Stream::operator<<), As<Stream &()>(&Stream::flush));
HAVE(Basis::FileName, From<void(Text)>(), As<Str() const>(&Basis::FileName::GetTail));
using Error = Basis::Exception;
HAVE(Error, From<void(Text, Text, Text, int), void(Error const &)>(),
     As<Error &(Text, ...)>(&Error::setDescription), As<void() const>(&Error::report),
     As<wchar_t const *() const>(&Error::getLocalized));
HAVE(void, As<char *(Text, ...)>(&orvform), As<Str(Text)>(&Basis::Version::getValue),
     As<Stream *(Text, Stream::Access, bool)>(&Basis::File::open),
     As<bool(Stream *)>(&Basis::File::close), As<int(Text, Text)>(&Basis::stricmp),
     As<bool(Text, Text)>(&Basis::strimatch, &Basis::strmatch),
     As<int(Text, Text, std::uint64_t)>(&Basis::strnicmp), As<bool(Text, long &)>(&Basis::strtol));
using Stamp = TP_TIMESTAMP;
HAVE(Stamp, As<Str() const>(&Stamp::getTimeStampMonthNumber, &Stamp::getTimeStampMonthDay),
     As<Str() const>(&Stamp::getTimeStampYear, &Stamp::getTimeStampHour),
     As<Str() const>(&Stamp::getTimeStampMinute, &Stamp::getTimeStampSecond));

// Arrays, maps, output streams.

HAVE(SA, From<void(), void(Text, Text, bool, Text), void(Tokens)>(), As<bool() const>(&SA::IsEmpty),
     As<bool(Tokens) const>(&SA::Contains, &SA::IContains), As<Str(In) const>(&SA::Concatenate),
     As<void(bool (*)(In, In, void *), void *)>(&SA::Sort), As<void()>(&SA::Empty, &SA::Sort),
     As<bool(In) const>(&SA::Contains, &SA::IContains), As<int(Text, Text, bool, Text)>(&SA::Parse),
     As<Str(int) const>(&SA::operator[], &SA::GetAt), As<int() const>(&SA::GetSize),
     As<bool(int, int &, int) const>(&SA::GetIntAt), As<void(int, In)>(&SA::SetAt),
     As<void(Tokens)>(&SA::Add), As<int(In)>(&SA::Add));

HAVE(PB, As<int() const>(&PB::GetSize), As<bool() const>(&PB::IsEmpty), As<void()>(&PB::Empty),
     As<void(bool (*)(void *, void *, void *), void *)>(&PB::Sort));
struct Protected : PB {
    HAVE(PB, As<int(void *) const>(&Protected::GetIndex), As<bool(void *)>(&Protected::Remove),
         As<bool(void *) const>(&Protected::Contains));
};
/// The operations are the same for every element.
template <class T> constexpr bool AreArrays() {
    using Array = PtrArray<T>;
    using Walk = Iterator<T>;
    static_assert(Extend<PB, Array> && Extend<Array, OwnPtrArray<T>>);
    HAVE(Array, As<bool(T) const>(&Array::Contains), As<int(T) const>(&Array::GetIndex),
         As<void(int, int)>(&Array::Swap), As<T(int) const>(&Array::GetAt), As<int(T)>(&Array::Add),
         As<void(int, T)>(&Array::SetAt), As<T() const>(&Array::GetTail),
         As<void()>(&Array::RemoveTail), As<bool(T)>(&Array::Remove));
    HAVE(Walk, From<void(Array *), void(Walk const &)>(), As<void()>(&Walk::Rewind, &Walk::Advance),
         As<bool() const>(&Walk::HasMore), As<T() const>(&Walk::Current));
    return true;
}
static_assert(AreArrays<M *>() && AreArrays<S *>() && AreArrays<A *>() && AreArrays<P *>() &&
              AreArrays<C *>() && AreArrays<I *>());

using Map = IStringPtrMap<Signal *>;
HAVE(Map, As<void(Text, S *)>(&Map::Add), As<S *(Text) const>(&Map::Get));
HAVE(IStringPtrMapBase, As<bool(Text) const>(&Map::Contains), As<void(Text)>(&Map::Remove),
     As<bool() const>(&Map::IsEmpty), As<void()>(&Map::Empty));

using SetIter = StringSetIterator;
HAVE(StringSet, As<bool(Text) const>(&StringSet::IContains, &StringSet::Contains), From<void()>(),
     As<SetIter()>(&StringSet::GetBeginPos, &StringSet::GetEndPos), As<void()>(&StringSet::Empty),
     As<void(Text)>(&StringSet::Add, &StringSet::Remove), As<bool() const>(&StringSet::IsEmpty));
HAVE(SetIter, From<void(), void(void *), void(SetIter const &)>(),
     As<bool(SetIter const &) const>(&SetIter::operator==, &SetIter::operator!=),
     As<void(int)>(&SetIter::operator++), As<Str() const>(&SetIter::operator*));

HAVE(StreamDst, As<void()>(&StreamDst::Flush, &StreamDst::WriteNewLine),
     As<void()>(&StreamDst::Indent, &StreamDst::Unindent), As<void(Text)>(&StreamDst::Write),
     As<void(int)>(&StreamDst::Write), As<int()>(&StreamDst::GetIndentLevel));
HAVE(OS, From<void(StreamDst *)>(), As<OS &(OS::Operand)>(&OS::operator<<),
     As<OS &(int)>(&OS::operator<<), As<OS &(Text)>(&OS::operator<<), As<OS &(In)>(&OS::operator<<),
     As<void()>(&OS::Indent, &OS::Unindent));
using File = TextFileOutStream;
HAVE(File, From<void(Text, bool)>(), As<bool(Text, bool)>(&File::Open), As<void()>(&File::Close),
     As<bool() const>(&File::IsOpen), As<Str() const>(&File::GetFileName));
HAVE(TextMemOutStream, From<void(Text)>(), As<Str() const>(&TextMemOutStream::GetValue),
     As<void(Text)>(&TextMemOutStream::SetValue));

// Names, values, attributes, signals.

HAVE(Object, As<bool(Object const &) const>(&Object::operator==),
     As<Object::ObjectType() const>(&Object::GetObjectType), As<bool(Text) const>(&Object::IsNamed),
     As<void(ObjectVisitor &)>(&Object::AcceptObject), As<void(Str &)>(&Object::NormalizeName),
     As<void(Text)>(&Object::SetName, &Object::AddComment), As<Str(Text)>(&Object::GetBaseName),
     As<Str() const>(&Object::GetName, &Object::GetComment),
     As<bool(Text)>(&Object::IsValidBaseName), As<bool(In)>(&Object::IsValidIntegerString));

HAVE(Polarity, From<void(), void(Value), void(Text), void(Way)>(),
     As<void(Text)>(&Polarity::SetValue), As<void(Value)>(&Polarity::SetValue),
     As<Value() const>(&Polarity::GetValue), As<Value(Text)>(&Polarity::GetValue),
     As<bool(Way) const>(&Polarity::operator==, &Polarity::operator!=, &Polarity::operator<),
     As<bool(Value)>(&Polarity::IsValidValue), As<Str() const>(&Polarity::GetValueName));
HAVE(Bits, From<void(), void(Text), void(InBits)>(), As<void(Text)>(&Bits::SetValue),
     As<Str() const>(&Bits::GetValue), As<int() const>(&Bits::GetBase, &Bits::GetLength),
     As<bool() const>(&Bits::HasBaseAndLength));

HAVE(A, As<Str() const>(&A::GetValueString, &A::GetValueTypeName, &A::GetGeneric, &A::GetSynAttr),
     As<Index const>(&A::DEFAULT_GENERIC, &A::DEFAULT_SYNATTR), As<A *() const>(&A::CloneAttribute),
     As<void(AttributeVisitor &)>(&A::AcceptAttribute), As<A::ValueType() const>(&A::GetValueType),
     As<bool(Text)>(&A::SetGeneric, &A::SetSynAttr), As<bool(A const &) const>(&A::operator==),
     As<Text const>(&A::DEFAULT_ATTRTYPE), As<void(Text)>(&A::SetValue));

template <class T, class Given>
constexpr bool IsAttribute = Extend<A, T> &&Assign<T> &&
    Have<T>(From<void(Text, Text), void(T const &)>(), As<Given() const>(&T::GetValue),
            As<A *(Text, Text)>(&T::CreateAttribute));
static_assert(IsAttribute<AttributeString, Str> && IsAttribute<AttributeInteger, int> &&
              IsAttribute<AttributeFloat, double> && IsAttribute<AttributeBoolean, bool> &&
              IsAttribute<AttributeBit, Str> && IsAttribute<AttributeBitVector, Str> &&
              IsAttribute<AttributeUser, Str>);
HAVE(AttributeBitVector, As<Bits() const>(&AttributeBitVector::GetBitVectorValue));
HAVE(AttributeUser, As<void(Text)>(&AttributeUser::SetUserType),
     As<Str() const>(&AttributeUser::GetUserType));

HAVE(Holder, From<void(), void(Holder const &)>(), As<void(A *)>(&Holder::AddAttr),
     As<A *(Text) const>(&Holder::GetAttr), As<Iterator<A *>() const>(&Holder::GetAttrIterator));
HAVE(AttributeFactory, As<AttributeFactory &()>(&AttributeFactory::GetInstance),
     As<A *(Text, Text, Text) const>(&AttributeFactory::CreateAttribute));

HAVE(S, As<void(P *)>(&S::Connect, &S::Disconnect), As<void()>(&S::DisconnectAll),
     As<void(S *)>(&S::Connect, &S::Disconnect, &S::CloneConnection), As<int() const>(&S::GetWidth),
     As<void(Text)>(&S::AssignConstantValue), As<void(InBits)>(&S::AssignConstantValue),
     As<Bits() const>(&S::GetConstantValue), As<Pins() const>(&S::GetPinIterator),
     As<bool() const>(&S::HasMultiDriver, &S::IsPort, &S::IsNeededToDeclared),
     As<Signals() const>(&S::GetSignalIterator), As<void(StringSet &) const>(&S::GetBaseName),
     As<S::SignalType() const>(&S::GetSignalType), As<void(Way)>(&S::SetPortPolarity),
     As<void(SignalVisitor &)>(&S::AcceptSignal), As<Polarity() const>(&S::GetPortPolarity),
     As<Str() const>(&S::GetDummySignalName));

template <class T, class... Arguments>
constexpr bool IsSignal = Extend<S, T> &&
    Have<T>(From<void(Text, Arguments...)>(), As<T *(Arguments...) const>(&T::CreateDummySignal));
static_assert(IsSignal<ScalarSignal> && IsSignal<Bus> && IsSignal<BusSlice, Bus *> &&
              IsSignal<BusIndex, Bus *> && IsSignal<CompoundBus>);
HAVE(Bus, As<void(S *)>(&Bus::AddBusSlice, &Bus::RemoveBusSlice), As<bool() const>(&Bus::IsDownTo),
     As<bool(In, Str &, Str &, Str &)>(&Bus::ParseBusName), As<bool(In, SA &)>(&Bus::ParseBusName),
     As<bool(In, Str &, int &, int &)>(&Bus::ParseBusName), As<Str() const>(&Bus::GetBaseName),
     As<Signals() const>(&Bus::GetBusSliceIterator), As<void(Str &, Str &) const>(&Bus::GetIndex),
     As<Str(In, int, int)>(&Bus::GetBusSliceName), As<void(int, int) const>(&Bus::GetIndex),
     As<void()>(&Bus::EmptyBusSlice), As<bool(In)>(&Bus::IsBusName));
HAVE(BusSlice, As<bool() const>(&BusSlice::IsDownTo, &BusSlice::IsSameDirectionAsParent),
     As<void(Str &, Str &) const>(&BusSlice::GetIndex), As<Str() const>(&BusSlice::GetBaseName));
HAVE(BusIndex, As<Str() const>(&BusIndex::GetIndex, &BusIndex::GetBaseName),
     As<bool(In)>(&BusIndex::IsBusIndexName),
     As<bool(In, Str &, Str &)>(&BusIndex::ParseBusIndexName),
     As<bool(In, Str &, int &)>(&BusIndex::ParseBusIndexName));
using CB = CompoundBus;
HAVE(CB, From<void(Text, PtrArray<S *> const &)>(), As<void(S *)>(&CB::AddBusMember),
     As<void(int, S *)>(&CB::SetAt), As<S *(int) const>(&CB::GetAt), As<int() const>(&CB::GetSize),
     As<bool(In)>(&CB::IsCompoundBusName), As<Signals() const>(&CB::GetBusMemberIterator),
     As<void(In, SA &, bool)>(&CB::ParseCompoundBusName));

// Pins, components, instances, the netlist.

HAVE(P, As<void(S *)>(&P::Connect), As<void()>(&P::Disconnect), As<S *() const>(&P::GetSignal),
     As<void(Way)>(&P::SetPolarity), As<Polarity() const>(&P::GetPolarity),
     As<Str() const>(&P::GetPolarityName, &P::GetBaseName), As<void(Text)>(&P::SetDefaultValue),
     As<void(InBits)>(&P::SetDefaultValue), As<Bits() const>(&P::GetDefaultValue),
     As<P::PinType() const>(&P::GetPinType), As<P *() const>(&P::ClonePin),
     As<void(PinVisitor &)>(&P::AcceptPin));
template <class T>
constexpr bool IsPin = Extend<P, T> &&Assign<T> &&Have<T>(From<void(Text, Way), void(T const &)>());
static_assert(IsPin<ScalarPin> && IsPin<BusPin> && IsPin<BusIndexPin>);
HAVE(BusPin, As<void(Str &, Str &) const>(&BusPin::GetIndex), As<bool() const>(&BusPin::IsDownTo),
     As<int() const>(&BusPin::GetWidth));
HAVE(BusIndexPin, As<Str() const>(&BusIndexPin::GetIndex));

HAVE(C, From<void(Text)>(), As<void(Text, Way, InBits)>(&C::AddPin),
     As<void(Text, Way, Text)>(&C::AddPin), As<void(Pin const &)>(&C::AddPin),
     As<P *(Text) const>(&C::GetPin), As<Pins() const>(&C::GetPinIterator));
HAVE(I, From<void(Text, C *)>(), As<C *() const>(&I::GetComponent), As<P *(Text) const>(&I::GetPin),
     As<Str() const>(&I::GetComponentName), As<A *(Text) const>(&I::GetComponentAttr),
     As<Pins() const>(&I::GetPinIterator), As<void()>(&I::SortPinName),
     As<void(PinArray &) const>(&I::GetOutPortConnectedToInPin, &I::GetInPortConnectedToOutPin),
     As<bool(PinArray &, bool) const>(&I::GetOpenPin));

HAVE(DummyPlan, As<int() const>(&DummyPlan::GetSize),
     As<DummyPlan::Step const &(int) const>(&DummyPlan::GetAt),
     As<DummyPlan::Step const *(Signal const *) const>(&DummyPlan::Find),
     As<bool(Pin const &, DummyPlan::Reason &)>(&DummyPlan::FindReason),
     As<bool(Signal const &)>(&DummyPlan::HasSeveralDrivers));

HAVE(N, As<void()>(&N::SortNetlist, &N::CreateVhdlDummySignals, &N::CreateVerilogDummySignals),
     As<int(Signals &)>(&N::GetLongestPortName, &N::GetLongestSignalName), From<void(Text)>(),
     As<void()>(&N::ConnectOpenPinToDummy, &N::SetBoxTypeAttribute),
     As<void(C const *, PtrArray<I *> &) const>(&N::GetInstances),
     As<void(Text, PtrArray<I *> &) const>(&N::GetInstances), As<C *(Text) const>(&N::GetComponent),
     As<Iterator<C *>() const>(&N::GetComponentIterator), As<Bus *(Text) const>(&N::GetParentBus),
     As<void(Text)>(&N::SetName, &N::SetSourceFileName), As<Signals() const>(&N::GetSignalIterator),
     As<Iterator<I *>() const>(&N::GetInstanceIterator), As<int(N const *)>(&N::GetLongestAttrName),
     As<void(InHolder, int &)>(&N::GetLongestAttrName), As<char const[]>(&N::DEFAULT_NETLIST_NAME),
     As<Str() const>(&N::GetSourceFileName), As<int(Pins &)>(&N::GetLongestPinName),
     As<I *(Text) const>(&N::GetInstance), As<void(S *)>(&N::Add, &N::Remove),
     As<void(I *)>(&N::Add, &N::Remove), As<void(C *)>(&N::Add, &N::Remove),
     As<S *(Text) const>(&N::GetSignal));

// The writers.

using U = HdlUtilities;
HAVE(NetlistHeader, From<void(In, In, In, In, In, In, In, bool, OS &)>(),
     As<void()>(&NetlistHeader::Write));
HAVE(void, As<Str()>(&U::CurrentTimeString, &U::GetVersion), As<SA(I const *)>(&U::GetAttrNames),
     As<Str(int)>(&U::ConvertVhdlBase, &U::ConvertVerilogBase),
     As<Str(Text)>(&U::AddDummySuffix, &U::RemoveQuotes),
     As<void(In, bool, O const &, OS &)>(&U::WriteHeader));

HAVE(VhdlNetlister, From<void(OS &)>(), As<void(N *, O const *)>(&VhdlNetlister::WriteNetlist));
HAVE(VerilogNetlister, From<void(OS &)>(),
     As<void(N *, O const &)>(&VerilogNetlister::WriteNetlist));

using V = VhdlStatements;
HAVE(V, As<void(In, int)>(&V::WriteSignalStatement, &V::WriteSignalVectorStatement),
     As<void(A const *)>(&V::WriteGenericMapAttrType, &V::WriteGenericMapAttr), From<void(OS &)>(),
     As<void(InHolder, StringSet &, bool, int)>(&V::WriteAttrDeclaration),
     As<void(Tokens)>(&V::WriteUserLibrary, &V::WriteUseUserLibrary), As<void(In)>(&V::WriteBus),
     As<void(int, int)>(&V::WriteBusIndex, &V::WriteStdLogicVector),
     As<void(A const *, Text, Text, bool)>(&V::WriteAttrAssignment),
     As<void(In, bool, InBits)>(&V::WriteConstantSignalAssignment),
     As<void(InHolder, Text, Text, bool)>(&V::WriteAttrAssignment),
     As<void(A const *, bool, int)>(&V::WriteAttrDeclaration), As<void(Text)>(&V::WriteTimeStamp),
     As<void()>(&V::WriteStdLogic, &V::WriteIEEELibrary), As<void(bool)>(&V::WriteKorbalLibrary),
     As<void(A const *)>(&V::WriteGenericMapInitAttr), As<void(In, In)>(&V::WriteSignalAssignment),
     As<void(In, Way, int)>(&V::WritePortStatement), As<void(Object const *)>(&V::WriteComment));

using W = VerilogStatements;
HAVE(W, As<void(Attributes, Text)>(&W::WriteQRTAttr, &W::WriteExemplarAttr, &W::WritePrecisionAttr),
     As<void(A const *, Text)>(&W::WriteDefParamStatement, &W::WriteDefParamInitStatement),
     As<void(Attributes)>(&W::WriteSynplicityAttr, &W::WriteSynopsysAttr), From<void(OS &)>(),
     As<void(In, bool, InBits)>(&W::WriteConstantSignalAssignment),
     As<void(Text)>(&W::WriteTimeStamp, &W::WriteSignalName),
     As<void(A const *)>(&W::WriteParameterStatement), As<void(In, Way)>(&W::WritePortDeclaration),
     As<void(Str &) const>(&W::NormalizeBusName), As<void(In, In)>(&W::WriteSignalAssignment),
     As<void(Object const *)>(&W::WriteComment), As<void(Text, Text)>(&W::WriteTimeScale),
     As<void(In)>(&W::WriteSignalDeclaration), As<void(Tokens)>(&W::WriteIncludePath));

#define VISITS(Of, Class) As<void(Class *)>(&Of##Visitor::Visit##Class)
HAVE(AttributeVisitor, VISITS(Attribute, Attribute), VISITS(Attribute, AttributeString),
     VISITS(Attribute, AttributeInteger), VISITS(Attribute, AttributeFloat),
     VISITS(Attribute, AttributeBit), VISITS(Attribute, AttributeBitVector),
     VISITS(Attribute, AttributeBoolean), VISITS(Attribute, AttributeUser));
HAVE(SignalVisitor, VISITS(Signal, Signal), VISITS(Signal, ScalarSignal), VISITS(Signal, Bus),
     VISITS(Signal, BusSlice), VISITS(Signal, BusIndex), VISITS(Signal, CompoundBus));
HAVE(PinVisitor, VISITS(Pin, Pin), VISITS(Pin, ScalarPin), VISITS(Pin, BusPin),
     VISITS(Pin, BusIndexPin));
HAVE(ObjectVisitor, VISITS(Object, Attribute), VISITS(Object, Signal), VISITS(Object, Component),
     VISITS(Object, Pin), VISITS(Object, Instance), VISITS(Object, Netlist));
#undef VISITS

// What the classes are.

static_assert(AreAbstract<Command, StreamDst, Object, A, S, P>);
struct AnyCommand : Command { // inherits whether a constructor converts
    using Command::Command;
    bool ParseArguments(Tokens) override { return true; }
    void Execute() override {}
    Text GetKeyword() const override { return ""; }
};
struct AnyAttribute : A {
    using A::A;
    A *CloneAttribute() const override { return nullptr; }
    void SetValue(Text) override {}
    Str GetValueString() const override { return ""; }
    ValueType GetValueType() const override { return VALUE_STRING; }
};
static_assert(made<AnyCommand, void(M *)> && made<AnyAttribute, void(Text)>);
static_assert(Extend<Object, A, S, P, C, I, N> && Extend<Holder, S, P, C, I, N>);
static_assert(Extend<Error, Exception> && Extend<OutStream, File, TextMemOutStream> &&
              Extend<IStringPtrMapBase, Map>);
static_assert(CopyFromNonConst<O, H, L, StringSet, Map, VhdlNetlister> &&
              !std::is_copy_constructible_v<PB>);
static_assert(Assign<F, Str, SA, SetIter, Object, StreamDst, Polarity, Bits, A, Holder, P>);
static_assert(AssignFromNonConst<O, H, L, StringSet, IStringPtrMapBase>);

} // namespace
