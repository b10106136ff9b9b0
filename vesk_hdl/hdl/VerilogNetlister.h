#pragma once

#include <memory>

#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/text/PtrArray.h"

namespace Vesk_Hdl {

class OutStream;
class VerilogStatements;

/// Writes one netlist as one structural Verilog file (IEEE 1364-1995): a time scale and a module.
/// It decides what is written and in which order; VerilogStatements knows the characters.
/// VerilogNetlister.cpp reads from top to bottom like the file that it writes.
class VESK_HDL_API VerilogNetlister {
public:
    /// A writer to a stream, which is not owned and must outlive the netlister.
    VerilogNetlister(OutStream &stream);
    /// Leaves the stream open and does not flush it.
    ~VerilogNetlister();
    VerilogNetlister(VerilogNetlister const &) = delete;
    VerilogNetlister &operator=(VerilogNetlister const &) = delete;

    /// Rewrites the netlist for good and writes it: sorts it, makes dummy signals as for VHDL
    /// (Netlist::CreateVhdlDummySignals), gives names the case of the options, then writes the
    /// file. All rewriting is done before the first text. Sets `macroNetlist` of the options. Null
    /// writes nothing.
    ///
    /// Nothing is reported: the stream knows whether its text arrived. An exception of the stream's
    /// guard passes through.
    void WriteNetlist(Netlist *netlist, HdlOptions const &options);

private:
    struct ComponentAttrs;

    void SetNameCase(Netlist *netlist, HdlOptions const &options);
    void SetNameCase(Object *object, bool upper);
    bool InitDefined(Netlist const *netlist);
    void GetGenericAttrs(Iterator<Attribute *> &attrs, PtrArray<Attribute *> &syn,
                         PtrArray<Attribute *> &nosyn);

    void WriteModulelAndPorts(Basis::StringBase<char> const &name,
                              Iterator<Signal *> const &signals, HdlOptions const &options);
    void WriteParameters(Netlist const *netlist);
    void WriteDeclarations(Iterator<Signal *> const &signals,
                           bool (VerilogNetlister::*write)(Signal const *),
                           HdlOptions const &options);
    void WritePortDeclarations(Iterator<Signal *> const &signals, HdlOptions const &options);
    bool WritePortDeclaration(Signal const *signal);
    void WriteSignalDeclarations(Iterator<Signal *> const &signals, HdlOptions const &options);
    bool WriteSignalDeclaration(Signal const *signal);
    void WriteSignalAssignments(Iterator<Signal *> const &signals);
    void WriteInstances(Iterator<Instance *> const &instances, HdlOptions const &options);
    bool WriteInstance(Instance const *instance, HdlOptions const &options);
    void WriteSynthesisAttr(Signal const *signal, HdlOptions const &options);
    void WriteSynthesisAttr(Instance const *instance, ComponentAttrs const &inherited,
                            HdlOptions const &options);
    void WriteSynthesisAttr(Iterator<Attribute *> const &attrs, char const *target,
                            HdlOptions const &options);
    void WriteDefParam(Instance const *instance, ComponentAttrs const &inherited,
                       HdlOptions const &options);
    template <class WriteAttrs> void EndWithAttrs(HdlOptions const &options, WriteAttrs writeAttrs);
    template <class WriteItem>
    void WriteGenerics(PtrArray<Attribute *> const &syn, PtrArray<Attribute *> const &nosyn,
                       WriteItem writeItem);

    std::unique_ptr<VerilogStatements> statements;
    OutStream *stream;
};

} // namespace Vesk_Hdl
