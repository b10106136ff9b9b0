#pragma once

#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// A whole design: the owner of its components, instances and signals. Its attributes and comment
/// are those of the module.
///
/// Objects of each of the three kinds are in an array, which gives the order of all output, and in
/// a map, which finds them by name, whatever the case and the brackets. Buses are also found by
/// their base name. A netlist refuses nothing and reports nothing: Model checks names and throws.
/// If memory runs out (std::bad_alloc), a netlist is whole, but a pass may have rewritten a part of
/// it. For one thread; several may read a netlist at the same time as long as none changes it.
///
/// Sources: Netlist.cpp (contents), passes/Netlist_passes.cpp (the rewriting before a write). See
/// docs/architecture.md, "Who owns what".
class VESK_HDL_API Netlist : public Object, public AttributeHolder {
public:
    /// "HDL_NETLIST", the name that Model::SetName gives for null.
    static char const DEFAULT_NETLIST_NAME[];

    /// An empty netlist. Null makes one that is called "hdlNetlist".
    Netlist(char const *name);
    /// Deletes the signals, then the instances, then the components, each the last one first.
    ~Netlist() override;
    /// OBJECT_NETLIST.
    ObjectType GetObjectType() const override;
    /// Calls ObjectVisitor::VisitNetlist.
    void AcceptObject(ObjectVisitor &visitor) override;
    /// Stores the name as it is: the name of a netlist is the only one that is not rewritten. Null
    /// counts as empty.
    void SetName(char const *name) override;
    Netlist(Netlist const &) = delete;
    Netlist &operator=(Netlist const &) = delete;

    /// Stores the name of the file that the design comes from. Nothing reads it but the client.
    /// Null counts as empty.
    void SetSourceFileName(char const *fileName);
    /// That name, empty until it is set.
    Basis::StringBase<char> GetSourceFileName() const;

    // Contents. Null is ignored throughout.

    /// Takes over a signal that was made with `new`, and appends it. A name that is taken is not
    /// looked for: both signals stay in the array, and the newer one is found. If memory runs out
    /// (std::bad_alloc), the signal is deleted, after it was taken off its bus's list of slices,
    /// and the netlist is as it was.
    void Add(Signal *signal);
    /// The same for an instance. It is deleted if memory runs out.
    void Add(Instance *instance);
    /// The same for a component. It is deleted if memory runs out.
    void Add(Component *component);
    /// Takes a signal out of the netlist and deletes it, also if the netlist did not hold it. Its
    /// pins are open afterwards. Afterwards no signal is found by its name, even if the array holds
    /// another one of that name. What else points at it is not looked for, and the caller sees to
    /// it: its slices and indices, signals that are assigned from it, compounds that list it, pins
    /// tied to it one way.
    void Remove(Signal *signal);
    /// The same for an instance. Signals that list its pins still list them: disconnect the pins
    /// first.
    void Remove(Instance *instance);
    /// The same for a component. Its instances keep their pins, and must not be asked for it any
    /// more.
    void Remove(Component *component);
    /// The signal of a name, which is rewritten first and matches in any case; null when absent.
    /// Null counts as the empty name. The netlist stays the owner. The pointer is valid until
    /// Remove, or until a command line widens a bus, see Bus.
    Signal *GetSignal(char const *name) const;
    /// The same for an instance, which is valid until Remove.
    Instance *GetInstance(char const *name) const;
    /// The same for a component, which is valid until Remove.
    Component *GetComponent(char const *name) const;
    /// The bus with the base name of `name`, which may be that of an index, a slice or the base
    /// itself; null when absent. Of two buses with one base name the newer one is found.
    Bus *GetParentBus(char const *name) const;
    /// A walk over the signals in order, valid as long as the netlist. It sees later additions,
    /// removals and sorting.
    Iterator<Signal *> GetSignalIterator() const;
    /// The same over the instances.
    Iterator<Instance *> GetInstanceIterator() const;
    /// The same over the components.
    Iterator<Component *> GetComponentIterator() const;
    /// The array of the signals for a walk that is done at once: it is valid until the next Remove
    /// and until the next line that a model runs. In a netlist of which no iterator was ever asked
    /// for, removals are faster.
    PtrArray<Signal *> const &GetSignals() const;
    /// The same for the instances.
    PtrArray<Instance *> const &GetInstances() const;
    /// The same for the components.
    PtrArray<Component *> const &GetComponents() const;
    /// Empties `found` and fills it with the instances of a component, in order. Null gives none.
    /// It walks over all instances.
    void GetInstances(Component const *component, PtrArray<Instance *> &found) const;
    /// The same for the component of a name; none if it is absent.
    void GetInstances(char const *componentName, PtrArray<Instance *> &found) const;
    /// Sorts signals by port polarity (none, in, out, inout) and name, components and instances by
    /// name, and the pins of each instance by polarity and name. Names are in natural order: case
    /// is ignored, and runs of digits compare as numbers, so that A2 comes before A10.
    void SortNetlist();

    // Measures, for the columns of the text: the greatest length in characters, 0 for none. The
    // iterators are rewound and left at their end.

    /// The longest base name of pins.
    static int GetLongestPinName(Iterator<Pin *> &pins);
    /// The longest name of declared ports, where a bus counts by its base name.
    static int GetLongestPortName(Iterator<Signal *> &signals);
    /// The longest name of declared signals, ports among them, where a bus counts by its base name.
    static int GetLongestSignalName(Iterator<Signal *> &signals);
    /// Raises `longest` to the longest name of the holder's attributes, if that is longer. Null
    /// does nothing.
    static void GetLongestAttrName(AttributeHolder const *holder, int &longest);
    /// The longest name of the attributes of declared signals that are no ports, of instances and
    /// of their components. Null gives 0.
    static int GetLongestAttrName(Netlist const *netlist);

    // Passes, which make the netlist fit to be written. They change it for good. A second call in a
    // row finds nothing more to do.

    /// Gives a dummy signal to each out port that is read inside, each in port that is driven
    /// inside, and each out port with several drivers: VHDL forbids the first two (IEEE 1076-1993,
    /// 1.1.1.2 and 4.3.2), and several drivers meet on a net inside, not on the port. The
    /// connections move to the dummy, and one assignment joins port and dummy. Both writers call
    /// it.
    void CreateVhdlDummySignals();
    /// The part of it for in ports. Neither writer calls it; it is for clients.
    void CreateVerilogDummySignals();
    /// Gives each open input pin a signal of its own, INSTANCE_PIN_openSignal, since VHDL does not
    /// allow an open input without a default (IEEE 1076-1993, 1.1.1.2). Pins that are one bit of a
    /// range stay open. The signals do not list the pins.
    void ConnectOpenPinToDummy();
    /// Gives each component whose attribute "Level" is "ORVANE", in any case, an attribute BOX_TYPE
    /// of value BLACK_BOX with the synthesis option "ASSIGN", unless it has one. It marks the
    /// vendor's own cells for the synthesis tool.
    void SetBoxTypeAttribute();

private:
    friend class NetlistEdit;
    struct Record;

    void GetWiredOrOutputSignals(StringSet &names);
    void GetFeedBackSignals(bool outPortToInPin, StringSet &names);
    void AddDummySignals(bool portTakesDummy, StringSet &names);

    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
