#pragma once

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"
#include "vesk_hdl/text/StringSet.h"

namespace Vesk_Hdl {

class HdlOptions;
class OutStream;
class VhdlStatements;
struct SignalLists;

/// Writes one netlist as one structural VHDL file (IEEE 1076-1993): library clauses, an entity, an
/// architecture named BEHAVIORAL and a configuration. It decides what is written and in which
/// order; VhdlStatements knows the characters.
///
/// Sources: VhdlNetlister.cpp reads from top to bottom like the file that it writes;
/// VhdlNetlister_instances.cpp has the generic clauses and instance statements.
class VESK_HDL_API VhdlNetlister {
public:
    /// A writer to a stream, which is not owned and must outlive the netlister.
    VhdlNetlister(OutStream &stream);
    /// A writer to the same stream, which takes over the set of attributes that are declared so
    /// far. Its argument is not const: that is part of the interface.
    VhdlNetlister(VhdlNetlister &other);
    /// Leaves the stream open and does not flush it.
    ~VhdlNetlister();
    VhdlNetlister &operator=(VhdlNetlister const &) = delete;

    /// Rewrites the netlist for good, so that the text will be legal, and writes it: sorts it,
    /// makes dummy signals, marks the vendor's cells (see the passes of Netlist), ties open inputs
    /// if the option `openPin` is false, then writes the file. All rewriting is done before the
    /// first text. Sets `macroNetlist` of the options. A null netlist or null options write
    /// nothing.
    ///
    /// One netlister writes one file: a second call takes the attributes that the first one
    /// declared as declared. Nothing is reported: the stream knows whether its text arrived. An
    /// exception of the stream's guard passes through.
    void WriteNetlist(Netlist *netlist, HdlOptions const *options);

    // Pieces of that file, each for one object alone; of an object without generics nothing. They
    // change nothing, so that a client can look at a piece before it writes.

    /// The generic clause of the entity, for a netlist, or of a component's declaration.
    void WriteGenericDeclarations(AttributeHolder const &holder);
    /// The generic map of an instance. With `handsInitOn` it gets the macro's INIT in place of its
    /// own, if its component has one.
    void WriteGenericAssociations(Instance const &instance, bool handsInitOn);

private:
    void WriteEntity(Netlist const *netlist, SignalLists const &signals, HdlOptions const *options);
    void WriteArchitecture(Netlist const *netlist, SignalLists const &signals,
                           HdlOptions const *options);
    using Instances = PtrArray<Instance *>;
    void WriteAttrDeclarations(PtrArray<Signal *> const &signals, Instances const &representatives,
                               HdlOptions const *options);
    void WriteSignalDeclaration(Signal const *signal, HdlOptions const *options, int width);
    void WriteComponents(Instances const &representatives, HdlOptions const *options);
    void WriteComponent(Component const *component, HdlOptions const *options);
    void WriteSynthesisAttrAssignment(PtrArray<Signal *> const &signals,
                                      Instances const &representatives, HdlOptions const *options);
    void WriteConfiguration(Netlist const *netlist);
    void WriteConfigurationItem(Component const *component, PtrArray<Instance *> const &instances);
    bool InitDefined(AttributeHolder const *holder);

    void WriteGenericMap(AttributeHolder const *holder, bool isDeclaration);
    void WriteInstanceGenericMap(Instance const *instance, bool isDeclaration, bool macroNetlist);
    struct GenericItems;
    void WriteGenericClause(GenericItems const &items, bool isDeclaration);
    void WriteInstance(Instance const *instance, HdlOptions const *options);
    void WriteInstanceAttrAssignment(Instance const *instance, HdlOptions const *options);

    VhdlStatements *statements; ///< shared with copies; the last of them deletes it
    OutStream *stream;          ///< not owned
    StringSet declaredAttrs;    ///< declared in this file so far, by entity and architecture alike
};

} // namespace Vesk_Hdl
