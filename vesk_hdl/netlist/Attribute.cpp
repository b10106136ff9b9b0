// Attributes, their holder and their factory. What differs between the seven classes is how they
// read and show their value; all else is written once.

#include "vesk_hdl/netlist/Attribute.h"

#include <cassert>
#include <clocale>
#include <cstdlib>
#include <locale.h>
#include <new>
#include <utility>
#include <vector>

#include "vesk_hdl/netlist/Vocabulary.h"
#include "vesk_hdl/netlist/storage/LazyRecord.h"
#include "vesk_hdl/text/LentPtrArray.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/basis/OrEmpty.h"

namespace Vesk_Hdl {

using Basis::OrEmpty;
using Basis::StringBase;

namespace {

/// One of the two options: the words, whose index is the value of its two bits in the options.
struct Option {
    unsigned int shift;
    Vocabulary::Words words;
};
constexpr Option GENERIC = {0, Vocabulary::GENERIC_WORDS};
constexpr Option SYNTHESIS = {2, Vocabulary::SYNTHESIS_WORDS};

unsigned int GetOption(unsigned int options, Option const &option) {
    return (options >> option.shift) & 3U;
}

/// Sets the two bits of an option; false, and no change, for a word that it does not have.
bool SetOption(unsigned int &options, Option const &option, char const *word) {
    int const value = Vocabulary::IndexOf(option.words, word);
    if (value < 0)
        return false;
    options =
        (options & ~(3U << option.shift)) | (static_cast<unsigned int>(value) << option.shift);
    return true;
}

/// The locale "C" for the calling thread as long as the object exists. `atof` and printf follow the
/// locale of the client: under a German one they would read "2.5" as 2 and write a comma, which
/// neither language allows.
class CLocaleScope {
public:
    CLocaleScope() : before(uselocale(CLocale())) {}
    ~CLocaleScope() { uselocale(before); }
    CLocaleScope(CLocaleScope const &) = delete;
    CLocaleScope &operator=(CLocaleScope const &) = delete;

private:
    static locale_t CLocale() {
        static locale_t const locale = newlocale(LC_ALL_MASK, "C", nullptr);
        return locale;
    }
    locale_t before;
};

} // namespace

unsigned int const Attribute::DEFAULT_GENERIC = 0;
unsigned int const Attribute::DEFAULT_SYNATTR = 0;
char const *const Attribute::DEFAULT_ATTRTYPE = Vocabulary::ATTRIBUTE_TYPES[VALUE_STRING];

Attribute::Attribute()
    : options(DEFAULT_GENERIC << GENERIC.shift | DEFAULT_SYNATTR << SYNTHESIS.shift),
      valueType(VALUE_STRING) {}

Attribute::Attribute(char const *name) : Attribute() {
    SetNormalizedName(name);
    SetObjectType(OBJECT_ATTRIBUTE);
}

Attribute::Attribute(Attribute const &other) = default;
Attribute::~Attribute() = default;
Attribute &Attribute::operator=(Attribute const &other) = default;

Object::ObjectType Attribute::GetObjectType() const { return GetStoredObjectType(); }
void Attribute::AcceptObject(ObjectVisitor &visitor) { visitor.VisitAttribute(this); }
void Attribute::SetName(char const *name) { Object::SetName(name); }
void Attribute::AcceptAttribute(AttributeVisitor &visitor) { visitor.VisitAttribute(this); }

bool Attribute::operator==(Attribute const &other) const {
    return Object::operator==(other) && valueType == other.valueType && options == other.options &&
           GetValueString().Compare(other.GetValueString(),
                                    StringBase<char>::COMPARE_IGNORING_CASE) == 0;
}

StringBase<char> Attribute::GetValueTypeName() const {
    return Vocabulary::ATTRIBUTE_TYPES[GetValueType()];
}

StringBase<char> Attribute::GetGeneric() const {
    return GENERIC.words[GetOption(options, GENERIC)];
}
bool Attribute::SetGeneric(char const *word) { return SetOption(options, GENERIC, word); }

StringBase<char> Attribute::GetSynAttr() const {
    return SYNTHESIS.words[GetOption(options, SYNTHESIS)];
}
bool Attribute::SetSynAttr(char const *word) { return SetOption(options, SYNTHESIS, word); }

bool Attribute::IsGenericNoSyn() const { return GetOption(options, GENERIC) == 1; }
bool Attribute::IsGenericSyn() const { return GetOption(options, GENERIC) == 2; }
bool Attribute::IsSynAssigned() const { return GetOption(options, SYNTHESIS) != 0; }
bool Attribute::IsSynDeclared() const { return GetOption(options, SYNTHESIS) == 1; }

void Attribute::SetValueType(ValueType type) { valueType = type; }
Attribute::ValueType Attribute::GetStoredValueType() const { return valueType; }

// The records of the seven classes. Each is apart from its class, so that all classes have the same
// size and a record may change without a change of the binary interface.

struct AttributeString::Record {
    StringBase<char> value;
};
struct AttributeInteger::Record {
    int value = 0;
};
struct AttributeFloat::Record {
    Record() = default;
    Record(Record const &other) : value(other.value) {}
    /// Required: width and precision are not assigned. The target keeps its own.
    Record &operator=(Record const &other) {
        value = other.value;
        return *this;
    }

    double value = 0;
    int width = 3;
    int precision = 1;
};
struct AttributeBoolean::Record {
    bool value = false;
};
struct AttributeBit::Record {
    StringBase<char> value;
};
struct AttributeBitVector::Record {
    BitVectorValue value;
};
struct AttributeUser::Record {
    StringBase<char> value;
    StringBase<char> userType;
};

// The operations that are the same in the seven classes. A macro makes them, since a template in
// between would put another class into the hierarchy, which clients derive from and cast to.
#define VESK_HDL_ATTRIBUTE_BODIES(Class, TYPE)                                                     \
    Class::Class(char const *name, char const *value) : Attribute(name), record(new Record) {      \
        SetValueType(TYPE);                                                                        \
        Class::SetValue(value);                                                                    \
    }                                                                                              \
    Class::Class(Class const &other) : Attribute(other), record(new Record(*other.record)) {}      \
    Class::~Class() = default;                                                                     \
    Class &Class::operator=(Class const &other) {                                                  \
        if (this != &other) {                                                                      \
            Attribute::operator=(other);                                                           \
            *record = *other.record;                                                               \
        }                                                                                          \
        return *this;                                                                              \
    }                                                                                              \
    Attribute *Class::CreateAttribute(char const *name, char const *value) {                       \
        return new Class(name, value);                                                             \
    }                                                                                              \
    void Class::AcceptAttribute(AttributeVisitor &visitor) { visitor.Visit##Class(this); }         \
    Attribute *Class::CloneAttribute() const { return new Class(*this); }                          \
    Attribute::ValueType Class::GetValueType() const { return GetStoredValueType(); }

VESK_HDL_ATTRIBUTE_BODIES(AttributeString, VALUE_STRING)
VESK_HDL_ATTRIBUTE_BODIES(AttributeInteger, VALUE_INTEGER)
VESK_HDL_ATTRIBUTE_BODIES(AttributeFloat, VALUE_FLOAT)
VESK_HDL_ATTRIBUTE_BODIES(AttributeBoolean, VALUE_BOOLEAN)
VESK_HDL_ATTRIBUTE_BODIES(AttributeBit, VALUE_BIT)
VESK_HDL_ATTRIBUTE_BODIES(AttributeBitVector, VALUE_BIT_VECTOR)
VESK_HDL_ATTRIBUTE_BODIES(AttributeUser, VALUE_USER)

#undef VESK_HDL_ATTRIBUTE_BODIES

void AttributeString::SetValue(char const *text) { record->value = text; }
StringBase<char> AttributeString::GetValueString() const { return record->value; }
StringBase<char> AttributeString::GetValue() const { return record->value; }

void AttributeInteger::SetValue(char const *text) { record->value = std::atoi(OrEmpty(text)); }
StringBase<char> AttributeInteger::GetValueString() const {
    return StringBase<char>::doFormat("%d", record->value);
}
int AttributeInteger::GetValue() const { return record->value; }

void AttributeFloat::SetValue(char const *text) {
    // The number is shown with as many digits as it was typed with, before and after the point.
    StringArray const parts(text, ".", true, nullptr);
    auto const digits = [&parts](int part) { return static_cast<int>(parts.At(part).GetLength()); };
    record->precision = digits(1) == 0 ? 1 : digits(1);
    record->width = record->precision + (digits(0) == 0 ? 1 : digits(0)) + 1;
    CLocaleScope const scope;
    record->value = std::atof(OrEmpty(text));
}
StringBase<char> AttributeFloat::GetValueString() const {
    CLocaleScope const scope;
    return StringBase<char>::doFormat("%*.*f", record->width, record->precision, record->value);
}
double AttributeFloat::GetValue() const { return record->value; }

void AttributeBoolean::SetValue(char const *text) {
    record->value = Basis::stricmp(text, Vocabulary::BOOLEANS[true]) == 0;
}
StringBase<char> AttributeBoolean::GetValueString() const {
    return record->value ? "TRUE" : "FALSE";
}
bool AttributeBoolean::GetValue() const { return record->value; }

void AttributeBit::SetValue(char const *text) {
    record->value = std::string_view(OrEmpty(text)) == "1" ? "1" : "0";
}
StringBase<char> AttributeBit::GetValueString() const { return record->value; }
StringBase<char> AttributeBit::GetValue() const { return record->value; }

void AttributeBitVector::SetValue(char const *text) { record->value.SetValue(text); }
StringBase<char> AttributeBitVector::GetValueString() const { return record->value.GetValue(); }
StringBase<char> AttributeBitVector::GetValue() const { return record->value.GetValue(); }
BitVectorValue AttributeBitVector::GetBitVectorValue() const { return record->value; }

void AttributeUser::SetValue(char const *text) { record->value = text; }
StringBase<char> AttributeUser::GetValueString() const { return record->value; }
StringBase<char> AttributeUser::GetValue() const { return record->value; }
void AttributeUser::SetUserType(char const *type) { record->userType = type; }
StringBase<char> AttributeUser::GetUserType() const { return record->userType; }

AttributeVisitor::~AttributeVisitor() = default;

/// The attributes, each with the name under which it was added: it is found by that name, also if a
/// client renamed it since.
///
/// Most holders have one attribute: it costs no memory beyond the record.
struct AttributeHolder::Record {
    static constexpr int MAX_SCAN = 8; ///< up to this many are searched; more are found by a map

    ~Record() { DeleteAll(); }

    void Add(std::unique_ptr<Attribute> attribute) {
        StringBase<char> const name = attribute->GetNameRef();
        if (attributes.IsEmpty()) {
            assert(!further && "names are left of attributes that are deleted");
            firstName = name;
        } else {
            assert(GetFurtherNames().size() + 1 == static_cast<std::size_t>(attributes.GetSize()) &&
                   "an attribute is found by the name of another one");
            GetFurtherNames().push_back(name);
        }
        try {
            attributes.Add(attribute.get());
        } catch (...) {
            if (further)
                further->names.pop_back();
            throw;
        }
        Attribute *const added = attribute.release();
        try {
            if (further && further->map)
                further->map->Add(name, added);
            else if (attributes.GetSize() > MAX_SCAN)
                MakeMap();
        } catch (std::bad_alloc const &) { // without memory for the map the names are searched
            further->map.reset();
        }
    }

    /// The newest attribute of a name: the search goes from the last to the first.
    Attribute *Find(char const *name) const {
        if (further && further->map)
            return further->map->Get(name);
        for (int i = attributes.GetSize() - 1; i >= 0; --i)
            if (GetName(i).Compare(name, StringBase<char>::COMPARE_IGNORING_CASE) == 0)
                return attributes.GetAt(i);
        return nullptr;
    }

    void DeleteAll() {
        further.reset();
        for (int i = attributes.GetSize() - 1; i >= 0; --i)
            delete attributes.GetAt(i);
        attributes.Empty();
    }

    InlinePtrArray<Attribute *, 1> attributes; ///< owned

private:
    /// What the second attribute needs.
    struct Further {
        std::vector<StringBase<char>> names; ///< from the second attribute on
        std::unique_ptr<IStringPtrMap<Attribute *>> map;
    };

    StringBase<char> const &GetName(int attribute) const {
        return attribute == 0 ? firstName : further->names[static_cast<std::size_t>(attribute - 1)];
    }

    std::vector<StringBase<char>> &GetFurtherNames() {
        if (!further)
            further = std::make_unique<Further>();
        return further->names;
    }

    void MakeMap() {
        auto made = std::make_unique<IStringPtrMap<Attribute *>>();
        for (int i = 0; i < attributes.GetSize(); ++i)
            made->Add(GetName(i), attributes.GetAt(i));
        further->map = std::move(made);
    }

    StringBase<char> firstName;
    std::unique_ptr<Further> further;
};

AttributeHolder::AttributeHolder() : record(nullptr) {}

AttributeHolder::AttributeHolder(AttributeHolder const &other) : AttributeHolder() {
    AttributeHolder::operator=(other);
}

AttributeHolder::~AttributeHolder() { delete record.load(std::memory_order_relaxed); }

/// Asking a holder for an iterator makes its record.
AttributeHolder::Record &AttributeHolder::Own() const { return OwnLazily(record); }

AttributeHolder &AttributeHolder::operator=(AttributeHolder const &other) {
    if (this == &other)
        return *this;
    if (Record *const own = record.load(std::memory_order_relaxed))
        own->DeleteAll(); // the array itself stays: a client may have an iterator over it
    if (Record const *const others = other.record.load(std::memory_order_acquire))
        ForEach(others->attributes,
                [this](Attribute *attribute) { AddAttr(attribute->CloneAttribute()); });
    return *this;
}

void AttributeHolder::AddAttr(Attribute *attribute) {
    std::unique_ptr<Attribute> held(attribute); // deleted if making the record runs out of memory
    if (attribute)
        Own().Add(std::move(held));
}

Attribute *AttributeHolder::GetAttr(char const *name) const {
    Record const *const own = record.load(std::memory_order_acquire);
    return own ? own->Find(name) : nullptr;
}

Iterator<Attribute *> AttributeHolder::GetAttrIterator() const { return &Own().attributes; }

bool AttributeHolder::HasAttrs() const {
    Record const *const own = record.load(std::memory_order_acquire);
    return own && !own->attributes.IsEmpty();
}

/// The words and the creators are two tables in the order of ValueType.
AttributeFactory::AttributeFactory()
    : creators(std::make_unique<IStringPtrMap<AttributeCreator>>()) {
    static constexpr AttributeCreator CREATORS[] = {
        // by ValueType
        AttributeString::CreateAttribute, AttributeInteger::CreateAttribute,
        AttributeFloat::CreateAttribute,  AttributeBoolean::CreateAttribute,
        AttributeBit::CreateAttribute,    AttributeBitVector::CreateAttribute,
        AttributeUser::CreateAttribute};
    static_assert(std::size(CREATORS) == std::size(Vocabulary::ATTRIBUTE_TYPES));
    for (std::size_t type = 0; type < std::size(CREATORS); ++type)
        creators->Add(Vocabulary::ATTRIBUTE_TYPES[type], CREATORS[type]);
}

AttributeFactory::~AttributeFactory() = default;

AttributeFactory &AttributeFactory::GetInstance() {
    static AttributeFactory factory;
    return factory;
}

Attribute *AttributeFactory::CreateAttribute(char const *type, char const *name,
                                             char const *value) const {
    AttributeCreator const creator = creators->Get(type ? type : Attribute::DEFAULT_ATTRTYPE);
    return creator ? creator(name, value) : nullptr;
}

} // namespace Vesk_Hdl
