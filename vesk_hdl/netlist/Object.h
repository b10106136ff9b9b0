#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/netlist/Values.h"

namespace Vesk_Hdl {

/// A named thing of a netlist: the base of attributes, signals, pins, components, instances and the
/// netlist itself.
///
/// A name that enters an object is rewritten to the one form that the library works with,
/// NAME(LEFT:RIGHT), whatever brackets the client wrote. Names keep their case; lookups ignore it.
/// Copies share name and comment until one of them changes, so that the pins of a million instances
/// cost no name. A setter that runs out of memory (std::bad_alloc) leaves the object as it was.
class VESK_HDL_API Object {
public:
    /// The kinds of objects. A client class that derives from one of the library's has the kind of
    /// that class.
    enum ObjectType : int {
        OBJECT_ATTRIBUTE = 100, ///< an Attribute
        OBJECT_SIGNAL = 101,    ///< a Signal
        OBJECT_PIN = 102,       ///< a Pin
        OBJECT_COMPONENT = 103, ///< a Component
        OBJECT_INSTANCE = 104,  ///< an Instance
        OBJECT_NETLIST = 105    ///< a Netlist
    };

    /// References to the name are no longer valid. Nothing that points at the object is looked for.
    virtual ~Object();
    /// The kind of this object.
    virtual ObjectType GetObjectType() const = 0;
    /// Calls the one operation of the visitor for the kind of this object.
    virtual void AcceptObject(ObjectVisitor &visitor) = 0;
    /// Stores the rewritten name; null counts as empty. A netlist or holder that has the object
    /// still finds it by its former name, and not by the new one.
    virtual void SetName(char const *name);

    /// Takes over name, comment and kind. What a derived class has besides is up to that class.
    Object &operator=(Object const &other);
    /// Whether name, comment and kind are equal, names and comments byte for byte.
    bool operator==(Object const &other) const;

    /// A copy of the name, in rewritten form.
    Basis::StringBase<char> GetName() const;
    /// The name itself, valid until the object changes in any way or ends.
    Basis::StringBase<char> const &GetNameRef() const;
    /// All lines of the comment, each with "\n" after it; empty without a comment.
    Basis::StringBase<char> GetComment() const;
    /// Whether there is a comment.
    bool HasComment() const;
    /// Adds a line to the comment. Nothing replaces or removes one. Null counts as an empty line.
    void AddComment(char const *text);
    /// Whether the name equals the argument but for case. The argument is not rewritten: "D[3]" is
    /// not the name of an object that is called D(3).
    bool IsNamed(char const *name) const;

    /// Rewrites a name in place: `[`, `{` and `<` become "(", their counterparts ")", and every
    /// hyphen becomes a colon, also one outside brackets.
    static void NormalizeName(Basis::StringBase<char> &name);
    /// The name of the whole bus: "D" for "D(7:0)" and "D[3]". It is the rewritten text before the
    /// first "(" if there are both brackets and no comma, otherwise the whole rewritten text. Null
    /// gives the empty string.
    static Basis::StringBase<char> GetBaseName(char const *name);
    /// Whether the text is a base name: a letter, underscore or apostrophe, then letters, digits
    /// and underscores. Null is none.
    static bool IsValidBaseName(char const *name);
    /// Whether the text is a bound or index: an optional sign and decimal digits, of any length.
    static bool IsValidIntegerString(Basis::StringBase<char> const &text);

protected:
    /// An object without a name and without a kind, which a derived constructor sets.
    Object();
    /// Shares name, comment and kind of `other`.
    Object(Object const &other);

    /// The kind that was set.
    ObjectType GetStoredObjectType() const;
    /// Sets the kind.
    void SetObjectType(ObjectType type);
    /// Stores the name without rewriting it.
    void SetNameText(Basis::StringBase<char> const &name);
    /// SetName of this class without the virtual call, for constructors.
    void SetNormalizedName(char const *name);

    // For classes of the library. A client class has no use for these records.

    struct Record;
    struct CommentRecord;
    struct NetlistRecord;
    struct PinRecord;
    /// From now on each change of the name adds 1 to a counter, which must outlive the object.
    void CountRenames(unsigned long &counter);
    /// Called by the constructor of a pin: stores the rewritten name and the polarity.
    void BeginPin(char const *name, Polarity::Value polarity);
    /// What a pin shares with its copies, for reading.
    PinRecord const &GetPinRecord() const;
    /// The same for writing: it then belongs to this pin alone.
    PinRecord &OwnPinRecord();
    /// Shares name, comment, kind and the data of a pin with an object of the same class.
    void Share(Object const &other);

private:
    static Record *NoRecord();
    template <class Made, class... Model>
    static Record *MakeRecord(std::string_view name, Model &&...model);
    Record &Own();
    void Rename(std::string_view name);
    void Replace(Record *now);
    Basis::StringBase<char> &OwnComment();
    void Join();
    void Release();

    Record *record; ///< shared with copies
};

/// A visitor over the kinds of objects: Object::AcceptObject calls the one operation for the kind
/// of the object and passes the object, which is never null and stays with its owner. Every
/// operation does nothing unless overridden.
class VESK_HDL_API ObjectVisitor {
public:
    /// A visitor of the library holds no data.
    virtual ~ObjectVisitor();
    /// Called by an attribute of any type.
    virtual void VisitAttribute(Attribute *) {}
    /// Called by a signal of any class.
    virtual void VisitSignal(Signal *) {}
    /// Called by a component.
    virtual void VisitComponent(Component *) {}
    /// Called by a pin of any class.
    virtual void VisitPin(Pin *) {}
    /// Called by an instance.
    virtual void VisitInstance(Instance *) {}
    /// Called by a netlist.
    virtual void VisitNetlist(Netlist *) {}
};

} // namespace Vesk_Hdl
