#pragma once

#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Object.h"

namespace Vesk_Hdl {

class PinFamilyPtr;

/// A pin of a component or of an instance: a polarity, a default value and at most one signal.
///
/// The pin does not own its signal. A signal that ends without Netlist::Remove leaves the pin with
/// a pointer that must not be used. Name, comment, polarity and default value are shared with
/// copies until one of them changes.
class VESK_HDL_API Pin : public Object, public AttributeHolder {
public:
    /// The classes of pins.
    enum PinType : int {
        PIN_SCALAR = 1,   ///< ScalarPin
        PIN_BUS = 2,      ///< BusPin
        PIN_BUS_INDEX = 3 ///< BusIndexPin
    };

    /// A signal that lists the pin still lists it afterwards: disconnect it first.
    ~Pin() override;
    /// OBJECT_PIN.
    ObjectType GetObjectType() const override;
    /// Calls ObjectVisitor::VisitPin.
    void AcceptObject(ObjectVisitor &visitor) override;
    /// As Object::SetName. GetPin of the owner finds the pin by its new name.
    void SetName(char const *name) override;
    /// The class of this pin.
    virtual PinType GetPinType() const = 0;
    /// A copy of the same class, owned by the caller. It has the same signal, which does not list
    /// it.
    virtual Pin *ClonePin() const = 0;
    /// Calls the one operation of the visitor for the class.
    virtual void AcceptPin(PinVisitor &visitor) = 0;
    /// The name that a port map uses: that of a bus or index pin without its range or index.
    virtual Basis::StringBase<char> GetBaseName() const = 0;

    /// Copies attributes, comment, name, polarity, signal and default value. The signal does not
    /// list this pin. Assigning a pin to itself changes nothing.
    Pin &operator=(Pin const &other);

    /// Stores the signal, or null, and nothing more: the signal does not list the pin.
    /// Signal::Connect makes a connection that both sides know. The signal must live as long as the
    /// pin is on it.
    void Connect(Signal *signal);
    /// Clears the signal and nothing more: a signal that lists the pin still lists it.
    void Disconnect();
    /// The signal that the pin is on, null for an open pin.
    Signal *GetSignal() const;
    /// Sets the polarity of this pin. Copies that were made before keep theirs.
    void SetPolarity(Polarity const &polarity);
    /// The polarity.
    Polarity GetPolarity() const;
    /// The name of the polarity, see Polarity::GetValueName.
    Basis::StringBase<char> GetPolarityName() const;
    /// Stores a copy of the value.
    void SetDefaultValue(BitVectorValue const &value);
    /// Stores the constant of a text, see BitVectorValue::SetValue. Null counts as empty.
    void SetDefaultValue(char const *text);
    /// A copy of the default value. The writers do not show it.
    BitVectorValue GetDefaultValue() const;
    using Object::GetBaseName;

protected:
    /// An open pin with the rewritten name and an empty default value. Null counts as empty.
    Pin(char const *name, Polarity const &polarity);
    /// A copy, see operator=.
    Pin(Pin const &other);

private:
    friend class Component;
    friend class Signal;

    /// Connect, for a signal that lists the pin.
    void SetListedSignal(Signal *newSignal) { signal = newSignal; }
    /// False only if the pin was never on a signal: then no signal lists it, and none need be
    /// searched.
    bool MayBeListed() const { return signal != nullptr; }
    static Signal *Former();
    /// Called by the component that owns the pin, which shares its family with it.
    void Enter(PinFamilyPtr const &family);

    /// Null at first, Former() after a disconnection. All else is shared with copies.
    Signal *signal;
};

/// A pin of one bit. It is also the class of a pin whose name has no other form when it is added.
class VESK_HDL_API ScalarPin : public Pin {
public:
    /// An open pin with the rewritten name and no default value. Null counts as empty.
    ScalarPin(char const *name, Polarity const &polarity);
    /// A copy, see Pin::operator=.
    ScalarPin(ScalarPin const &other);
    /// Copies everything, see Pin::operator=.
    ScalarPin &operator=(ScalarPin const &other);
    PinType GetPinType() const override;
    Pin *ClonePin() const override;
    void AcceptPin(PinVisitor &visitor) override;
    /// The whole name, also if it has brackets.
    Basis::StringBase<char> GetBaseName() const override;
    using Object::GetBaseName;
};

/// A pin with a range, D(7:0).
class VESK_HDL_API BusPin : public Pin {
public:
    /// An open pin with the rewritten name and no default value. Null counts as empty.
    BusPin(char const *name, Polarity const &polarity);
    /// A copy, see Pin::operator=.
    BusPin(BusPin const &other);
    /// Copies everything, see Pin::operator=.
    BusPin &operator=(BusPin const &other);
    PinType GetPinType() const override;
    Pin *ClonePin() const override;
    void AcceptPin(PinVisitor &visitor) override;
    /// The name without its range.
    Basis::StringBase<char> GetBaseName() const override;
    using Object::GetBaseName;

    /// The bounds as text, left and right as written; left as they were if the name is no bus name.
    void GetIndex(Basis::StringBase<char> &left, Basis::StringBase<char> &right) const;
    /// Whether the left bound is greater than the right one. False if the name is no bus name.
    bool IsDownTo() const;
    /// The width in bits, at most INT_MAX; 0 if the name is no bus name.
    int GetWidth() const;
};

/// A pin that is one bit of a range, D(3).
class VESK_HDL_API BusIndexPin : public Pin {
public:
    /// An open pin with the rewritten name and no default value. Null counts as empty.
    BusIndexPin(char const *name, Polarity const &polarity);
    /// A copy, see Pin::operator=.
    BusIndexPin(BusIndexPin const &other);
    /// Copies everything, see Pin::operator=.
    BusIndexPin &operator=(BusIndexPin const &other);
    PinType GetPinType() const override;
    Pin *ClonePin() const override;
    void AcceptPin(PinVisitor &visitor) override;
    /// The name without its index.
    Basis::StringBase<char> GetBaseName() const override;
    using Object::GetBaseName;

    /// The text of the index, empty if the name is no index name.
    Basis::StringBase<char> GetIndex() const;
};

/// A visitor over the classes of pins: Pin::AcceptPin calls the one operation for the class and
/// passes the pin, which is never null and stays with its owner. Every operation does nothing
/// unless overridden.
class VESK_HDL_API PinVisitor {
public:
    /// A visitor of the library holds no data.
    virtual ~PinVisitor();
    /// Called by no pin of the library.
    virtual void VisitPin(Pin *) {}
    /// Called by a pin of one bit.
    virtual void VisitScalarPin(ScalarPin *) {}
    /// Called by a pin with a range.
    virtual void VisitBusPin(BusPin *) {}
    /// Called by a pin that is one bit of a range.
    virtual void VisitBusIndexPin(BusIndexPin *) {}
};

/// The declaration of a kind of block: a name, attributes and pins in order of addition, which it
/// owns. A component never loses a pin.
class VESK_HDL_API Component : public Object, public AttributeHolder {
public:
    /// A component with the rewritten name and no pins. Null counts as empty.
    Component(char const *name);
    /// Deletes the pins, the last one first. Instances keep their own pins.
    ~Component() override;
    /// OBJECT_COMPONENT.
    ObjectType GetObjectType() const override;
    /// Calls ObjectVisitor::VisitComponent.
    void AcceptObject(ObjectVisitor &visitor) override;
    /// As Object::SetName: a netlist still finds the component by its former name.
    void SetName(char const *name) override;
    Component(Component const &) = delete;
    Component &operator=(Component const &) = delete;

    /// Adds a pin after the others, also a second one of a name. Instances that were made before do
    /// not get it. The class of the pin follows from the name as it is passed, before it is
    /// rewritten: "D(7:0)" makes a BusPin, "D[7:0]" a ScalarPin that is called D(7:0). A default
    /// value without digits is left out. A null name counts as empty. If memory runs out
    /// (std::bad_alloc), the component is as it was.
    void AddPin(char const *name, Polarity const &polarity, BitVectorValue const &defaultValue);
    /// The same with the constant of a text. Null means no default value.
    void AddPin(char const *name, Polarity const &polarity, char const *defaultValue);
    /// The same with name, polarity and default value of a pin. Its attributes and comment are not
    /// copied.
    void AddPin(Pin const &pin);
    /// The first pin of a name, null when absent. The name is rewritten, and case is ignored. Null
    /// counts as empty. The pin is valid as long as the component, which stays its owner.
    Pin *GetPin(char const *name) const;
    /// A walk over the pins in order of addition, valid as long as the component.
    Iterator<Pin *> GetPinIterator() const;

private:
    friend class Instance;
    struct Record;
    std::unique_ptr<Record> record;
};

/// One placement of a component. It owns copies of the component's pins, which it makes when it is
/// made itself: pins and attributes of pins that the component gets later do not reach it.
///
/// The component must live as long as GetComponent, GetComponentName and GetComponentAttr are
/// called. The other operations work without it.
class VESK_HDL_API Instance : public Object, public AttributeHolder {
public:
    /// An instance with the rewritten name and copies of the component's pins, see Pin::ClonePin. A
    /// null component makes one without pins; a null name counts as empty. The component is not
    /// owned.
    Instance(char const *name, Component *component);
    /// Deletes the pins, the last one first. Signals that list them still list them: disconnect
    /// them first.
    ~Instance() override;
    /// OBJECT_INSTANCE.
    ObjectType GetObjectType() const override;
    /// Calls ObjectVisitor::VisitInstance.
    void AcceptObject(ObjectVisitor &visitor) override;
    /// As Object::SetName: a netlist still finds the instance by its former name.
    void SetName(char const *name) override;
    Instance(Instance const &) = delete;
    Instance &operator=(Instance const &) = delete;

    /// The component given to the constructor, null without one.
    Component *GetComponent() const;
    /// The component's name, empty without one.
    Basis::StringBase<char> GetComponentName() const;
    /// The component's attribute of a name, see AttributeHolder::GetAttr; null without a component.
    /// The component stays its owner.
    Attribute *GetComponentAttr(char const *name) const;
    /// The first pin of this instance of a name, as Component::GetPin. The pin is valid as long as
    /// the instance, which stays its owner.
    Pin *GetPin(char const *name) const;
    /// A walk over the pins: in the component's order until they are sorted. Valid as long as the
    /// instance.
    Iterator<Pin *> GetPinIterator() const;
    /// Sorts the pins by polarity, then by name in natural order, see Netlist::SortNetlist. No pin
    /// moves in memory.
    void SortPinName();
    /// Appends to `found` each pin that reads an output port, in order: its polarity is INPUT or
    /// BIDIRECTIONAL, and it is on a signal whose port polarity is OUTPUT. What `found` held stays.
    void GetOutPortConnectedToInPin(PtrArray<Pin *> &found) const;
    /// Appends to `found` each pin that drives an input port, in order: its polarity is OUTPUT or
    /// BIDIRECTIONAL, and it is on a signal whose port polarity is INPUT. What `found` held stays.
    void GetInPortConnectedToOutPin(PtrArray<Pin *> &found) const;
    /// Appends to `found` each pin without a signal, in order; with `onlyInputs` only those of
    /// polarity INPUT. Returns whether `found` then holds anything, also from before.
    bool GetOpenPin(PtrArray<Pin *> &found, bool onlyInputs) const;

private:
    struct Record;
    Record *record;
};

} // namespace Vesk_Hdl
