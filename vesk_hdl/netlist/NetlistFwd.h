#pragma once

// The names of all classes of a netlist, so that their headers need not include each other. A
// client that only passes pointers on includes this header; one that calls an operation includes
// the header of the class.

namespace Vesk_Hdl {

// What all things of a netlist are, and their values: Object.h, Values.h.
class Object;
class ObjectVisitor;
class Polarity;
class BitVectorValue;

// Typed values on things of a netlist: Attribute.h.
class Attribute;
class AttributeString;
class AttributeInteger;
class AttributeFloat;
class AttributeBoolean;
class AttributeBit;
class AttributeBitVector;
class AttributeUser;
class AttributeVisitor;
class AttributeHolder;
class AttributeFactory;

// Nets and ports: Signal.h.
class Signal;
class ScalarSignal;
class Bus;
class BusSlice;
class BusIndex;
class CompoundBus;
class SignalVisitor;

// Kinds of blocks, their placements and the pins of both: Pin.h.
class Pin;
class ScalarPin;
class BusPin;
class BusIndexPin;
class PinVisitor;
class Component;
class Instance;

// A whole design: Netlist.h.
class Netlist;

} // namespace Vesk_Hdl
