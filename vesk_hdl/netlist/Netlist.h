#pragma once

#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// A whole design: the owner of its components, instances and signals; its attributes are those of
/// the module.
///
/// Each of the three kinds stands in an array, which gives the order of all output, and in a map,
/// which finds by name whatever the case and the brackets. Buses are also found by their base name.
/// Sources: Netlist.cpp (contents), passes/Netlist_passes.cpp (the rewriting before a write).
class VESK_HDL_API Netlist : public Object, public AttributeHolder {
public:
    static char const DEFAULT_NETLIST_NAME[]; ///< "HDL_NETLIST"

    /// Null makes a netlist called "hdlNetlist".
    Netlist(char const *name);
    ~Netlist() override;
    ObjectType GetObjectType() const override;
    void AcceptObject(ObjectVisitor &visitor) override;
    /// Stores the name as it stands: a netlist's name is the one that is not rewritten.
    void SetName(char const *name) override;
    Netlist(Netlist const &) = delete;
    Netlist &operator=(Netlist const &) = delete;

    /// Null is stored as the empty string.
    void SetSourceFileName(char const *fileName);
    Basis::StringBase<char> GetSourceFileName() const;

    // Contents. Null is ignored throughout.

    /// Takes over the object. A name that is taken is not looked for: the newer object is then the
    /// one that is found, and both stay in the array.
    void Add(Signal *signal);
    void Add(Instance *instance);
    void Add(Component *component);
    /// Takes the object out and deletes it. The pins on a signal lose it; nothing else that points
    /// at the object is told: not its slices, links or compounds, nor a component's instances or
    /// the signals that list an instance's pins.
    void Remove(Signal *signal);
    void Remove(Instance *instance);
    void Remove(Component *component);
    /// The object of that name, rewritten first, in any case; null when absent. Null reads as
    /// empty.
    Signal *GetSignal(char const *name) const;
    Instance *GetInstance(char const *name) const;
    Component *GetComponent(char const *name) const;
    /// The bus with the base name of `name`, which may be an index, a slice or the base itself;
    /// null when absent.
    Bus *GetParentBus(char const *name) const;
    Iterator<Signal *> GetSignalIterator() const;
    Iterator<Instance *> GetInstanceIterator() const;
    Iterator<Component *> GetComponentIterator() const;
    /// The same arrays for a walk at once: valid until the next Remove, or the next line that a
    /// model runs. Removing objects from a netlist whose iterators nobody asked for is faster.
    PtrArray<Signal *> const &GetSignals() const;
    PtrArray<Instance *> const &GetInstances() const;
    PtrArray<Component *> const &GetComponents() const;
    /// Empties `found` and fills it with the instances of a component, in order. A walk over all
    /// instances.
    void GetInstances(Component const *component, PtrArray<Instance *> &found) const;
    void GetInstances(char const *componentName, PtrArray<Instance *> &found) const;
    /// Sorts signals by port polarity (none, in, out, inout) and name, components and instances by
    /// name, the pins of each instance by polarity and name. Names are in natural order: case is
    /// ignored, runs of digits compare as numbers.
    void SortNetlist();

    // Measures, for columns: the greatest length in characters, 0 for none. The iterators are
    // rewound and left at their end.

    /// Of the base names of pins.
    static int GetLongestPinName(Iterator<Pin *> &pins);
    /// Of the names of declared ports, a bus by its base name.
    static int GetLongestPortName(Iterator<Signal *> &signals);
    /// Of the names of declared signals, ports too, a bus by its base name.
    static int GetLongestSignalName(Iterator<Signal *> &signals);
    /// Raises `longest` to the longest attribute name of the holder; null does nothing.
    static void GetLongestAttrName(AttributeHolder const *holder, int &longest);
    /// Of the attributes of declared signals that are no ports, of instances and their components.
    static int GetLongestAttrName(Netlist const *netlist);

    // Passes, which make the netlist fit to be written. They change it for good.

    /// Gives a dummy signal to each out port that is read inside, each in port that is driven
    /// inside, and each out port with several drivers. The connections move to the dummy; one
    /// assignment joins port and dummy.
    void CreateVhdlDummySignals();
    /// The part of it that concerns in ports. Neither writer calls it.
    void CreateVerilogDummySignals();
    /// Gives each open input pin a signal of its own; index pins stay open.
    void ConnectOpenPinToDummy();
    /// Gives each component whose attribute "Level" is "ORVANE" an attribute BOX_TYPE of value
    /// BLACK_BOX, unless it has one.
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
