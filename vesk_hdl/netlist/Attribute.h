#pragma once

#include <atomic>
#include <memory>

#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/text/IStringPtrMap.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

/// A named, typed value on a thing of the netlist.
///
/// Two options say how the writers use it. With the generic option it is a generic (IEEE 1076-1993,
/// 1.1.1.1) or parameter (IEEE 1364-1995, 3.10); with the synthesis option it is an attribute
/// statement (IEEE 1076-1993, 4.4 and 5.1) or, in Verilog, a comment in the syntax of the synthesis
/// tool. Without options it is kept and not written.
///
/// A new attribute has both options at "NONE". It belongs to the caller until
/// AttributeHolder::AddAttr.
class VESK_HDL_API Attribute : public Object {
public:
    /// The types of values, one for each derived class.
    enum ValueType : int {
        VALUE_STRING = 0,     ///< AttributeString
        VALUE_INTEGER = 1,    ///< AttributeInteger
        VALUE_FLOAT = 2,      ///< AttributeFloat
        VALUE_BOOLEAN = 3,    ///< AttributeBoolean
        VALUE_BIT = 4,        ///< AttributeBit
        VALUE_BIT_VECTOR = 5, ///< AttributeBitVector
        VALUE_USER = 6        ///< AttributeUser
    };

    static unsigned int const DEFAULT_GENERIC; ///< 0, "NONE"
    static unsigned int const DEFAULT_SYNATTR; ///< 0, "NONE"
    static char const *const DEFAULT_ATTRTYPE; ///< "String"

    /// An attribute with the rewritten name and no options. Null counts as empty.
    Attribute(char const *name);
    /// Copies name, comment, type and options. The value is copied by the derived class.
    Attribute(Attribute const &other);
    /// Called by the holder that owns the attribute.
    ~Attribute() override;
    /// OBJECT_ATTRIBUTE.
    ObjectType GetObjectType() const override;
    /// Calls ObjectVisitor::VisitAttribute.
    void AcceptObject(ObjectVisitor &visitor) override;
    /// As Object::SetName: the holder still finds the attribute by its former name.
    void SetName(char const *name) override;
    /// Calls the one operation of the visitor for the class.
    virtual void AcceptAttribute(AttributeVisitor &visitor);
    /// A new attribute of the same class with the same name, comment, options and value, owned by
    /// the caller. See AttributeFloat for what its copy leaves out.
    virtual Attribute *CloneAttribute() const = 0;
    /// Reads the value from a text. No text is refused: one that makes no sense for the type gives
    /// what the class says. Null counts as empty.
    virtual void SetValue(char const *text) = 0;
    /// The value as a text, in the form that the class says.
    virtual Basis::StringBase<char> GetValueString() const = 0;
    /// The type of the value.
    virtual ValueType GetValueType() const = 0;

    /// Copies name, comment, type and options.
    Attribute &operator=(Attribute const &other);
    /// Whether name, comment, type and both options are equal and the value strings are equal but
    /// for case. The VHDL writer leaves out an attribute of an instance that is equal to its
    /// component's.
    bool operator==(Attribute const &other) const;

    /// "String", "Integer", "Float", "Boolean", "Bit", "BitVector" or "User".
    Basis::StringBase<char> GetValueTypeName() const;

    /// The generic option: "NONE" (no generic), "SYN" (a generic for simulation and synthesis) or
    /// "NOSYN" (for simulation only: it is written between marks that synthesis tools skip).
    Basis::StringBase<char> GetGeneric() const;
    /// Sets the generic option by its word, in any case. False, and no change, for any other word
    /// and null.
    bool SetGeneric(char const *word);

    /// The synthesis option: "NONE" (no statement), "ASSIGN" (declared and assigned) or
    /// "ASSIGNNODEC" (assigned; the declaration comes from elsewhere, such as a package). The
    /// difference between the last two shows in VHDL only.
    Basis::StringBase<char> GetSynAttr() const;
    /// Sets the synthesis option by its word, in any case. False, and no change, for any other word
    /// and null.
    bool SetSynAttr(char const *word);

    // The same options without a text, for code that asks often.

    /// Whether the generic option is "SYN".
    bool IsGenericSyn() const;
    /// Whether the generic option is "NOSYN".
    bool IsGenericNoSyn() const;
    /// Whether the synthesis option is "ASSIGN" or "ASSIGNNODEC".
    bool IsSynAssigned() const;
    /// Whether the synthesis option is "ASSIGN".
    bool IsSynDeclared() const;

protected:
    /// An attribute without a name and with no options.
    Attribute();
    /// Sets the type of the value; called by the constructor of each class.
    void SetValueType(ValueType type);
    /// The type that was set.
    ValueType GetStoredValueType() const;

private:
    unsigned int options; ///< two bits for each of both options
    ValueType valueType;
};

/// What each of the seven value classes declares besides its typed GetValue. How a class reads and
/// shows its value is in the text before the class.
#define VESK_HDL_ATTRIBUTE_OPERATIONS(Class)                                                       \
public:                                                                                            \
    /** An attribute with the rewritten name and the value of a text, see SetValue. */             \
    Class(char const *name, char const *value);                                                    \
    /** An independent copy with name, comment, options and value. */                              \
    Class(Class const &other);                                                                     \
    /** Frees the value. */                                                                        \
    ~Class() override;                                                                             \
    /** Copies name, comment, options and value. A holder still finds it by its former name. */    \
    Class &operator=(Class const &other);                                                          \
    /** A new attribute as the constructor makes it, owned by the caller. */                       \
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

/// A text, taken as it is. Writers put it into double quotes and take quotes around it away.
class VESK_HDL_API AttributeString : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeString);

public:
    /// The text.
    Basis::StringBase<char> GetValue() const;
};

/// A 32-bit integer. A text is read as `atoi` does: "12abc" is 12, "abc" is 0. Shown in decimal
/// digits.
class VESK_HDL_API AttributeInteger : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeInteger);

public:
    /// The number.
    int GetValue() const;
};

/// A number that is shown as it was typed: with as many decimals, at least one, and at least as
/// wide. A text is read as `atof` does, with a decimal point whatever the locale: "2.50" is shown
/// as 2.50, "12" as 12.0 and "2.5e3" as 2500.000. A copy takes the number alone and shows it with
/// one decimal and at least three characters; an assignment keeps the look of its target.
class VESK_HDL_API AttributeFloat : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeFloat);

public:
    /// The number.
    double GetValue() const;
};

/// A truth value: true exactly for the text "true" in any case. Shown as "TRUE" or "FALSE".
class VESK_HDL_API AttributeBoolean : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeBoolean);

public:
    /// The truth value.
    bool GetValue() const;
};

/// One bit: "1" for exactly the text "1", otherwise "0".
class VESK_HDL_API AttributeBit : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeBit);

public:
    /// "0" or "1".
    Basis::StringBase<char> GetValue() const;
};

/// A constant, read as BitVectorValue::SetValue does. Its value string is the digits alone; the
/// writers add base and length.
class VESK_HDL_API AttributeBitVector : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeBitVector);

public:
    /// The digits.
    Basis::StringBase<char> GetValue() const;
    /// A copy of the constant, with base and length.
    BitVectorValue GetBitVectorValue() const;
};

/// A text of a type that the client names. VHDL declares it with that type and writes the text
/// without quotes; Verilog writes it as a string.
class VESK_HDL_API AttributeUser : public Attribute {
    VESK_HDL_ATTRIBUTE_OPERATIONS(AttributeUser);

public:
    /// The text.
    Basis::StringBase<char> GetValue() const;
    /// Sets the name of the type, which is not checked. Null counts as empty.
    void SetUserType(char const *type);
    /// The name of the type, empty until it is set.
    Basis::StringBase<char> GetUserType() const;
};

#undef VESK_HDL_ATTRIBUTE_OPERATIONS

/// A visitor over the classes of attributes: Attribute::AcceptAttribute calls the one operation for
/// the class and passes the attribute, which is never null and stays with its holder. Every
/// operation does nothing unless overridden. The order of the operations is part of the binary
/// interface.
class VESK_HDL_API AttributeVisitor {
public:
    /// A visitor of the library holds no data.
    virtual ~AttributeVisitor();
    /// Called by an attribute of a client class that does not override AcceptAttribute.
    virtual void VisitAttribute(Attribute *) {}
    /// Called by a text.
    virtual void VisitAttributeString(AttributeString *) {}
    /// Called by an integer.
    virtual void VisitAttributeInteger(AttributeInteger *) {}
    /// Called by a number with decimals.
    virtual void VisitAttributeFloat(AttributeFloat *) {}
    /// Called by a bit.
    virtual void VisitAttributeBit(AttributeBit *) {}
    /// Called by a constant.
    virtual void VisitAttributeBitVector(AttributeBitVector *) {}
    /// Called by a truth value.
    virtual void VisitAttributeBoolean(AttributeBoolean *) {}
    /// Called by a text of a user's type.
    virtual void VisitAttributeUser(AttributeUser *) {}
};

/// The attributes of a thing of the netlist, as a base of its class. The holder owns them and keeps
/// them in order of addition, which is the order of writing. Lookups ignore case. A holder without
/// attributes costs no allocation.
///
/// Several threads may call const operations at the same time as long as none changes the holder.
class VESK_HDL_API AttributeHolder {
public:
    /// A holder without attributes.
    AttributeHolder();
    /// A holder with a clone of each attribute of `other`.
    AttributeHolder(AttributeHolder const &other);
    /// Deletes the attributes, the last one first.
    virtual ~AttributeHolder();
    /// Takes over an attribute that was made with `new`; null is ignored. The name is not looked
    /// for: a second attribute of a name is written beside the first, and GetAttr returns the newer
    /// one, so that a caller who wants one of each asks GetAttr first. If memory runs out
    /// (std::bad_alloc), the holder has the attribute or has deleted it; the caller owns it in
    /// neither case.
    virtual void AddAttr(Attribute *attribute);
    /// The newest attribute that was added under that name, in any case; null if there is none. The
    /// name is not rewritten: an attribute typed "A-B" is found as "A:B". Null counts as empty. The
    /// holder stays the owner; the attribute is valid until the holder is assigned to or ends.
    virtual Attribute *GetAttr(char const *name) const;

    /// Deletes the attributes of this holder, the last one first, and adds a clone of each
    /// attribute of `other` through AddAttr. Assigning a holder to itself changes nothing. If
    /// memory runs out (std::bad_alloc), it has those that were cloned until then.
    AttributeHolder &operator=(AttributeHolder const &other);
    /// A walk in order of addition, valid as long as the holder. It sees attributes that are added
    /// later: for that an empty holder makes an empty list, so that a walk over many holders should
    /// ask HasAttrs first.
    Iterator<Attribute *> GetAttrIterator() const;
    /// Whether there are attributes.
    bool HasAttrs() const;

private:
    struct Record;
    Record &Own() const;

    mutable std::atomic<Record *> record; ///< null while nothing was added or asked for
};

/// Makes attributes by the word for their type. One object serves the whole process, from several
/// threads as well.
class VESK_HDL_API AttributeFactory {
public:
    /// The one object. It is made at the first call and valid to the end of the process.
    static AttributeFactory &GetInstance();

    /// A new attribute, owned by the caller. The type is one of the words of
    /// Attribute::GetValueTypeName in any case; null means "String". An unknown or empty word gives
    /// null.
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
