#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/netlist/Values.h"

namespace Vesk_Hdl {

/// A named thing of a netlist: the base of attributes, signals, pins, components, instances and the
/// netlist itself.
///
/// A name that enters an object is rewritten to the one form that the library works with,
/// NAME(LEFT:RIGHT), whatever brackets the client wrote. Names keep their case; whoever looks for
/// one ignores it. Copies share name and comment until one of them changes.
class VESK_HDL_API Object {
public:
    enum ObjectType : int {
        OBJECT_ATTRIBUTE = 100,
        OBJECT_SIGNAL = 101,
        OBJECT_PIN = 102,
        OBJECT_COMPONENT = 103,
        OBJECT_INSTANCE = 104,
        OBJECT_NETLIST = 105
    };

    virtual ~Object();
    virtual ObjectType GetObjectType() const = 0;
    /// Calls the visitor's operation for the kind of this object.
    virtual void AcceptObject(ObjectVisitor &visitor) = 0;
    /// Stores the rewritten name; null counts as empty. An object that a netlist holds is still
    /// found by its old name alone.
    virtual void SetName(char const *name);

    Object &operator=(Object const &other);
    /// Name, comment and kind are equal, with case.
    bool operator==(Object const &other) const;

    Basis::StringBase<char> GetName() const;
    /// The name itself, valid until the object changes in any way or dies.
    Basis::StringBase<char> const &GetNameRef() const;
    /// All comment lines, each ended by "\n".
    Basis::StringBase<char> GetComment() const;
    bool HasComment() const;
    /// Adds a line. Nothing replaces or clears a comment. Null counts as empty.
    void AddComment(char const *text);
    /// Whether the name equals the argument but for case. The argument is not rewritten.
    bool IsNamed(char const *name) const;

    /// The rewriting, in place: `[`, `{`, `<` become "(", their counterparts ")", and every hyphen
    /// becomes a colon, also one outside brackets.
    static void NormalizeName(Basis::StringBase<char> &name);
    /// "D" of "D(7:0)" and of "D[3]": the rewritten text before the first "(" if there are both
    /// brackets and no comma, otherwise the whole rewritten text. Null gives the empty string.
    static Basis::StringBase<char> GetBaseName(char const *name);
    /// A letter, underscore or apostrophe, then letters, digits, underscores. Null is invalid.
    static bool IsValidBaseName(char const *name);
    /// An optional sign and digits.
    static bool IsValidIntegerString(Basis::StringBase<char> const &text);

protected:
    Object();
    Object(Object const &other);

    ObjectType GetStoredObjectType() const;
    void SetObjectType(ObjectType type);
    /// Stores the name as it stands.
    void SetNameText(Basis::StringBase<char> const &name);
    /// What SetName of this class does, for constructors.
    void SetNormalizedName(char const *name);

    struct Record;
    struct CommentRecord;
    struct NetlistRecord;
    struct PinRecord;
    /// From now on each change of the name adds 1 to a counter, which outlives the object.
    void CountRenames(unsigned long &counter);
    /// For a pin: begins with that polarity, in place of what the constructor made.
    void BeginPin(char const *name, Polarity::Value polarity);
    /// The data that a pin shares with its copies.
    PinRecord const &GetPinRecord() const;
    /// The same for writing: this pin's alone.
    PinRecord &OwnPinRecord();
    /// Takes over name, comment, kind and a pin's data from an object of the same class.
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

/// A visitor over the kinds of objects. Every operation does nothing unless overridden.
class VESK_HDL_API ObjectVisitor {
public:
    virtual ~ObjectVisitor();
    virtual void VisitAttribute(Attribute *) {}
    virtual void VisitSignal(Signal *) {}
    virtual void VisitComponent(Component *) {}
    virtual void VisitPin(Pin *) {}
    virtual void VisitInstance(Instance *) {}
    virtual void VisitNetlist(Netlist *) {}
};

} // namespace Vesk_Hdl
