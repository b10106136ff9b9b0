// The exported operations, held to their exact signatures by the compiler: a client that was built
// against one release is to run on the next. A row that does not compile is a break of the
// interface. Additions need no row here.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <type_traits>
#include <utility>

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

using String = Basis::StringBase<char>;
using Text = char const *;
using In = String const &;

/// Each operation (or constant) has the type, and the class in the type declares it.
template <class Type, Type...> constexpr bool Have = true;
#define HAVE(...) static_assert(Have<__VA_ARGS__>)

/// A class can be made from the arguments of each function type.
template <class Class, class Arguments> struct Making;
template <class Class, class... Arguments> struct Making<Class, void(Arguments...)> {
    static constexpr bool possible = std::is_constructible_v<Class, Arguments...>;
};
template <class Class, class... Signatures>
constexpr bool Makes = (Making<Class, Signatures>::possible && ...);

/// Copied from an object that the copying may change, and not from a const one.
template <class Class>
constexpr bool CopiesFromNonConst =
    std::is_constructible_v<Class, Class &> && !std::is_constructible_v<Class, Class const &>;

// Operators, by what they give.

template <class Wanted, class Given> constexpr bool Gives = std::is_same_v<Wanted, Given>;
template <class Class, class From = Class const &>
constexpr bool Assigns = Gives<Class &, decltype(std::declval<Class &>() = std::declval<From>())>;
template <class Class>
constexpr bool Equates =
    Gives<bool, decltype(std::declval<Class const &>() == std::declval<Class const &>())>
        &&Gives<bool, decltype(std::declval<Class const &>() != std::declval<Class const &>())>;
template <class T>
constexpr bool Streams =
    Gives<OutStream &, decltype(std::declval<OutStream &>() << std::declval<T>())>;

constexpr bool Ascend(std::initializer_list<std::size_t> offsets) {
    return std::is_sorted(offsets.begin(), offsets.end());
}

// Engine and commands.

static_assert(Makes<Engine, void()>);
HAVE(bool (Engine::*)(Text, Text), &Engine::CreateAndAddModel, &Engine::ReadCommandFile,
     &Engine::WriteCommandFile);
HAVE(bool (Engine::*)(Text), &Engine::UseModel, &Engine::RemoveModel);
HAVE(void (Engine::*)(Text), &Engine::Execute);
HAVE(void (Engine::*)(Text, Text), &Engine::Execute);
HAVE(bool (*)(Text), &Engine::IsVhdlKeyword, &Engine::IsVerilogKeyword);
HAVE(void (*)(Text, Text, Text, Text, Text, Text, bool, Text), &Engine::WriteOrvaneHeader);

static_assert(std::is_abstract_v<Command>);
HAVE(bool (Command::*)(StringArray const &), &Command::ParseArguments);
HAVE(void (Command::*)(), &Command::Execute);
HAVE(Text (Command::*)() const, &Command::GetKeyword);
HAVE(Model *(Command::*)() const, &Command::GetModel);
HAVE(void (Command::*)(Model *), &Command::SetModel);

using Creator = Command *(*)(Model *, StringArray const &);
using Factory = CommandFactory;
static_assert(std::is_same_v<Creator, CommandCreator>);
static_assert(Makes<Factory, void()> && Assigns<Factory>);
HAVE(void (Factory::*)(Text, Creator), &Factory::AddCommandCreator);
HAVE(void (Factory::*)(StringArray const &, Creator), &Factory::AddCommandCreator);
HAVE(Creator (Factory::*)(StringArray const &) const, &Factory::GetCommandCreator);
HAVE(Creator (Factory::*)(Text) const, &Factory::GetCommandCreator);
HAVE(Command *(Factory::*)(Model *, StringArray const &) const, &Factory::CreateCommand);
HAVE(Command *(Factory::*)(Model *, Text) const, &Factory::CreateCommand);
HAVE(Model *(Factory::*)(), &Factory::CreateModel);

using Manager = CommandManager;
static_assert(Makes<Manager, void()>);
HAVE(bool (Manager::*)(StringArray const &, Model *, Factory *), &Manager::CreateAndExecute);
HAVE(void (Manager::*)(Command *), &Manager::AddDoneCommand);
HAVE(int (Manager::*)() const, &Manager::GetDoneCommandCount);
HAVE(void (Manager::*)(), &Manager::Clear);

static_assert(std::is_base_of_v<Basis::Exception, Exception>);
static_assert(Makes<Exception, void(Basis::Exception const &), void(Exception const &)>);

// The model.

using M = Model;
static_assert(Makes<Model, void(), void(Factory *)>);
HAVE(bool (M::*)() const, &M::IsModified);
HAVE(void (M::*)(bool), &M::SetModifiedFlag);
HAVE(Factory *(M::*)() const, &M::GetCommandFactory);
HAVE(HdlOptions *(M::*)() const, &M::GetOptions);
HAVE(Netlist *(M::*)() const, &M::GetNetlist);
HAVE(String (M::*)() const, &M::GetName, &M::GetSourceFileName);
HAVE(bool (M::*)(StringArray const &), &M::Execute);
HAVE(bool (M::*)(Text), &M::Execute, &M::Read, &M::Write, &M::AddComponent, &M::AddSignal);
HAVE(bool (M::*)(Text, Polarity const &, Text, Text), &M::AddPin);
HAVE(bool (M::*)(Text, Text), &M::AddInstance, &M::ConnectSignals, &M::AssignConstantToSignal);
HAVE(bool (M::*)(Text, Text, Text), &M::ConnectSignalToPin, &M::AssignConstantToPin);
HAVE(Component *(M::*)(Text) const, &M::GetComponent);
HAVE(Instance *(M::*)(Text) const, &M::GetInstance);
HAVE(Signal *(M::*)(Text) const, &M::GetSignal);
HAVE(Pin *(M::*)(Text, Component const *) const, &M::GetPin);
HAVE(Pin *(M::*)(Text, Instance const *) const, &M::GetPin);
HAVE(Attribute *(M::*)(Text, AttributeHolder const *) const, &M::GetAttr);

HAVE(void (M::*)(AttributeHolder *, Text, Text, Text), &M::AddAttr);
HAVE(void (M::*)(AttributeHolder *, Text, Text), &M::SetGenericAttrValue, &M::SetSynAttrValue,
     &M::SetAttrValue, &M::SetUserType);
HAVE(void (M::*)(Text), &M::SetName, &M::SetSourceFileName, &M::AddNotes);
HAVE(void (M::*)(Text, Text), &M::SetModuleGenericAttrValue, &M::SetModuleSynAttrValue,
     &M::SetModuleAttrValue, &M::SetModuleUserType, &M::AddComponentComment, &M::AddInstanceComment,
     &M::AddSignalComment);
HAVE(void (M::*)(Text, Text, Text), &M::AddModuleAttr, &M::SetComponentGenericAttrValue,
     &M::SetComponentSynAttrValue, &M::SetComponentAttrValue, &M::SetComponentUserType,
     &M::SetInstanceGenericAttrValue, &M::SetInstanceSynAttrValue, &M::SetInstanceAttrValue,
     &M::SetInstanceUserType, &M::SetSignalGenericAttrValue, &M::SetSignalSynAttrValue,
     &M::SetSignalAttrValue, &M::SetSignalUserType, &M::AddComponentPinComment,
     &M::AddInstancePinComment);
HAVE(void (M::*)(Text, Text, Text, Text), &M::AddComponentAttr, &M::AddInstanceAttr,
     &M::AddSignalAttr, &M::SetComponentPinGenericAttrValue, &M::SetComponentPinSynAttrValue,
     &M::SetComponentPinAttrValue, &M::SetComponentPinUserType, &M::SetInstancePinGenericAttrValue,
     &M::SetInstancePinSynAttrValue, &M::SetInstancePinAttrValue, &M::SetInstancePinUserType);
HAVE(void (M::*)(Text, Text, Text, Text, Text), &M::AddComponentPinAttr, &M::AddInstancePinAttr);

// The options.

using Vhdl = HdlOptions::VhdlOption;
using Verilog = HdlOptions::VerilogOption;
static_assert(CopiesFromNonConst<HdlOptions> && Makes<HdlOptions, void()>);
static_assert(CopiesFromNonConst<Vhdl> && Makes<Vhdl, void()>);
static_assert(CopiesFromNonConst<Verilog> && Makes<Verilog, void()>);
static_assert(Assigns<HdlOptions, HdlOptions &> && Assigns<Vhdl, Vhdl &>);
static_assert(Assigns<Verilog, Verilog &>);
HAVE(void (Verilog::*)(Text), &Verilog::SetSynthesisType);
HAVE(Verilog::CaseType (Verilog::*)(Text) const, &Verilog::GetCaseType);
HAVE(bool (Verilog::*)() const, &Verilog::IsSemiColonWrittenBeforeAttr);
HAVE(bool HdlOptions::*, &HdlOptions::writeHeader, &HdlOptions::portOnePerLine,
     &HdlOptions::macroNetlist);
HAVE(String HdlOptions::*, &HdlOptions::application, &HdlOptions::commandStr, &HdlOptions::device,
     &HdlOptions::purpose, &HdlOptions::reference);
HAVE(bool Vhdl::*, &Vhdl::suppressConfiguration, &Vhdl::flattenBus, &Vhdl::useDefaultLibrary,
     &Vhdl::useAttrType, &Vhdl::openPin, &Vhdl::suppressComponent);
HAVE(StringArray Vhdl::*, &Vhdl::libraries, &Vhdl::useLibraries);
HAVE(Verilog::SynthesisType Verilog::*, &Verilog::synthesisType);
HAVE(Verilog::CaseType Verilog::*, &Verilog::signalCase, &Verilog::instanceCase,
     &Verilog::componentCase);
HAVE(StringArray Verilog::*, &Verilog::includes);
static_assert(Ascend({offsetof(HdlOptions, vhdlOption), offsetof(HdlOptions, verilogOption),
                      offsetof(HdlOptions, writeHeader), offsetof(HdlOptions, application),
                      offsetof(HdlOptions, commandStr), offsetof(HdlOptions, device),
                      offsetof(HdlOptions, purpose), offsetof(HdlOptions, reference),
                      offsetof(HdlOptions, portOnePerLine), offsetof(HdlOptions, macroNetlist)}));
static_assert(Ascend({offsetof(Vhdl, suppressConfiguration), offsetof(Vhdl, flattenBus),
                      offsetof(Vhdl, useDefaultLibrary), offsetof(Vhdl, libraries),
                      offsetof(Vhdl, useLibraries), offsetof(Vhdl, useAttrType),
                      offsetof(Vhdl, openPin), offsetof(Vhdl, suppressComponent)}));
static_assert(Ascend({offsetof(Verilog, synthesisType), offsetof(Verilog, signalCase),
                      offsetof(Verilog, instanceCase), offsetof(Verilog, componentCase),
                      offsetof(Verilog, includes)}));

// The base layer.

using Range = Basis_Range;
static_assert(Makes<String, void(), void(Text), void(In), void(In, Range const &)>);
static_assert(Assigns<String> && Assigns<String, Text> && std::is_convertible_v<In, Text>);
HAVE(String &(String::*)(char), &String::operator+=);
HAVE(String &(String::*)(Text), &String::operator+=);
HAVE(String &(String::*)(In), &String::operator+=, &String::Append);
HAVE(String &(String::*)(Text, unsigned int), &String::Append);
HAVE(void (String::*)(), &String::Empty, &String::MakeUpper, &String::MakeLower);
HAVE(int (String::*)(In, String::CompareType) const, &String::Compare);
HAVE(int (String::*)(Text, String::CompareType) const, &String::Compare);
HAVE(unsigned int (String::*)(char, char) const, &String::GetIndexOfFirstChar,
     &String::GetIndexOfLastChar);
HAVE(unsigned int (String::*)(Text, String::CompareType) const, &String::GetIndexOfString);
HAVE(unsigned int (String::*)(char, char), &String::ReplaceChars);
HAVE(void (String::*)(Text, String::TrimType), &String::Trim);
HAVE(String (String::*)(Range const &) const, &String::Extract);
HAVE(void (String::*)(Range const &), &String::Remove);
HAVE(String &(String::*)(Text, ...), &String::Format);
HAVE(String (*)(Text, ...), &String::doFormat);
HAVE(bool (String::*)(Basis::Stream *), &String::ReadLine);
HAVE(bool (String::*)(Range &, Text, String::ParseType) const, &String::NextTokenRange);
HAVE(Range (String::*)(Basis_Regexp const &) const, &String::GetRangeOfMatch);
HAVE(unsigned int Range::*, &Range::first, &Range::last);
static_assert(Makes<Basis_Regexp, void(Text)> && Makes<Basis::FileInit, void()>);
HAVE(Basis::Stream &(Basis::Stream::*)(Text), &Basis::Stream::operator<<);
HAVE(Basis::Stream &(Basis::Stream::*)(), &Basis::Stream::flush);
HAVE(Basis::Stream *(*)(Text, Basis::Stream::Access, bool), &Basis::File::open);
HAVE(bool (*)(Basis::Stream *), &Basis::File::close);
static_assert(Makes<Basis::FileName, void(Text)>);
HAVE(String (Basis::FileName::*)() const, &Basis::FileName::GetTail);
HAVE(String (*)(Text), &Basis::Version::getValue);
HAVE(char *(*)(Text, ...), &orvform);
using Error = Basis::Exception;
static_assert(Makes<Error, void(Text, Text, Text, int), void(Error const &)>);
HAVE(Error &(Error::*)(Text, ...), &Error::setDescription);
HAVE(wchar_t const *(Error::*)() const, &Error::getLocalized);
HAVE(void (Error::*)() const, &Error::report);
HAVE(bool (*)(Text, Text), &Basis::strimatch, &Basis::strmatch);
HAVE(int (*)(Text, Text), &Basis::stricmp);
HAVE(int (*)(Text, Text, std::uint64_t), &Basis::strnicmp);
HAVE(bool (*)(Text, long &), &Basis::strtol);
using Stamp = TP_TIMESTAMP;
HAVE(String (Stamp::*)() const, &Stamp::getTimeStampMonthNumber, &Stamp::getTimeStampMonthDay,
     &Stamp::getTimeStampYear, &Stamp::getTimeStampHour, &Stamp::getTimeStampMinute,
     &Stamp::getTimeStampSecond);

// Arrays, maps, output streams.

static_assert(Makes<StringArray, void(), void(Text, Text, bool, Text), void(StringArray const &)>);
static_assert(Assigns<StringArray>);
HAVE(int (StringArray::*)() const, &StringArray::GetSize);
HAVE(bool (StringArray::*)() const, &StringArray::IsEmpty);
HAVE(String (StringArray::*)(int) const, &StringArray::operator[], &StringArray::GetAt);
HAVE(int (StringArray::*)(In), &StringArray::Add);
HAVE(void (StringArray::*)(StringArray const &), &StringArray::Add);
HAVE(void (StringArray::*)(int, In), &StringArray::SetAt);
HAVE(void (StringArray::*)(), &StringArray::Empty, &StringArray::Sort);
HAVE(int (StringArray::*)(Text, Text, bool, Text), &StringArray::Parse);
HAVE(bool (StringArray::*)(In) const, &StringArray::Contains, &StringArray::IContains);
HAVE(bool (StringArray::*)(StringArray const &) const, &StringArray::Contains,
     &StringArray::IContains);
HAVE(String (StringArray::*)(In) const, &StringArray::Concatenate);
HAVE(bool (StringArray::*)(int, int &, int) const, &StringArray::GetIntAt);
HAVE(void (StringArray::*)(bool (*)(In, In, void *), void *), &StringArray::Sort);

static_assert(!std::is_copy_constructible_v<PtrArrayBase>);
HAVE(int (PtrArrayBase::*)() const, &PtrArrayBase::GetSize);
HAVE(bool (PtrArrayBase::*)() const, &PtrArrayBase::IsEmpty);
HAVE(void (PtrArrayBase::*)(), &PtrArrayBase::Empty);
HAVE(void (PtrArrayBase::*)(bool (*)(void *, void *, void *), void *), &PtrArrayBase::Sort);
/// The operations are the same for every element.
template <class T> constexpr bool ArraysOf() {
    using A = PtrArray<T>;
    using I = Iterator<T>;
    static_assert(std::is_base_of_v<PtrArrayBase, A> && std::is_base_of_v<A, OwnPtrArray<T>>);
    HAVE(int(A::*)(T), &A::Add);
    HAVE(T(A::*)(int) const, &A::GetAt);
    HAVE(T(A::*)() const, &A::GetTail);
    HAVE(void(A::*)(), &A::RemoveTail);
    HAVE(int(A::*)(T) const, &A::GetIndex);
    HAVE(bool(A::*)(T) const, &A::Contains);
    HAVE(bool(A::*)(T), &A::Remove);
    HAVE(void(A::*)(int, T), &A::SetAt);
    HAVE(void(A::*)(int, int), &A::Swap);
    static_assert(Makes<I, void(A *), void(I const &)>);
    HAVE(void(I::*)(), &I::Rewind, &I::Advance);
    HAVE(bool(I::*)() const, &I::HasMore);
    HAVE(T(I::*)() const, &I::Current);
    return true;
}
static_assert(ArraysOf<Model *>() && ArraysOf<Signal *>() && ArraysOf<Attribute *>());
static_assert(ArraysOf<Pin *>() && ArraysOf<Component *>() && ArraysOf<Instance *>());

using Map = IStringPtrMap<Signal *>;
static_assert(CopiesFromNonConst<Map> && std::is_base_of_v<IStringPtrMapBase, Map>);
HAVE(void (Map::*)(Text, Signal *), &Map::Add);
HAVE(Signal *(Map::*)(Text) const, &Map::Get);
HAVE(bool (IStringPtrMapBase::*)(Text) const, &Map::Contains);
HAVE(void (IStringPtrMapBase::*)(Text), &Map::Remove);
HAVE(bool (IStringPtrMapBase::*)() const, &Map::IsEmpty);
HAVE(void (IStringPtrMapBase::*)(), &Map::Empty);

using SetIterator = StringSetIterator;
static_assert(CopiesFromNonConst<StringSet> && Makes<StringSet, void()>);
static_assert(Assigns<StringSet, StringSet &> && Assigns<Map, Map &>);
HAVE(void (StringSet::*)(Text), &StringSet::Add, &StringSet::Remove);
HAVE(bool (StringSet::*)(Text) const, &StringSet::IContains, &StringSet::Contains);
HAVE(bool (StringSet::*)() const, &StringSet::IsEmpty);
HAVE(void (StringSet::*)(), &StringSet::Empty);
HAVE(SetIterator (StringSet::*)(), &StringSet::GetBeginPos, &StringSet::GetEndPos);
static_assert(Makes<SetIterator, void(), void(void *), void(SetIterator const &)>);
static_assert(Gives<void, decltype(std::declval<SetIterator &>()++)>);
static_assert(Gives<String, decltype(*std::declval<SetIterator const &>())>);
static_assert(Assigns<SetIterator> && Equates<SetIterator>);

static_assert(std::is_abstract_v<StreamDst> && std::is_copy_assignable_v<StreamDst>);
HAVE(void (StreamDst::*)(), &StreamDst::Flush, &StreamDst::WriteNewLine, &StreamDst::Indent,
     &StreamDst::Unindent);
HAVE(void (StreamDst::*)(Text), &StreamDst::Write);
HAVE(void (StreamDst::*)(int), &StreamDst::Write);
static_assert(Makes<OutStream, void(StreamDst *)>);
static_assert(Streams<OutStream::Operand> && Streams<int> && Streams<Text> && Streams<In>);
HAVE(void (OutStream::*)(), &OutStream::Indent, &OutStream::Unindent);
using File = TextFileOutStream;
static_assert(Makes<File, void(Text, bool)> && std::is_base_of_v<OutStream, File>);
HAVE(bool (File::*)(Text, bool), &File::Open);
HAVE(void (File::*)(), &File::Close);
HAVE(bool (File::*)() const, &File::IsOpen);
HAVE(String (File::*)() const, &File::GetFileName);
using Memory = TextMemOutStream;
static_assert(Makes<Memory, void(Text)> && std::is_base_of_v<OutStream, Memory>);
HAVE(String (Memory::*)() const, &Memory::GetValue);
HAVE(void (Memory::*)(Text), &Memory::SetValue);

// Names, values, attributes.

static_assert(std::is_abstract_v<Object> && Assigns<Object> && Equates<Object>);
HAVE(Object::ObjectType (Object::*)() const, &Object::GetObjectType);
HAVE(void (Object::*)(ObjectVisitor &), &Object::AcceptObject);
HAVE(void (Object::*)(Text), &Object::SetName, &Object::AddComment);
HAVE(String (Object::*)() const, &Object::GetName, &Object::GetComment);
HAVE(bool (Object::*)(Text) const, &Object::IsNamed);
HAVE(void (*)(String &), &Object::NormalizeName);
HAVE(String (*)(Text), &Object::GetBaseName);
HAVE(bool (*)(Text), &Object::IsValidBaseName);
HAVE(bool (*)(In), &Object::IsValidIntegerString);

static_assert(Makes<Polarity, void(), void(Polarity::Value), void(Text), void(Polarity const &)>);
HAVE(void (Polarity::*)(Text), &Polarity::SetValue);
HAVE(void (Polarity::*)(Polarity::Value), &Polarity::SetValue);
HAVE(Polarity::Value (Polarity::*)() const, &Polarity::GetValue);
HAVE(Polarity::Value (*)(Text), &Polarity::GetValue);
HAVE(bool (*)(Polarity::Value), &Polarity::IsValidValue);
HAVE(String (Polarity::*)() const, &Polarity::GetValueName);
static_assert(Gives<bool, decltype(Polarity() < std::declval<Polarity const &>())>);
static_assert(Assigns<Polarity> && Equates<Polarity>);

using Bits = BitVectorValue;
static_assert(Makes<Bits, void(), void(Text), void(Bits const &)> && Assigns<Bits>);
HAVE(void (Bits::*)(Text), &Bits::SetValue);
HAVE(String (Bits::*)() const, &Bits::GetValue);
HAVE(int (Bits::*)() const, &Bits::GetBase, &Bits::GetLength);
HAVE(bool (Bits::*)() const, &Bits::HasBaseAndLength);

static_assert(std::is_abstract_v<Attribute> && std::is_base_of_v<Object, Attribute>);
static_assert(Assigns<Attribute> && Equates<Attribute>);
HAVE(void (Attribute::*)(AttributeVisitor &), &Attribute::AcceptAttribute);
HAVE(Attribute *(Attribute::*)() const, &Attribute::CloneAttribute);
HAVE(void (Attribute::*)(Text), &Attribute::SetValue);
HAVE(Attribute::ValueType (Attribute::*)() const, &Attribute::GetValueType);
HAVE(String (Attribute::*)() const, &Attribute::GetValueString, &Attribute::GetValueTypeName,
     &Attribute::GetGeneric, &Attribute::GetSynAttr);
HAVE(bool (Attribute::*)(Text), &Attribute::SetGeneric, &Attribute::SetSynAttr);
HAVE(unsigned int const *, &Attribute::DEFAULT_GENERIC, &Attribute::DEFAULT_SYNATTR);
HAVE(Text const *, &Attribute::DEFAULT_ATTRTYPE);

template <class A, class Value, void (AttributeVisitor::*)(A *)>
constexpr bool IsAttributeClass = Makes<A, void(Text, Text), void(A const &)>
    &&std::is_base_of_v<Attribute, A> &&Assigns<A> &&Have<Value (A::*)() const, &A::GetValue>
        &&Have<Attribute *(*)(Text, Text), &A::CreateAttribute>;
using AttrVisitor = AttributeVisitor;
static_assert(IsAttributeClass<AttributeString, String, &AttrVisitor::VisitAttributeString>);
static_assert(IsAttributeClass<AttributeInteger, int, &AttrVisitor::VisitAttributeInteger>);
static_assert(IsAttributeClass<AttributeFloat, double, &AttrVisitor::VisitAttributeFloat>);
static_assert(IsAttributeClass<AttributeBoolean, bool, &AttrVisitor::VisitAttributeBoolean>);
static_assert(IsAttributeClass<AttributeBit, String, &AttrVisitor::VisitAttributeBit>);
static_assert(IsAttributeClass<AttributeBitVector, String, &AttrVisitor::VisitAttributeBitVector>);
static_assert(IsAttributeClass<AttributeUser, String, &AttrVisitor::VisitAttributeUser>);
HAVE(Bits (AttributeBitVector::*)() const, &AttributeBitVector::GetBitVectorValue);
HAVE(void (AttributeUser::*)(Text), &AttributeUser::SetUserType);
HAVE(String (AttributeUser::*)() const, &AttributeUser::GetUserType);

using Holder = AttributeHolder;
static_assert(Makes<Holder, void(), void(Holder const &)> && Assigns<Holder>);
HAVE(void (Holder::*)(Attribute *), &Holder::AddAttr);
HAVE(Attribute *(Holder::*)(Text) const, &Holder::GetAttr);
HAVE(Iterator<Attribute *> (Holder::*)() const, &Holder::GetAttrIterator);
HAVE(AttributeFactory &(*)(), &AttributeFactory::GetInstance);
HAVE(Attribute *(AttributeFactory::*)(Text, Text, Text) const, &AttributeFactory::CreateAttribute);

// Signals.

template <class Class>
constexpr bool IsHolder = std::is_base_of_v<Object, Class> &&std::is_base_of_v<Holder, Class>;
static_assert(std::is_abstract_v<Signal> && IsHolder<Signal>);
HAVE(void (Signal::*)(Pin *), &Signal::Connect, &Signal::Disconnect);
HAVE(void (Signal::*)(Signal *), &Signal::Connect, &Signal::Disconnect, &Signal::CloneConnection);
HAVE(void (Signal::*)(), &Signal::DisconnectAll);
HAVE(void (Signal::*)(Text), &Signal::AssignConstantValue);
HAVE(void (Signal::*)(Bits const &), &Signal::AssignConstantValue);
HAVE(Bits (Signal::*)() const, &Signal::GetConstantValue);
HAVE(bool (Signal::*)() const, &Signal::HasMultiDriver, &Signal::IsPort,
     &Signal::IsNeededToDeclared);
HAVE(Iterator<Pin *> (Signal::*)() const, &Signal::GetPinIterator);
HAVE(Iterator<Signal *> (Signal::*)() const, &Signal::GetSignalIterator);
HAVE(void (Signal::*)(StringSet &) const, &Signal::GetBaseName);
HAVE(Signal::SignalType (Signal::*)() const, &Signal::GetSignalType);
HAVE(void (Signal::*)(Polarity const &), &Signal::SetPortPolarity);
HAVE(void (Signal::*)(SignalVisitor &), &Signal::AcceptSignal);
HAVE(Polarity (Signal::*)() const, &Signal::GetPortPolarity);
HAVE(int (Signal::*)() const, &Signal::GetWidth);
HAVE(String (Signal::*)() const, &Signal::GetDummySignalName);

template <class S, void (SignalVisitor::*)(S *), class... Arguments>
constexpr bool IsSignalClass = std::is_base_of_v<Signal, S> &&Makes<S, void(Text, Arguments...)>
    &&Have<S *(S::*)(Arguments...) const, &S::CreateDummySignal>;
static_assert(IsSignalClass<ScalarSignal, &SignalVisitor::VisitScalarSignal>);
static_assert(IsSignalClass<Bus, &SignalVisitor::VisitBus>);
static_assert(IsSignalClass<BusSlice, &SignalVisitor::VisitBusSlice, Bus *>);
static_assert(IsSignalClass<BusIndex, &SignalVisitor::VisitBusIndex, Bus *>);
static_assert(IsSignalClass<CompoundBus, &SignalVisitor::VisitCompoundBus>);
HAVE(void (Bus::*)(Signal *), &Bus::AddBusSlice, &Bus::RemoveBusSlice);
HAVE(void (Bus::*)(), &Bus::EmptyBusSlice);
HAVE(Iterator<Signal *> (Bus::*)() const, &Bus::GetBusSliceIterator);
HAVE(void (Bus::*)(int, int) const, &Bus::GetIndex);
HAVE(void (Bus::*)(String &, String &) const, &Bus::GetIndex);
HAVE(void (BusSlice::*)(String &, String &) const, &BusSlice::GetIndex);
HAVE(String (BusIndex::*)() const, &BusIndex::GetIndex, &BusIndex::GetBaseName);
HAVE(String (Bus::*)() const, &Bus::GetBaseName);
HAVE(String (BusSlice::*)() const, &BusSlice::GetBaseName);
HAVE(bool (Bus::*)() const, &Bus::IsDownTo);
HAVE(bool (BusSlice::*)() const, &BusSlice::IsDownTo, &BusSlice::IsSameDirectionAsParent);
HAVE(bool (*)(In), &Bus::IsBusName, &BusIndex::IsBusIndexName, &CompoundBus::IsCompoundBusName);
HAVE(bool (*)(In, String &, String &, String &), &Bus::ParseBusName);
HAVE(bool (*)(In, String &, int &, int &), &Bus::ParseBusName);
HAVE(bool (*)(In, StringArray &), &Bus::ParseBusName);
HAVE(String (*)(In, int, int), &Bus::GetBusSliceName);
HAVE(bool (*)(In, String &, String &), &BusIndex::ParseBusIndexName);
HAVE(bool (*)(In, String &, int &), &BusIndex::ParseBusIndexName);
static_assert(Makes<CompoundBus, void(Text, PtrArray<Signal *> const &)>);
HAVE(void (CompoundBus::*)(Signal *), &CompoundBus::AddBusMember);
HAVE(void (CompoundBus::*)(int, Signal *), &CompoundBus::SetAt);
HAVE(Signal *(CompoundBus::*)(int) const, &CompoundBus::GetAt);
HAVE(int (CompoundBus::*)() const, &CompoundBus::GetSize);
HAVE(Iterator<Signal *> (CompoundBus::*)() const, &CompoundBus::GetBusMemberIterator);
HAVE(void (*)(In, StringArray &, bool), &CompoundBus::ParseCompoundBusName);

// Pins, components, instances, the netlist.

static_assert(std::is_abstract_v<Pin> && IsHolder<Pin> && Assigns<Pin>);
HAVE(void (Pin::*)(Signal *), &Pin::Connect);
HAVE(void (Pin::*)(), &Pin::Disconnect);
HAVE(Signal *(Pin::*)() const, &Pin::GetSignal);
HAVE(void (Pin::*)(Polarity const &), &Pin::SetPolarity);
HAVE(Polarity (Pin::*)() const, &Pin::GetPolarity);
HAVE(String (Pin::*)() const, &Pin::GetPolarityName, &Pin::GetBaseName);
HAVE(void (Pin::*)(Bits const &), &Pin::SetDefaultValue);
HAVE(void (Pin::*)(Text), &Pin::SetDefaultValue);
HAVE(Bits (Pin::*)() const, &Pin::GetDefaultValue);
HAVE(Pin::PinType (Pin::*)() const, &Pin::GetPinType);
HAVE(Pin *(Pin::*)() const, &Pin::ClonePin);
HAVE(void (Pin::*)(PinVisitor &), &Pin::AcceptPin);
template <class P, void (PinVisitor::*)(P *)>
constexpr bool IsPinClass = std::is_base_of_v<Pin, P> &&Assigns<P>
    &&Makes<P, void(Text, Polarity const &), void(P const &)>;
static_assert(IsPinClass<ScalarPin, &PinVisitor::VisitScalarPin>);
static_assert(IsPinClass<BusPin, &PinVisitor::VisitBusPin>);
static_assert(IsPinClass<BusIndexPin, &PinVisitor::VisitBusIndexPin>);
HAVE(void (BusPin::*)(String &, String &) const, &BusPin::GetIndex);
HAVE(bool (BusPin::*)() const, &BusPin::IsDownTo);
HAVE(int (BusPin::*)() const, &BusPin::GetWidth);
HAVE(String (BusIndexPin::*)() const, &BusIndexPin::GetIndex);

static_assert(IsHolder<Component> && Makes<Component, void(Text)>);
HAVE(void (Component::*)(Text, Polarity const &, Bits const &), &Component::AddPin);
HAVE(void (Component::*)(Text, Polarity const &, Text), &Component::AddPin);
HAVE(void (Component::*)(Pin const &), &Component::AddPin);
HAVE(Pin *(Component::*)(Text) const, &Component::GetPin);
HAVE(Iterator<Pin *> (Component::*)() const, &Component::GetPinIterator);
static_assert(IsHolder<Instance> && Makes<Instance, void(Text, Component *)>);
HAVE(Component *(Instance::*)() const, &Instance::GetComponent);
HAVE(String (Instance::*)() const, &Instance::GetComponentName);
HAVE(Attribute *(Instance::*)(Text) const, &Instance::GetComponentAttr);
HAVE(Pin *(Instance::*)(Text) const, &Instance::GetPin);
HAVE(Iterator<Pin *> (Instance::*)() const, &Instance::GetPinIterator);
HAVE(void (Instance::*)(), &Instance::SortPinName);
HAVE(void (Instance::*)(PtrArray<Pin *> &) const, &Instance::GetOutPortConnectedToInPin,
     &Instance::GetInPortConnectedToOutPin);
HAVE(bool (Instance::*)(PtrArray<Pin *> &, bool) const, &Instance::GetOpenPin);

static_assert(IsHolder<Netlist> && Makes<Netlist, void(Text)>);
static_assert(std::is_same_v<char const[], decltype(Netlist::DEFAULT_NETLIST_NAME)>);
HAVE(void (Netlist::*)(Text), &Netlist::SetName, &Netlist::SetSourceFileName);
HAVE(String (Netlist::*)() const, &Netlist::GetSourceFileName);
HAVE(void (Netlist::*)(Signal *), &Netlist::Add, &Netlist::Remove);
HAVE(void (Netlist::*)(Instance *), &Netlist::Add, &Netlist::Remove);
HAVE(void (Netlist::*)(Component *), &Netlist::Add, &Netlist::Remove);
HAVE(Signal *(Netlist::*)(Text) const, &Netlist::GetSignal);
HAVE(Instance *(Netlist::*)(Text) const, &Netlist::GetInstance);
HAVE(Component *(Netlist::*)(Text) const, &Netlist::GetComponent);
HAVE(Bus *(Netlist::*)(Text) const, &Netlist::GetParentBus);
HAVE(Iterator<Signal *> (Netlist::*)() const, &Netlist::GetSignalIterator);
HAVE(Iterator<Instance *> (Netlist::*)() const, &Netlist::GetInstanceIterator);
HAVE(Iterator<Component *> (Netlist::*)() const, &Netlist::GetComponentIterator);
HAVE(void (Netlist::*)(Component const *, PtrArray<Instance *> &) const, &Netlist::GetInstances);
HAVE(void (Netlist::*)(Text, PtrArray<Instance *> &) const, &Netlist::GetInstances);
HAVE(void (Netlist::*)(), &Netlist::SortNetlist, &Netlist::CreateVhdlDummySignals,
     &Netlist::CreateVerilogDummySignals, &Netlist::ConnectOpenPinToDummy,
     &Netlist::SetBoxTypeAttribute);
HAVE(int (*)(Iterator<Pin *> &), &Netlist::GetLongestPinName);
HAVE(int (*)(Iterator<Signal *> &), &Netlist::GetLongestPortName, &Netlist::GetLongestSignalName);
HAVE(void (*)(Holder const *, int &), &Netlist::GetLongestAttrName);
HAVE(int (*)(Netlist const *), &Netlist::GetLongestAttrName);

// The writers.

static_assert(Makes<NetlistHeader, void(In, In, In, In, In, In, In, bool, OutStream &)>);
HAVE(void (NetlistHeader::*)(), &NetlistHeader::Write);
HAVE(String (*)(), &HdlUtilities::CurrentTimeString, &HdlUtilities::GetVersion);
HAVE(String (*)(int), &HdlUtilities::ConvertVhdlBase, &HdlUtilities::ConvertVerilogBase);
HAVE(String (*)(Text), &HdlUtilities::AddDummySuffix, &HdlUtilities::RemoveQuotes);
HAVE(StringArray (*)(Instance const *), &HdlUtilities::GetAttrNames);
HAVE(void (*)(In, bool, HdlOptions const &, OutStream &), &HdlUtilities::WriteHeader);

static_assert(Makes<VhdlNetlister, void(OutStream &)> && CopiesFromNonConst<VhdlNetlister>);
HAVE(void (VhdlNetlister::*)(Netlist *, HdlOptions const *), &VhdlNetlister::WriteNetlist);
static_assert(Makes<VerilogNetlister, void(OutStream &)>);
HAVE(void (VerilogNetlister::*)(Netlist *, HdlOptions const &), &VerilogNetlister::WriteNetlist);

using V = VhdlStatements;
static_assert(Makes<V, void(OutStream &)>);
HAVE(void (V::*)(), &V::WriteStdLogic, &V::WriteIEEELibrary);
HAVE(void (V::*)(int, int), &V::WriteBusIndex, &V::WriteStdLogicVector);
HAVE(void (V::*)(In), &V::WriteBus);
HAVE(void (V::*)(bool), &V::WriteKorbalLibrary);
HAVE(void (V::*)(StringArray const &), &V::WriteUserLibrary, &V::WriteUseUserLibrary);
HAVE(void (V::*)(Attribute const *), &V::WriteGenericMapAttrType, &V::WriteGenericMapAttr,
     &V::WriteGenericMapInitAttr);
HAVE(void (V::*)(Text), &V::WriteTimeStamp);
HAVE(void (V::*)(Object const *), &V::WriteComment);
HAVE(void (V::*)(In, bool, Bits const &), &V::WriteConstantSignalAssignment);
HAVE(void (V::*)(In, In), &V::WriteSignalAssignment);
HAVE(void (V::*)(In, int), &V::WriteSignalStatement, &V::WriteSignalVectorStatement);
HAVE(void (V::*)(In, Polarity const &, int), &V::WritePortStatement);
HAVE(void (V::*)(Attribute const *, bool, int), &V::WriteAttrDeclaration);
HAVE(void (V::*)(Attribute const *, Text, Text, bool), &V::WriteAttrAssignment);
HAVE(void (V::*)(Holder const *, StringSet &, bool, int), &V::WriteAttrDeclaration);
HAVE(void (V::*)(Holder const *, Text, Text, bool), &V::WriteAttrAssignment);

using W = VerilogStatements;
using Attrs = Iterator<Attribute *> const &;
static_assert(Makes<W, void(OutStream &)>);
HAVE(void (W::*)(Text, Text), &W::WriteTimeScale);
HAVE(void (W::*)(Text), &W::WriteTimeStamp, &W::WriteSignalName);
HAVE(void (W::*)(StringArray const &), &W::WriteIncludePath);
HAVE(void (W::*)(Object const *), &W::WriteComment);
HAVE(void (W::*)(In, Polarity const &), &W::WritePortDeclaration);
HAVE(void (W::*)(In), &W::WriteSignalDeclaration);
HAVE(void (W::*)(String &) const, &W::NormalizeBusName);
HAVE(void (W::*)(In, bool, Bits const &), &W::WriteConstantSignalAssignment);
HAVE(void (W::*)(In, In), &W::WriteSignalAssignment);
HAVE(void (W::*)(Attribute const *, Text), &W::WriteDefParamStatement,
     &W::WriteDefParamInitStatement);
HAVE(void (W::*)(Attribute const *), &W::WriteParameterStatement);
HAVE(void (W::*)(Attrs, Text), &W::WriteQRTAttr, &W::WriteExemplarAttr, &W::WritePrecisionAttr);
HAVE(void (W::*)(Attrs), &W::WriteSynplicityAttr, &W::WriteSynopsysAttr);

} // namespace
