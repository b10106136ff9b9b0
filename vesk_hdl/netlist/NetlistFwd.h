#pragma once

// The names of all netlist classes, so that their headers need not include each other.

namespace Vesk_Hdl {

class Object;
class ObjectVisitor;
class Polarity;
class BitVectorValue;

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

class Signal;
class ScalarSignal;
class Bus;
class BusSlice;
class BusIndex;
class CompoundBus;
class SignalVisitor;

class Pin;
class ScalarPin;
class BusPin;
class BusIndexPin;
class PinVisitor;
class Component;
class Instance;

class Netlist;

} // namespace Vesk_Hdl
