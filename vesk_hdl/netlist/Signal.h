#pragma once

#include <atomic>

#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

/// A net of the netlist, and a port of its module if it has a port polarity.
///
/// A signal lists its pins and, one way, the signals that it is assigned from. It owns neither. Its
/// kind is written in its name: widths, directions and bit numbers are read from the name at each
/// question. Bounds are the left and the right one as written, not the low and the high one. Widths
/// count bits and are at most INT_MAX.
///
/// A signal belongs to its creator until Netlist::Add. Pointers from the lists are valid until the
/// object is removed from the netlist.
class VESK_HDL_API Signal : public Object, public AttributeHolder {
public:
    /// The classes of signals.
    enum SignalType : int {
        SIGNAL_SCALAR = 50,      ///< ScalarSignal
        SIGNAL_BUS = 51,         ///< Bus
        SIGNAL_BUS_SLICE = 52,   ///< BusSlice
        SIGNAL_BUS_INDEX = 53,   ///< BusIndex
        SIGNAL_COMPOUND_BUS = 54 ///< CompoundBus
    };

    /// Disconnects nothing: Netlist::Remove does that first. Other signals that list this one must
    /// not be asked for it afterwards.
    ~Signal() override;
    /// OBJECT_SIGNAL.
    ObjectType GetObjectType() const override;
    /// Calls ObjectVisitor::VisitSignal.
    void AcceptObject(ObjectVisitor &visitor) override;
    /// As Object::SetName: a netlist still finds the signal by its former name. The class stays,
    /// also if the new name has the form of another one.
    void SetName(char const *name) override;
    /// The class of this signal.
    virtual SignalType GetSignalType() const = 0;
    /// Makes the signal a port of that direction; INVALID makes it no port. What parts of a bus and
    /// compounds do with it is said there.
    virtual void SetPortPolarity(Polarity const &polarity) = 0;
    /// Calls the visitor's operation for the class, then VisitSignal, with the same signal.
    virtual void AcceptSignal(SignalVisitor &visitor) = 0;
    /// The direction of the port, INVALID if the signal is none.
    virtual Polarity GetPortPolarity() const = 0;
    /// The width in bits.
    virtual int GetWidth() const = 0;
    /// Whether the signal is a port of its own: always false for slices and compounds.
    virtual bool IsPort() const = 0;
    /// Whether the written text declares this signal: true for scalars and buses only, since parts
    /// of a bus and compounds are names for bits that are declared elsewhere.
    virtual bool IsNeededToDeclared() const = 0;
    /// The name of the dummy signal that takes over this one's connections before a write, see
    /// Netlist::CreateVhdlDummySignals.
    virtual Basis::StringBase<char> GetDummySignalName() const = 0;

    Signal(Signal const &) = delete;
    Signal &operator=(Signal const &) = delete;

    /// Puts a pin on this signal and lists it, unless it is listed already: then nothing changes. A
    /// signal that the pin was on before still lists it. Null is ignored.
    void Connect(Pin *pin);
    /// Lists `other` as a signal that this one is assigned from, unless it is listed already.
    /// `other` is not changed. Null is ignored.
    void Connect(Signal *other);
    /// Takes the pin off the list and clears the pin's signal, also if it was not listed here. Null
    /// is ignored.
    void Disconnect(Pin *pin);
    /// Takes a signal off the list. `other` is compared and not used otherwise.
    void Disconnect(Signal *other);
    /// Clears the signal of each listed pin and empties both lists.
    void DisconnectAll();
    /// Moves all pins and assigned signals of `source` to this signal, in place of its own, which
    /// are disconnected first. The name is misleading and part of the interface: `source` has none
    /// afterwards. Null, and this signal itself, leave it without any.
    void CloneConnection(Signal *source);
    /// Stores the constant of a text, see BitVectorValue::SetValue, in place of a former one. No
    /// connection changes. A constant without digits is none.
    void AssignConstantValue(char const *text);
    /// Stores a copy of a constant.
    void AssignConstantValue(BitVectorValue const &value);
    /// A copy of the constant, in its default state if there is none.
    BitVectorValue GetConstantValue() const;
    /// Whether there is a constant, so that the writers assign it.
    bool HasConstantValue() const;
    /// Whether more than one pin of polarity OUTPUT is listed. Bidirectional pins do not count.
    bool HasMultiDriver() const;
    // The walks also see what is connected after they were requested, so that a request makes empty
    // lists. Where many signals have none, ask HasPins or HasAssignments first.

    /// A walk over the pins in order of connection, valid as long as the signal.
    Iterator<Pin *> GetPinIterator() const;
    /// A walk over the signals that this one is assigned from, in order, valid as long as the
    /// signal.
    Iterator<Signal *> GetSignalIterator() const;
    /// Whether any pin is listed.
    bool HasPins() const;
    /// Whether this signal is assigned from other signals.
    bool HasAssignments() const;
    /// Adds to `names` the names that this signal needs declared, each if `IContains` does not know
    /// it: the base name; for a compound its full name and the base name of each member.
    void GetBaseName(StringSet &names) const;
    using Object::GetBaseName;

protected:
    /// A signal without a name, pins, assigned signals and constant.
    Signal();
    /// The same with the rewritten name. Null counts as empty.
    Signal(char const *name);

private:
    friend class BusSlice;
    friend class NetlistEdit;
    struct Record;

    Signal(Signal &&made) noexcept;
    Record *Find() const;
    Record &Own() const;

    mutable std::atomic<Record *> record; ///< null while nothing was connected or asked for
};

/// One net. It is also the class of a signal whose name has no other form.
class VESK_HDL_API ScalarSignal : public Signal {
public:
    /// A net with the rewritten name, which is no port. Null counts as empty.
    ScalarSignal(char const *name);
    ~ScalarSignal() override;
    SignalType GetSignalType() const override;
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    Polarity GetPortPolarity() const override;
    /// 1.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// NAME_DUMMY. A name that ends in "_DUMMY", in any case, as it is.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// A new net with the dummy name, owned by the caller. Nothing else is copied.
    ScalarSignal *CreateDummySignal() const;

private:
    struct Record;
    std::unique_ptr<Record> record; ///< null while the signal is no port
};

/// A declared vector, BASE(LEFT:RIGHT). It lists the slices and indices that refer to its bits and
/// owns none of them.
///
/// A model replaces a bus by a wider one when a name asks for it, see Model::ConnectSignalToPin.
/// The old object then becomes a BusSlice at the same address: a `Bus *` must not be used across a
/// command line without asking the netlist again.
class VESK_HDL_API Bus : public Signal {
public:
    /// A bus with the rewritten name, without parts, which is no port. The name is not checked: one
    /// that is no bus name makes a bus of width 0. Null counts as empty.
    Bus(char const *name);
    /// Its parts live on without a parent.
    ~Bus() override;
    SignalType GetSignalType() const override;
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    Polarity GetPortPolarity() const override;
    /// The width in bits; 0 if the name is no bus name.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// BASE_DUMMY(LEFT:RIGHT). A base that ends in "_DUMMY" gives the base alone, without a range.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// Appends a part to the list, also a duplicate. The constructors of the parts call it.
    void AddBusSlice(Signal *slice);
    /// Takes the first occurrence of a part off the list. The part itself does not change. Call it
    /// before a part is deleted.
    void RemoveBusSlice(Signal *slice);
    /// Empties the list. The parts do not change.
    void EmptyBusSlice();
    /// A walk over the slices and indices of this bus in order of creation, valid as long as the
    /// bus.
    Iterator<Signal *> GetBusSliceIterator() const;
    /// The bounds as text; left as they were if the name is no bus name.
    void GetIndex(Basis::StringBase<char> &left, Basis::StringBase<char> &right) const;
    /// Has no effect, as it takes its arguments by value; kept for clients that call it.
    void GetIndex(int left, int right) const;
    /// Whether the left bound is greater than the right one. False if the name is no bus name.
    bool IsDownTo() const;
    /// The name without its range.
    Basis::StringBase<char> GetBaseName() const;
    using Signal::GetBaseName;
    /// A new bus with the dummy name, owned by the caller. Nothing else is copied.
    Bus *CreateDummySignal() const;

    /// Whether the text is BASE(LEFT:RIGHT), see Object::IsValidBaseName and IsValidIntegerString.
    /// Other brackets make it no bus name: rewrite it first.
    static bool IsBusName(Basis::StringBase<char> const &name);
    /// Takes a bus name apart. The bounds keep signs and leading zeros. False, and nothing is
    /// written, if it is none. It reads the name token by token: on odd texts such as "A(:3:0)" it
    /// differs from IsBusName.
    static bool ParseBusName(Basis::StringBase<char> const &name, Basis::StringBase<char> &base,
                             Basis::StringBase<char> &left, Basis::StringBase<char> &right);
    /// The same with the bounds as numbers, which `atoi` would make of them.
    static bool ParseBusName(Basis::StringBase<char> const &name, Basis::StringBase<char> &base,
                             int &left, int &right);
    /// Appends the name of each bit, BASE(INDEX), from left to right to `bits`. These are as many
    /// as the bus is wide, which can be 2,147,483,647 bits with a name of a few characters. False,
    /// and nothing is appended, if it is no bus name.
    static bool ParseBusName(Basis::StringBase<char> const &name, StringArray &bits);
    /// The name of `count` bits from position `start` on, counted from 0 at the left bound: an
    /// index name for one bit or fewer, otherwise a bus name. Empty if the bus has not that many,
    /// and for a name that is no bus name. The time does not depend on the width.
    static Basis::StringBase<char> GetBusSliceName(Basis::StringBase<char> const &name, int start,
                                                   int count);

private:
    friend class BusSlice;
    friend class BusIndex;
    friend class NetlistEdit;
    struct Record;

    Record *record; ///< shared with the parts of the bus
};

/// A part of a declared bus, D(3:0) of D(7:0). It is a name for bits of its parent: it is never
/// declared and never a port by itself. Its range is not checked against that of the parent.
class VESK_HDL_API BusSlice : public Signal {
public:
    /// A slice with the rewritten name, which enters itself in the parent's list. The parent is not
    /// owned; if it ends first, the slice has none. A slice that ends first must be taken off that
    /// list before, see Bus::RemoveBusSlice. A null parent makes a slice that is no port.
    BusSlice(char const *name, Bus *parent);
    ~BusSlice() override;
    SignalType GetSignalType() const override;
    /// Sets the polarity of the parent, so that the whole bus is a port. Without a parent it does
    /// nothing.
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    /// The parent's; INVALID without a parent.
    Polarity GetPortPolarity() const override;
    /// The width in bits; 0 if the name is no bus name.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// BASE_DUMMY(LEFT:RIGHT), whatever the base ends in.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// The bounds as text; left as they were if the name is no bus name.
    void GetIndex(Basis::StringBase<char> &left, Basis::StringBase<char> &right) const;
    /// Whether the left bound is greater than the right one. False if the name is no bus name.
    bool IsDownTo() const;
    /// The name without its range.
    Basis::StringBase<char> GetBaseName() const;
    using Signal::GetBaseName;
    /// Whether slice and parent both count down or both do not. A range of one bit, D(3:3), does
    /// not count down. A slice against the direction of its bus is no legal slice name (IEEE
    /// 1076-1993, 6.5), and the VHDL writer associates it bit by bit.
    bool IsSameDirectionAsParent() const;
    /// A new slice of `parent` with the dummy name, owned by the caller. Nothing else is copied.
    BusSlice *CreateDummySignal(Bus *parent) const;

private:
    friend class NetlistEdit;

    BusSlice(BusSlice &&made) noexcept;
    Bus *GetParent() const;

    Bus::Record *parentRecord; ///< of the bus, shared with it; null without a bus
};

/// One bit of a declared bus, D(3) of D(7:0). Like a slice it is a name for a bit of its parent and
/// is never declared. Unlike a slice it counts as a port when the bus is one.
class VESK_HDL_API BusIndex : public Signal {
public:
    /// As the constructor of BusSlice. A null parent makes an index with a polarity of its own.
    BusIndex(char const *name, Bus *parent);
    ~BusIndex() override;
    SignalType GetSignalType() const override;
    /// Sets the polarity of the parent, so that the whole bus is a port; without a parent its own.
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    /// The parent's; without a parent its own.
    Polarity GetPortPolarity() const override;
    /// 1.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// BASE_DUMMY(INDEX), whatever the base ends in.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// The text of the index, with its sign and leading zeros; empty if the name is no index name.
    Basis::StringBase<char> GetIndex() const;
    /// The name without its index.
    Basis::StringBase<char> GetBaseName() const;
    using Signal::GetBaseName;
    /// A new index of `parent` with the dummy name, owned by the caller. Nothing else is copied.
    BusIndex *CreateDummySignal(Bus *parent) const;

    /// Whether the text is BASE(INDEX), see Object::IsValidBaseName and IsValidIntegerString. Other
    /// brackets make it no index name: rewrite it first.
    static bool IsBusIndexName(Basis::StringBase<char> const &name);
    /// Takes an index name apart. False, and nothing is written, if it is none.
    static bool ParseBusIndexName(Basis::StringBase<char> const &name,
                                  Basis::StringBase<char> &base, Basis::StringBase<char> &index);
    /// The same with the index as the number that `atoi` would make of it.
    static bool ParseBusIndexName(Basis::StringBase<char> const &name,
                                  Basis::StringBase<char> &base, int &index);

private:
    Bus *GetParent() const;

    Bus::Record *parentRecord; ///< of the bus, shared with it; its own without a bus
};

/// A bundle of signals in the order of its name, A,D(3:0),E(2). In a port map VHDL gets one
/// association for each member (IEEE 1076-1993, 4.3.2.2), Verilog a concatenation (IEEE 1364-1995,
/// 4.1.14). It lists its members and owns none of them; they must live as long as the compound is
/// asked about them.
///
/// A client may nest compounds, also in a circle. Walks over the members (width, polarity, dummy
/// name, written text) enter compounds among them and leave out a compound that they are inside of.
class VESK_HDL_API CompoundBus : public Signal {
public:
    /// A compound with the rewritten name and no members. The name is not checked and makes no
    /// members.
    CompoundBus(char const *name);
    /// The same with the members of an array, which is copied.
    CompoundBus(char const *name, PtrArray<Signal *> const &members);
    ~CompoundBus() override;
    SignalType GetSignalType() const override;
    /// Sets the polarity of each member, so that they all become ports.
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    /// That of the first member; INVALID with fewer than two members.
    Polarity GetPortPolarity() const override;
    /// The sum of the widths of the members, at most INT_MAX; 0 without members.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// The dummy names of the members, joined by commas.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// Appends a member, which may be null, this compound, or one that holds it. The member is not
    /// looked into.
    void AddBusMember(Signal *signal);
    /// Replaces the member at an index from 0 on; past the end the list becomes longer, with null
    /// in between. A negative index does nothing. The former member does not change.
    void SetAt(int index, Signal *signal);
    /// The member at an index, null outside.
    Signal *GetAt(int index) const;
    /// The number of members, which is not the width.
    int GetSize() const;
    /// A walk over the members in order, valid as long as the compound.
    Iterator<Signal *> GetBusMemberIterator() const;
    /// A new compound with the dummy name and no members, owned by the caller.
    CompoundBus *CreateDummySignal() const;

    /// Whether the text is two or more base names, bus names or index names with "," or a backslash
    /// between them. A run of separators counts as one, also at either end.
    static bool IsCompoundBusName(Basis::StringBase<char> const &name);
    /// Appends the names of the members to `members`, with `expandBuses` a bus as its bits, see
    /// Bus::ParseBusName. Appends nothing if the text is no compound name.
    static void ParseCompoundBusName(Basis::StringBase<char> const &name, StringArray &members,
                                     bool expandBuses);

private:
    struct Record;
    std::unique_ptr<Record> record;
};

/// A visitor over the classes of signals. Signal::AcceptSignal calls two operations: the one for
/// the class, then VisitSignal, both with the same signal, which is never null and stays with its
/// owner. A visitor overrides either or both. Every operation does nothing unless overridden.
class VESK_HDL_API SignalVisitor {
public:
    /// A visitor of the library holds no data.
    virtual ~SignalVisitor();
    /// Called by every signal, after the operation for its class.
    virtual void VisitSignal(Signal *) {}
    /// Called by a single net.
    virtual void VisitScalarSignal(ScalarSignal *) {}
    /// Called by a declared vector.
    virtual void VisitBus(Bus *) {}
    /// Called by a part of a bus.
    virtual void VisitBusSlice(BusSlice *) {}
    /// Called by one bit of a bus.
    virtual void VisitBusIndex(BusIndex *) {}
    /// Called by a bundle, not by its members.
    virtual void VisitCompoundBus(CompoundBus *) {}
};

} // namespace Vesk_Hdl
