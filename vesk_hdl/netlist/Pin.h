#pragma once

#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Object.h"

namespace Vesk_Hdl {

/// A pin of a component or of an instance: a polarity, a default value and at most one signal,
/// which it does not own.
class VESK_HDL_API Pin : public Object, public AttributeHolder {
public:
    enum PinType : int { PIN_SCALAR = 1, PIN_BUS = 2, PIN_BUS_INDEX = 3 };

    /// The signal is not told.
    ~Pin() override;
    ObjectType GetObjectType() const override;
    void AcceptObject(ObjectVisitor &visitor) override;
    void SetName(char const *name) override;
    virtual PinType GetPinType() const = 0;
    /// A copy of the same class, owned by the caller.
    virtual Pin *ClonePin() const = 0;
    /// Calls the visitor's one operation for the class.
    virtual void AcceptPin(PinVisitor &visitor) = 0;
    /// The name that a port map uses: that of a bus pin without its range.
    virtual Basis::StringBase<char> GetBaseName() const = 0;

    /// Copies attributes, comment, name, polarity, signal and default value. The signal does not
    /// list the copy.
    Pin &operator=(Pin const &other);

    /// Stores the signal, or null, and nothing more: the signal does not list the pin. Connections
    /// that both sides know go through Signal::Connect.
    void Connect(Signal *signal);
    /// Clears the signal and nothing more.
    void Disconnect();
    /// Null for an open pin.
    Signal *GetSignal() const;
    void SetPolarity(Polarity const &polarity);
    Polarity GetPolarity() const;
    Basis::StringBase<char> GetPolarityName() const;
    void SetDefaultValue(BitVectorValue const &value);
    /// See BitVectorValue::SetValue.
    void SetDefaultValue(char const *text);
    BitVectorValue GetDefaultValue() const;
    using Object::GetBaseName;

protected:
    Pin(char const *name, Polarity const &polarity);
    Pin(Pin const &other);

private:
    friend class Signal;

    /// What Connect does, for a signal that lists the pin.
    void SetListedSignal(Signal *newSignal) { signal = newSignal; }
    /// False only if no signal ever listed the pin, which then need not be looked for.
    bool MayBeListed() const { return signal != nullptr; }
    static Signal *Former();

    Signal *signal; ///< Former() once there was one; all else is shared with copies
};

/// A pin of one bit, or one whose name is no other form.
class VESK_HDL_API ScalarPin : public Pin {
public:
    ScalarPin(char const *name, Polarity const &polarity);
    ScalarPin(ScalarPin const &other);
    ScalarPin &operator=(ScalarPin const &other);
    PinType GetPinType() const override;
    Pin *ClonePin() const override;
    void AcceptPin(PinVisitor &visitor) override;
    Basis::StringBase<char> GetBaseName() const override;
    using Object::GetBaseName;
};

/// A pin with a range, D(7:0).
class VESK_HDL_API BusPin : public Pin {
public:
    BusPin(char const *name, Polarity const &polarity);
    BusPin(BusPin const &other);
    BusPin &operator=(BusPin const &other);
    PinType GetPinType() const override;
    Pin *ClonePin() const override;
    void AcceptPin(PinVisitor &visitor) override;
    Basis::StringBase<char> GetBaseName() const override;
    using Object::GetBaseName;

    /// The bounds as text; left as they were if the name is no bus name.
    void GetIndex(Basis::StringBase<char> &left, Basis::StringBase<char> &right) const;
    /// Whether the left bound is greater than the right one; false if the name is no bus name.
    bool IsDownTo() const;
    /// In bits; 0 if the name is no bus name.
    int GetWidth() const;
};

/// A pin that is one bit of a range, D(3).
class VESK_HDL_API BusIndexPin : public Pin {
public:
    BusIndexPin(char const *name, Polarity const &polarity);
    BusIndexPin(BusIndexPin const &other);
    BusIndexPin &operator=(BusIndexPin const &other);
    PinType GetPinType() const override;
    Pin *ClonePin() const override;
    void AcceptPin(PinVisitor &visitor) override;
    Basis::StringBase<char> GetBaseName() const override;
    using Object::GetBaseName;

    /// The text of the index; empty if the name is no index name.
    Basis::StringBase<char> GetIndex() const;
};

/// A visitor over the classes of pins. Every operation does nothing unless overridden.
class VESK_HDL_API PinVisitor {
public:
    virtual ~PinVisitor();
    virtual void VisitPin(Pin *) {}
    virtual void VisitScalarPin(ScalarPin *) {}
    virtual void VisitBusPin(BusPin *) {}
    virtual void VisitBusIndexPin(BusIndexPin *) {}
};

/// The declaration of a kind of block: a name, attributes and pins in order of addition, which it
/// owns.
class VESK_HDL_API Component : public Object, public AttributeHolder {
public:
    Component(char const *name);
    ~Component() override;
    ObjectType GetObjectType() const override;
    void AcceptObject(ObjectVisitor &visitor) override;
    void SetName(char const *name) override;
    Component(Component const &) = delete;
    Component &operator=(Component const &) = delete;

    /// Adds a pin, also a duplicate. Its class comes from the name as it is written here, before
    /// any rewriting: D(7:0) makes a BusPin, D[7:0] a ScalarPin that is called D(7:0). A default
    /// value without text is left out. Null reads as empty.
    void AddPin(char const *name, Polarity const &polarity, BitVectorValue const &defaultValue);
    void AddPin(char const *name, Polarity const &polarity, char const *defaultValue);
    /// Takes name, polarity and default value; attributes and comment stay behind.
    void AddPin(Pin const &pin);
    /// The first pin of that name, in any case, the name rewritten before; null when absent.
    Pin *GetPin(char const *name) const;
    Iterator<Pin *> GetPinIterator() const;

private:
    friend class Instance;
    struct Record;
    std::unique_ptr<Record> record;
};

/// One placement of a component. It owns copies of the component's pins, made at its birth: pins
/// and pin attributes that the component gets later do not reach it.
class VESK_HDL_API Instance : public Object, public AttributeHolder {
public:
    /// Null makes an instance without pins. The component is not owned and must outlive the
    /// instance.
    Instance(char const *name, Component *component);
    ~Instance() override;
    ObjectType GetObjectType() const override;
    void AcceptObject(ObjectVisitor &visitor) override;
    void SetName(char const *name) override;
    Instance(Instance const &) = delete;
    Instance &operator=(Instance const &) = delete;

    Component *GetComponent() const;
    /// Empty without a component.
    Basis::StringBase<char> GetComponentName() const;
    /// The component's attribute; null without a component.
    Attribute *GetComponentAttr(char const *name) const;
    /// As Component::GetPin, over the own pins.
    Pin *GetPin(char const *name) const;
    Iterator<Pin *> GetPinIterator() const;
    /// Sorts the pins by polarity, then by name in natural order.
    void SortPinName();
    /// Appends each pin that reads an output port: INPUT or BIDIRECTIONAL, on a signal whose port
    /// polarity is OUTPUT.
    void GetOutPortConnectedToInPin(PtrArray<Pin *> &found) const;
    /// Appends each pin that drives an input port: OUTPUT or BIDIRECTIONAL, on a signal whose port
    /// polarity is INPUT.
    void GetInPortConnectedToOutPin(PtrArray<Pin *> &found) const;
    /// Appends each pin without a signal, with `onlyInputs` those of polarity INPUT alone. Whether
    /// `found`, which is not emptied before, then holds anything.
    bool GetOpenPin(PtrArray<Pin *> &found, bool onlyInputs) const;

private:
    struct Record;
    Record *record;
};

} // namespace Vesk_Hdl
