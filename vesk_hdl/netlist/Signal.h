#pragma once

#include <atomic>

#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

struct ParentCell;

/// A net of the netlist, and a port of its module when it has a port polarity.
///
/// A signal lists its pins and, one way, the signals that are assigned to it; it owns neither. Its
/// kind is written in its name: widths, directions and bit numbers are read from there each time.
/// Bounds are left and right as written, not low and high; widths count bits and end at INT_MAX.
class VESK_HDL_API Signal : public Object, public AttributeHolder {
public:
    enum SignalType : int {
        SIGNAL_SCALAR = 50,
        SIGNAL_BUS = 51,
        SIGNAL_BUS_SLICE = 52,
        SIGNAL_BUS_INDEX = 53,
        SIGNAL_COMPOUND_BUS = 54
    };

    /// Disconnects nothing: Netlist::Remove does that first.
    ~Signal() override;
    ObjectType GetObjectType() const override;
    void AcceptObject(ObjectVisitor &visitor) override;
    void SetName(char const *name) override;
    virtual SignalType GetSignalType() const = 0;
    virtual void SetPortPolarity(Polarity const &polarity) = 0;
    /// Calls the visitor's operation for the class, then VisitSignal, with the same signal.
    virtual void AcceptSignal(SignalVisitor &visitor) = 0;
    virtual Polarity GetPortPolarity() const = 0;
    virtual int GetWidth() const = 0;
    virtual bool IsPort() const = 0;
    /// Whether the written text declares this signal: true for scalars and buses alone.
    virtual bool IsNeededToDeclared() const = 0;
    /// The name of the signal that takes over this one's connections before a write.
    virtual Basis::StringBase<char> GetDummySignalName() const = 0;

    Signal(Signal const &) = delete;
    Signal &operator=(Signal const &) = delete;

    /// Puts the pin on this signal and lists it, unless it is listed already. A signal that the pin
    /// was on before is not told and goes on listing it. Null is ignored.
    void Connect(Pin *pin);
    /// Lists `other` as assigned to this signal, unless it is listed; `other` learns nothing. Null
    /// is ignored.
    void Connect(Signal *other);
    /// Takes the pin out of the list and clears the pin's signal, also if it was not listed. Null
    /// is ignored.
    void Disconnect(Pin *pin);
    void Disconnect(Signal *other);
    /// Clears the signal of every listed pin and empties both lists.
    void DisconnectAll();
    /// Moves, despite its name, all pins and assignments of `source` here, in place of the own
    /// ones. Null leaves this signal without any.
    void CloneConnection(Signal *source);
    /// Stores a constant, see BitVectorValue::SetValue. No connection is touched.
    void AssignConstantValue(char const *text);
    void AssignConstantValue(BitVectorValue const &value);
    BitVectorValue GetConstantValue() const;
    bool HasConstantValue() const;
    /// Whether more than one pin of polarity OUTPUT is listed.
    bool HasMultiDriver() const;
    /// The walks also see what is connected after they were asked for, so that asking makes empty
    /// lists: ask HasPins or HasAssignments first where many signals have none.
    Iterator<Pin *> GetPinIterator() const;
    Iterator<Signal *> GetSignalIterator() const;
    bool HasPins() const;
    /// Whether other signals are assigned to this one.
    bool HasAssignments() const;
    /// Adds the names that this signal needs declared, each if `IContains` says that it is absent:
    /// the base name, or for a compound its full name and the base name of each member.
    void GetBaseName(StringSet &names) const;
    using Object::GetBaseName;

protected:
    Signal();
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

/// One net.
class VESK_HDL_API ScalarSignal : public Signal {
public:
    ScalarSignal(char const *name);
    ~ScalarSignal() override;
    SignalType GetSignalType() const override;
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    Polarity GetPortPolarity() const override;
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// The name and "_DUMMY", unless the name ends so.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// A new signal with the dummy name and nothing else, owned by the caller.
    ScalarSignal *CreateDummySignal() const;

private:
    struct Record;
    std::unique_ptr<Record> record; ///< null while the signal is no port
};

/// A declared vector, BASE(LEFT:RIGHT).
class VESK_HDL_API Bus : public Signal {
public:
    Bus(char const *name);
    ~Bus() override;
    SignalType GetSignalType() const override;
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    Polarity GetPortPolarity() const override;
    /// 0 if the name is no bus name.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    /// BASE_DUMMY(LEFT:RIGHT); a base that ends in "_DUMMY" alone, without a range.
    Basis::StringBase<char> GetDummySignalName() const override;

    /// Appends to the list of slices, which it does not own, also a duplicate.
    void AddBusSlice(Signal *slice);
    void RemoveBusSlice(Signal *slice);
    void EmptyBusSlice();
    /// The slices and indexes of this bus, in order of creation.
    Iterator<Signal *> GetBusSliceIterator() const;
    /// The bounds as text; left as they were if the name is no bus name.
    void GetIndex(Basis::StringBase<char> &left, Basis::StringBase<char> &right) const;
    /// Has no effect for the caller.
    void GetIndex(int left, int right) const;
    /// Whether the left bound is greater than the right one; false if the name is no bus name.
    bool IsDownTo() const;
    Basis::StringBase<char> GetBaseName() const;
    using Signal::GetBaseName;
    Bus *CreateDummySignal() const;

    /// Whether the text is BASE(LEFT:RIGHT), in rewritten form.
    static bool IsBusName(Basis::StringBase<char> const &name);
    /// The parts of a bus name, found by a walk over its tokens; on false nothing is written. The
    /// bounds as text keep signs and zeros, as numbers they are what `atoi` makes of them.
    static bool ParseBusName(Basis::StringBase<char> const &name, Basis::StringBase<char> &base,
                             Basis::StringBase<char> &left, Basis::StringBase<char> &right);
    static bool ParseBusName(Basis::StringBase<char> const &name, Basis::StringBase<char> &base,
                             int &left, int &right);
    /// Appends the name of each bit, from left to right, to `bits`: as many as the bus is wide.
    static bool ParseBusName(Basis::StringBase<char> const &name, StringArray &bits);
    /// The name of `count` bits from the position `start`, counted from the left bound: an index
    /// name for one bit (or fewer), a bus name for more; empty if the bus has not that many.
    static Basis::StringBase<char> GetBusSliceName(Basis::StringBase<char> const &name, int start,
                                                   int count);

private:
    friend class BusSlice;
    friend class BusIndex;
    friend class NetlistEdit;
    struct Record;

    ParentCell *ShareCell();

    std::unique_ptr<Record> record;
};

/// A part of a declared bus, D(3:0) of D(7:0). It refers to bits of its parent: it is never
/// declared and never a port by itself.
class VESK_HDL_API BusSlice : public Signal {
public:
    /// Enters itself in the parent's list of slices. A slice that dies before its parent must be
    /// taken out of that list first. Null makes a slice that is no port.
    BusSlice(char const *name, Bus *parent);
    ~BusSlice() override;
    SignalType GetSignalType() const override;
    /// Makes the parent a port.
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    /// The parent's.
    Polarity GetPortPolarity() const override;
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    Basis::StringBase<char> GetDummySignalName() const override;

    void GetIndex(Basis::StringBase<char> &left, Basis::StringBase<char> &right) const;
    bool IsDownTo() const;
    Basis::StringBase<char> GetBaseName() const;
    using Signal::GetBaseName;
    /// Whether slice and parent both run down or both do not. One bit, D(3:3), does not run down.
    bool IsSameDirectionAsParent() const;
    BusSlice *CreateDummySignal(Bus *parent) const;

private:
    friend class NetlistEdit;

    BusSlice(BusSlice &&made) noexcept;
    Bus *GetParent() const;

    ParentCell *cell; ///< where the parent is found; null without one
};

/// One bit of a declared bus, D(3) of D(7:0).
class VESK_HDL_API BusIndex : public Signal {
public:
    /// As BusSlice. Null makes an index with a polarity of its own.
    BusIndex(char const *name, Bus *parent);
    ~BusIndex() override;
    SignalType GetSignalType() const override;
    /// Makes the parent a port.
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    /// The parent's, if there is one.
    Polarity GetPortPolarity() const override;
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    Basis::StringBase<char> GetDummySignalName() const override;

    /// The text of the index; empty if the name is no index name.
    Basis::StringBase<char> GetIndex() const;
    Basis::StringBase<char> GetBaseName() const;
    using Signal::GetBaseName;
    BusIndex *CreateDummySignal(Bus *parent) const;

    /// Whether the text is BASE(INDEX), in rewritten form.
    static bool IsBusIndexName(Basis::StringBase<char> const &name);
    /// The parts of an index name; on false nothing is written.
    static bool ParseBusIndexName(Basis::StringBase<char> const &name,
                                  Basis::StringBase<char> &base, Basis::StringBase<char> &index);
    static bool ParseBusIndexName(Basis::StringBase<char> const &name,
                                  Basis::StringBase<char> &base, int &index);

private:
    Bus *GetParent() const;

    ParentCell *cell; ///< where the parent is found
};

/// A bundle of signals in the order of its name, A,D(3:0),E(2). It lists its members and owns
/// nothing.
class VESK_HDL_API CompoundBus : public Signal {
public:
    CompoundBus(char const *name);
    CompoundBus(char const *name, PtrArray<Signal *> const &members);
    ~CompoundBus() override;
    SignalType GetSignalType() const override;
    /// Sets the polarity of each member.
    void SetPortPolarity(Polarity const &polarity) override;
    void AcceptSignal(SignalVisitor &visitor) override;
    /// The first member's; INVALID with fewer than two members.
    Polarity GetPortPolarity() const override;
    /// The sum over the members.
    int GetWidth() const override;
    bool IsPort() const override;
    bool IsNeededToDeclared() const override;
    Basis::StringBase<char> GetDummySignalName() const override;

    /// Appends a member, which may be null, this compound, or one that holds it. The member is not
    /// looked at. Walks over the members (width, polarity, dummy name, the written text) go into
    /// compounds among them, and leave out a compound that they are in the middle of.
    void AddBusMember(Signal *signal);
    /// The same at a place from 0 on.
    void SetAt(int index, Signal *signal);
    Signal *GetAt(int index) const;
    /// The number of members, not the width.
    int GetSize() const;
    Iterator<Signal *> GetBusMemberIterator() const;
    /// A compound with the dummy name and no members yet.
    CompoundBus *CreateDummySignal() const;

    /// Whether the text is two or more base, bus or index names, separated by "," or a backslash.
    static bool IsCompoundBusName(Basis::StringBase<char> const &name);
    /// Appends the member names to `members`, with `expandBuses` a bus as its bits. Appends nothing
    /// if the name is no compound name.
    static void ParseCompoundBusName(Basis::StringBase<char> const &name, StringArray &members,
                                     bool expandBuses);

private:
    struct Record;
    std::unique_ptr<Record> record;
};

/// A visitor over the classes of signals. Every operation does nothing unless overridden.
class VESK_HDL_API SignalVisitor {
public:
    virtual ~SignalVisitor();
    virtual void VisitSignal(Signal *) {}
    virtual void VisitScalarSignal(ScalarSignal *) {}
    virtual void VisitBus(Bus *) {}
    virtual void VisitBusSlice(BusSlice *) {}
    virtual void VisitBusIndex(BusIndex *) {}
    virtual void VisitCompoundBus(CompoundBus *) {}
};

} // namespace Vesk_Hdl
