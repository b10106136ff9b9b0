#pragma once

#include <atomic>
#include <memory>

#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/text/IStringPtrMap.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// A named, typed value on a thing of the netlist. Two option words tell the writers what to do
/// with it: the generic option makes it a generic or parameter, the synthesis option an attribute
/// statement.
class VESK_HDL_API Attribute : public Object {
public:
    enum ValueType : int {
        VALUE_STRING = 0,
        VALUE_INTEGER = 1,
        VALUE_FLOAT = 2,
        VALUE_BOOLEAN = 3,
        VALUE_BIT = 4,
        VALUE_BIT_VECTOR = 5,
        VALUE_USER = 6
    };

    static unsigned int const DEFAULT_GENERIC; ///< 0, "NONE"
    static unsigned int const DEFAULT_SYNATTR; ///< 0, "NONE"
    static char const *const DEFAULT_ATTRTYPE; ///< "String"

    Attribute(char const *name);
    Attribute(Attribute const &other);
    ~Attribute() override;
    ObjectType GetObjectType() const override;
    void AcceptObject(ObjectVisitor &visitor) override;
    void SetName(char const *name) override;
    /// Calls the visitor's one operation for the class.
    virtual void AcceptAttribute(AttributeVisitor &visitor);
    /// A copy with class, name, comment, options and value, owned by the caller.
    virtual Attribute *CloneAttribute() const = 0;
    /// Takes the value from a text. None is refused: a text that makes no sense for the type gives
    /// whatever the type makes of it.
    virtual void SetValue(char const *text) = 0;
    virtual Basis::StringBase<char> GetValueString() const = 0;
    virtual ValueType GetValueType() const = 0;

    Attribute &operator=(Attribute const &other);
    /// Equal are name, comment, type and both options, and the value strings but for case.
    bool operator==(Attribute const &other) const;

    /// "String", "Integer", "Float", "Boolean", "Bit", "BitVector" or "User".
    Basis::StringBase<char> GetValueTypeName() const;

    /// The generic option: "NONE" (no generic), "SYN" (a generic for simulation and synthesis) or
    /// "NOSYN" (for simulation only). Setting takes a word in any case; any other word, null too,
    /// gives false and changes nothing.
    Basis::StringBase<char> GetGeneric() const;
    bool SetGeneric(char const *word);

    /// The synthesis option: "NONE" (no statement), "ASSIGN" (declared and assigned) or
    /// "ASSIGNNODEC" (assigned; the declaration comes from elsewhere). Setting as for the generic
    /// option.
    Basis::StringBase<char> GetSynAttr() const;
    bool SetSynAttr(char const *word);

    // The same options without a text, for code that asks often.
    bool IsGenericSyn() const;
    bool IsGenericNoSyn() const;
    bool IsSynAssigned() const; ///< "ASSIGN" or "ASSIGNNODEC"
    bool IsSynDeclared() const; ///< "ASSIGN"

protected:
    Attribute();
    void SetValueType(ValueType type);
    ValueType GetStoredValueType() const;

private:
    unsigned int options; ///< two bits for each of both options
    ValueType valueType;
};

/// What each of the seven value classes declares besides its typed GetValue: construction from name
/// and value text (null reads as empty), copies, and the operations of Attribute.
#define VESK_HDL_ATTRIBUTE_OPERATIONS(Class)                                                       \
public:                                                                                            \
    Class(char const *name, char const *value);                                                    \
    Class(Class const &other);                                                                     \
    ~Class() override;                                                                             \
    Class &operator=(Class const &other);                                                          \
    /** A new attribute, owned by the caller. */                                                   \
    static Attribute *CreateAttribute(char const *name, char const *value);                        \
    void AcceptAttribute(AttributeVisitor &visitor) override;                                      \
    Attribute *CloneAttribute() const override;                                                    \
    void SetValue(char const *text) override;                                                      \
    Basis::StringBase<char> GetValueString() const override;                                       \
    ValueType GetValueType() const override;                                                       \
                                                                                                   \
private:                                                                                           \
    struct Record;                                                                                 \
    std::unique_ptr<Record> record

/// A text, as it stands.
class VESK_HDL_API AttributeString : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeString);

public:
    Basis::StringBase<char> GetValue() const;
};

/// A 32-bit integer; a text is read as `atoi` does.
class VESK_HDL_API AttributeInteger : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeInteger);

public:
    int GetValue() const;
};

/// A number that is written as it was typed: with as many decimals, at least one, and at least as
/// wide. A text is read as `atof` does. A copy takes the number alone: it is written with one
/// decimal and at least three characters.
class VESK_HDL_API AttributeFloat : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeFloat);

public:
    double GetValue() const;
};

/// True exactly for the text "true" in any case; written as "TRUE" or "FALSE".
class VESK_HDL_API AttributeBoolean : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeBoolean);

public:
    bool GetValue() const;
};

/// "1" for the text "1", otherwise "0".
class VESK_HDL_API AttributeBit : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeBit);

public:
    Basis::StringBase<char> GetValue() const;
};

/// A constant with base and width; its value string is the digits alone.
class VESK_HDL_API AttributeBitVector : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeBitVector);

public:
    Basis::StringBase<char> GetValue() const;
    /// A copy of the constant, with base and width.
    BitVectorValue GetBitVectorValue() const;
};

/// A text of a type that the client names.
class VESK_HDL_API AttributeUser : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeUser);

public:
    Basis::StringBase<char> GetValue() const;
    /// Null reads as empty.
    void SetUserType(char const *type);
    Basis::StringBase<char> GetUserType() const;
};

#undef VESK_HDL_ATTRIBUTE_OPERATIONS

/// A visitor over the value classes. Every operation does nothing unless overridden.
class VESK_HDL_API AttributeVisitor {
public:
    virtual ~AttributeVisitor();
    virtual void VisitAttribute(Attribute *) {}
    virtual void VisitAttributeString(AttributeString *) {}
    virtual void VisitAttributeInteger(AttributeInteger *) {}
    virtual void VisitAttributeFloat(AttributeFloat *) {}
    virtual void VisitAttributeBit(AttributeBit *) {}
    virtual void VisitAttributeBitVector(AttributeBitVector *) {}
    virtual void VisitAttributeBoolean(AttributeBoolean *) {}
    virtual void VisitAttributeUser(AttributeUser *) {}
};

/// What makes a thing of the netlist carry attributes. It owns them and keeps them in order of
/// addition, which is the order of writing; by name it finds them in any case. A holder without
/// attributes costs no allocation.
class VESK_HDL_API AttributeHolder {
public:
    AttributeHolder();
    /// Copies each attribute.
    AttributeHolder(AttributeHolder const &other);
    virtual ~AttributeHolder();
    /// Takes over the attribute, also if it throws; null is ignored. A second attribute of a name
    /// is kept beside the first, and GetAttr answers with the newer one: whoever wants one of each
    /// asks first.
    virtual void AddAttr(Attribute *attribute);
    /// The attribute, which the holder goes on owning, or null. The name is not rewritten.
    virtual Attribute *GetAttr(char const *name) const;

    /// Deletes the own attributes and copies those of `other`.
    AttributeHolder &operator=(AttributeHolder const &other);
    /// A walk also sees attributes that are added after it was asked for, so that asking makes an
    /// empty list: ask HasAttrs first where many holders are empty.
    Iterator<Attribute *> GetAttrIterator() const;
    bool HasAttrs() const;

private:
    struct Record;
    Record &Own() const;

    mutable std::atomic<Record *> record; ///< null while nothing was added or asked for
};

/// Makes attributes by type word. One object serves the whole process.
class VESK_HDL_API AttributeFactory {
public:
    static AttributeFactory &GetInstance();

    /// A new attribute, owned by the caller. The type word is one of GetValueTypeName in any case,
    /// null means "String"; an unknown or empty word gives null.
    Attribute *CreateAttribute(char const *type, char const *name, char const *value) const;

private:
    using AttributeCreator = Attribute *(*)(char const *, char const *);

    AttributeFactory();
    ~AttributeFactory();
    AttributeFactory(AttributeFactory const &) = delete;
    AttributeFactory &operator=(AttributeFactory const &) = delete;

    std::unique_ptr<IStringPtrMap<AttributeCreator>> creators;
};

} // namespace Vesk_Hdl
