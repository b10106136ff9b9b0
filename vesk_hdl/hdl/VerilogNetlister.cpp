// The Verilog writer. After the visitor of a pin connection it reads like the file that it writes.

#include "vesk_hdl/hdl/VerilogNetlister.h"

#include <unordered_map>
#include <vector>

#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/Shared.h"
#include "vesk_hdl/hdl/Translate.h"
#include "vesk_hdl/hdl/VerilogStatements.h"
#include "vesk_hdl/netlist/CompoundWalk.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/ForEachAhead.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

using VerilogOption = HdlOptions::VerilogOption;

/// Separates ports or pins: on one line, or each in the column of the first one.
ListSeparator PortSeparator(OutStream &stream, HdlOptions const &options, std::size_t column) {
    return options.portOnePerLine ? ListSeparator(stream, ", ", column)
                                  : ListSeparator(stream, ", ");
}

/// Writes the signal side of a pin connection. A signal that is called "open" leaves the brackets
/// empty, which is an open pin in Verilog (IEEE 1364-1995, 12.3.4).
class WriteSignalVisitor : public SignalVisitor {
public:
    WriteSignalVisitor(OutStream &out, VerilogStatements const &verilog)
        : stream(out), statements(verilog) {}

    void VisitScalarSignal(ScalarSignal *signal) override {
        if (!IsOpenName(signal->GetNameRef().View()))
            stream << signal->GetNameRef();
    }
    /// A part-select of one bit, D[3:3], is legal but written as the bit that it is.
    void VisitBus(Bus *bus) override {
        Text name = bus->GetName();
        if (bus->GetWidth() == 1 && Bus::IsBusName(name))
            name = Bus::GetBusSliceName(name, 0, 1);
        WriteBracketed(*bus, name);
    }
    void VisitBusSlice(BusSlice *slice) override { WriteBracketed(*slice, slice->GetName()); }
    void VisitBusIndex(BusIndex *index) override { WriteBracketed(*index, index->GetName()); }
    void VisitCompoundBus(CompoundBus *compound) override {
        Concatenation concatenation(stream, *this);
        WalkCompound(*compound, concatenation);
    }

private:
    /// {first, second}; nothing for a compound without members, since an empty concatenation is
    /// illegal.
    class Concatenation {
    public:
        Concatenation(OutStream &out, SignalVisitor &toWrite) : stream(out), members(toWrite) {}

        void Enter(CompoundBus const &compound) {
            if (!separators.empty())
                separators.back().Next();
            separators.emplace_back(stream, ", ");
            if (compound.GetSize() > 0)
                stream << "{";
        }
        void Leave(CompoundBus const &compound) {
            separators.pop_back();
            if (compound.GetSize() > 0)
                stream << "}";
        }
        void Visit(Signal &member) {
            separators.back().Next();
            member.AcceptSignal(members);
        }

    private:
        OutStream &stream;
        SignalVisitor &members;
        std::vector<ListSeparator> separators; ///< one for each compound of the path
    };

    /// The brackets are replaced and the bounds not read: required, so that they keep their
    /// spelling.
    void WriteBracketed(Signal const &signal, Text name) {
        if (IsOpenName(signal.GetNameRef().View()))
            return;
        statements.NormalizeBusName(name);
        stream << name;
    }

    OutStream &stream;
    VerilogStatements const &statements;
};

bool IsDeclaredWire(Signal const &signal) {
    return !signal.IsPort() && signal.IsNeededToDeclared();
}

} // namespace

namespace Vesk_Hdl {

/// The attributes of a component that may be written at its instances. They are collected once for
/// each component: one with many attributes that are never written may have as many instances.
struct VerilogNetlister::ComponentAttrs {
    PtrArray<Attribute *> synthesis; ///< the first attribute of each name, if it is written
    PtrArray<Attribute *> generics; ///< the generics, and INIT, which a macro passes on in any case

    explicit ComponentAttrs(Component const *component) {
        if (!component || !component->HasAttrs())
            return;
        IStringPtrMap<Attribute *> names;
        ForEach(component->GetAttrIterator(), [&](Attribute *attr) {
            bool const isFirst = !names.Contains(attr->GetNameRef());
            if (isFirst)
                names.Add(attr->GetNameRef(), attr);
            if (isFirst && attr->IsSynAssigned())
                synthesis.Add(attr);
            if (attr->IsGenericSyn() || attr->IsGenericNoSyn() || attr->GetNameRef() == "INIT")
                generics.Add(attr);
        });
    }
};

VerilogNetlister::VerilogNetlister(OutStream &out)
    : statements(std::make_unique<VerilogStatements>(out)), stream(&out) {}
VerilogNetlister::~VerilogNetlister() = default;

void VerilogNetlister::WriteNetlist(Netlist *netlist, HdlOptions const &options) {
    if (!netlist)
        return;
    netlist->SortNetlist();
    netlist->CreateVhdlDummySignals(); // the VHDL pass, so that both files describe one structure
    SetNameCase(netlist, options);

    Text const name = netlist->GetName();
    auto const holds = [&name](char const *text) {
        return name.GetIndexOfString(text, Text::COMPARE_EXACT) != Basis::NOT_FOUND;
    };
    options.macroNetlist = (holds("MORVANE") || holds("HORVANE")) && InitDefined(netlist);

    if (options.writeHeader)
        HdlUtilities::WriteHeader(name, false, options, *stream);
    statements->WriteComment(netlist);
    statements->WriteIncludePath(options.verilogOption.includes);
    statements->WriteTimeScale("1ns", "1ps");
    *stream << EOL;
    SignalLists const signals(*netlist);
    Iterator<Signal *> const ports(&signals.ports);
    WriteModulelAndPorts(name, ports, options);
    stream->Indent();
    WriteParameters(netlist);
    WritePortDeclarations(ports, options);
    WriteSignalDeclarations(Iterator<Signal *>(&netlist->GetSignals()), options);
    WriteSignalAssignments(Iterator<Signal *>(&signals.assigned));
    WriteInstances(Iterator<Instance *>(&netlist->GetInstances()), options);
    stream->Unindent();
    Put(*stream, "endmodule", EOL);
}

/// Renames for good. Objects are still found by their former names, whose case does not matter.
/// Pins and attributes keep theirs: they have to match what is declared elsewhere.
void VerilogNetlister::SetNameCase(Netlist *netlist, HdlOptions const &options) {
    auto const setCase = [this](auto const &objects, VerilogOption::CaseType type) {
        if (type != VerilogOption::CASE_DEFAULT)
            ForEachAhead(objects, [this, type](Object *object) {
                SetNameCase(object, type == VerilogOption::CASE_UPPER);
            });
    };
    setCase(netlist->GetSignals(), options.verilogOption.signalCase);
    setCase(netlist->GetComponents(), options.verilogOption.componentCase);
    setCase(netlist->GetInstances(), options.verilogOption.instanceCase);
}

void VerilogNetlister::SetNameCase(Object *object, bool upper) {
    Text name = object->GetName();
    if (upper)
        name.MakeUpper();
    else
        name.MakeLower();
    object->SetName(name);
}

/// Whether the macro takes INIT as a parameter of its own. Required: unlike in VHDL, one of option
/// "NOSYN" does not count.
bool VerilogNetlister::InitDefined(Netlist const *netlist) {
    bool defined = false;
    if (netlist && netlist->HasAttrs())
        ForEach(netlist->GetAttrIterator(), [&defined](Attribute const *attr) {
            defined |= attr->IsGenericSyn() && attr->GetNameRef() == "INIT";
        });
    return defined;
}

void VerilogNetlister::GetGenericAttrs(Iterator<Attribute *> &attrs, PtrArray<Attribute *> &syn,
                                       PtrArray<Attribute *> &nosyn) {
    attrs.Rewind();
    ForEach(attrs, [&](Attribute *attr) { AddGeneric(attr, syn, nosyn); });
}

void VerilogNetlister::WriteModulelAndPorts(Text const &name, Iterator<Signal *> const &signals,
                                            HdlOptions const &options) {
    Put(*stream, "module", " ", name, "(");
    ListSeparator separator = PortSeparator(*stream, options, name.GetLength() + 8);
    ForEachAhead(signals, [&](Signal const *signal) {
        if (!IsDeclaredPort(*signal))
            return;
        separator.Next();
        bool const isBus = signal->GetSignalType() == Signal::SIGNAL_BUS;
        *stream << (isBus ? Object::GetBaseName(signal->GetNameRef()) : signal->GetName());
    });
    Put(*stream, ");", EOL, EOL);
}

/// Writes items as lines; those for simulation only are between marks that synthesis tools skip.
template <class WriteItem>
void VerilogNetlister::WriteGenerics(PtrArray<Attribute *> const &syn,
                                     PtrArray<Attribute *> const &nosyn, WriteItem writeItem) {
    auto const writeLine = [this, &writeItem](Attribute const *attr) {
        writeItem(attr);
        Put(*stream, ";", EOL);
    };
    ForEach(syn, writeLine);
    if (nosyn.IsEmpty())
        return;
    Put(*stream, Translate::VERILOG_OFF, EOL);
    ForEach(nosyn, writeLine);
    Put(*stream, Translate::VERILOG_ON, EOL);
}

void VerilogNetlister::WriteParameters(Netlist const *netlist) {
    if (!netlist || !netlist->HasAttrs())
        return;
    PtrArray<Attribute *> syn;
    PtrArray<Attribute *> nosyn;
    Iterator<Attribute *> attrs = netlist->GetAttrIterator();
    GetGenericAttrs(attrs, syn, nosyn);
    WriteGenerics(syn, nosyn,
                  [this](Attribute const *attr) { statements->WriteParameterStatement(attr); });
    if (!syn.IsEmpty() || !nosyn.IsEmpty())
        *stream << EOL;
}

/// Ends a statement. Its attributes come before the ";" or on lines after it, as the synthesis tool
/// reads them.
template <class WriteAttrs>
void VerilogNetlister::EndWithAttrs(HdlOptions const &options, WriteAttrs writeAttrs) {
    bool const before = options.verilogOption.IsSemiColonWrittenBeforeAttr();
    if (before)
        Put(*stream, ";", EOL);
    writeAttrs();
    if (!before)
        Put(*stream, ";", EOL);
}

/// Required: the empty line after the declarations is written even if there are none.
void VerilogNetlister::WriteDeclarations(Iterator<Signal *> const &signals,
                                         bool (VerilogNetlister::*write)(Signal const *),
                                         HdlOptions const &options) {
    ForEachAhead(signals, [&](Signal const *signal) {
        if ((this->*write)(signal))
            EndWithAttrs(options, [&] { WriteSynthesisAttr(signal, options); });
    });
    *stream << EOL;
}

void VerilogNetlister::WritePortDeclarations(Iterator<Signal *> const &signals,
                                             HdlOptions const &options) {
    WriteDeclarations(signals, &VerilogNetlister::WritePortDeclaration, options);
}

bool VerilogNetlister::WritePortDeclaration(Signal const *signal) {
    if (!signal || !IsDeclaredPort(*signal))
        return false;
    statements->WriteComment(signal);
    statements->WritePortDeclaration(signal->GetNameRef(), signal->GetPortPolarity());
    return true;
}

void VerilogNetlister::WriteSignalDeclarations(Iterator<Signal *> const &signals,
                                               HdlOptions const &options) {
    WriteDeclarations(signals, &VerilogNetlister::WriteSignalDeclaration, options);
}

bool VerilogNetlister::WriteSignalDeclaration(Signal const *signal) {
    if (!signal || !IsDeclaredWire(*signal))
        return false;
    statements->WriteComment(signal);
    statements->WriteSignalDeclaration(signal->GetNameRef());
    return true;
}

void VerilogNetlister::WriteSignalAssignments(Iterator<Signal *> const &signals) {
    PutAssignments(signals, *statements, [this] { Put(*stream, ";", EOL); });
}

void VerilogNetlister::WriteInstances(Iterator<Instance *> const &instances,
                                      HdlOptions const &options) {
    std::unordered_map<Component const *, ComponentAttrs> attrs;
    ComponentAttrs const none(nullptr);
    ForEachAhead(instances, [&](Instance const *instance) {
        if (!WriteInstance(instance, options))
            return;
        Component const *const component = instance->GetComponent();
        ComponentAttrs const &inherited =
            component && component->HasAttrs()
                ? attrs.try_emplace(component, component).first->second
                : none;
        EndWithAttrs(options, [&] { WriteSynthesisAttr(instance, inherited, options); });
        WriteDefParam(instance, inherited, options);
    });
}

/// Writes an instance up to its ")". Required: the component's comment is repeated at each
/// instance, since Verilog has no declaration of the component in this file.
bool VerilogNetlister::WriteInstance(Instance const *instance, HdlOptions const &options) {
    if (!instance)
        return false;
    Text const componentName = instance->GetComponentName();
    Text const &instanceName = instance->GetNameRef();
    statements->WriteComment(instance->GetComponent());
    statements->WriteComment(instance);
    Put(*stream, componentName, " ", instanceName, " ", "(");
    ListSeparator separator =
        PortSeparator(*stream, options, componentName.GetLength() + instanceName.GetLength() + 3);
    WriteSignalVisitor visitor(*stream, *statements);
    ForEach(instance->GetPinIterator(), [&](Pin const *pin) {
        separator.Next();
        Put(*stream, ".", pin->GetBaseName(), "(");
        if (Signal *const signal = pin->GetSignal())
            signal->AcceptSignal(visitor);
        *stream << ")";
    });
    *stream << ")";
    return true;
}

void VerilogNetlister::WriteSynthesisAttr(Signal const *signal, HdlOptions const &options) {
    if (signal->HasAttrs())
        WriteSynthesisAttr(signal->GetAttrIterator(), Object::GetBaseName(signal->GetNameRef()),
                           options);
}

/// Writes the instance's attributes, then those of its component that it does not have itself:
/// Verilog can only attach them to the instance.
void VerilogNetlister::WriteSynthesisAttr(Instance const *instance, ComponentAttrs const &inherited,
                                          HdlOptions const &options) {
    PtrArray<Attribute *> merged;
    IStringPtrMap<Attribute *> names;
    if (instance->HasAttrs())
        ForEach(instance->GetAttrIterator(), [&](Attribute *attr) {
            merged.Add(attr);
            if (!inherited.synthesis.IsEmpty())
                names.Add(attr->GetNameRef(), attr);
        });
    ForEach(inherited.synthesis, [&](Attribute *attr) {
        if (!names.Contains(attr->GetNameRef()))
            merged.Add(attr);
    });
    if (!merged.IsEmpty())
        WriteSynthesisAttr(Iterator<Attribute *>(&merged), instance->GetNameRef(), options);
}

void VerilogNetlister::WriteSynthesisAttr(Iterator<Attribute *> const &attrs, char const *target,
                                          HdlOptions const &options) {
    switch (options.verilogOption.synthesisType) {
    case VerilogOption::SYNTHESIS_QRT:
        return statements->WriteQRTAttr(attrs, target);
    case VerilogOption::SYNTHESIS_EXEMPLAR:
        return statements->WriteExemplarAttr(attrs, target);
    case VerilogOption::SYNTHESIS_SYNPLICITY:
        return statements->WriteSynplicityAttr(attrs);
    case VerilogOption::SYNTHESIS_SYNOPSYS:
        return statements->WriteSynopsysAttr(attrs);
    case VerilogOption::SYNTHESIS_VERILOG2001:
        return; // required: this tool gets no attributes
    case VerilogOption::SYNTHESIS_PRECISION:
        return statements->WritePrecisionAttr(attrs, target);
    }
}

/// Writes the instance's generics, then those of its component that it does not have itself. In a
/// macro INIT is passed on from the macro's own parameter. Required: INIT is then left out of the
/// lines for synthesis, but not of those for simulation only.
void VerilogNetlister::WriteDefParam(Instance const *instance, ComponentAttrs const &inherited,
                                     HdlOptions const &options) {
    if (!instance->HasAttrs() && inherited.generics.IsEmpty())
        return;
    bool const macro = options.macroNetlist;
    Attribute const *init = nullptr;
    PtrArray<Attribute *> syn;
    PtrArray<Attribute *> nosyn;
    IStringPtrMap<Attribute *> names;

    // Whether the attribute is called INIT and the macro has found its INIT, which may be this one.
    auto const isInit = [&](Attribute const *attr) {
        bool const named = attr->GetNameRef() == "INIT";
        if (macro && named && !init)
            init = attr;
        return named && init;
    };
    if (instance->HasAttrs()) {
        Iterator<Attribute *> attrs = instance->GetAttrIterator();
        GetGenericAttrs(attrs, syn, nosyn);
        ForEach(attrs, [&](Attribute *attr) {
            if (!isInit(attr) && !inherited.generics.IsEmpty())
                names.Add(attr->GetNameRef(), attr);
        });
    }
    PtrArray<Attribute *> kept;
    ForEach(inherited.generics, [&](Attribute *attr) {
        if (!names.Contains(attr->GetNameRef()) && !isInit(attr))
            kept.Add(attr);
    });
    Iterator<Attribute *> keptAttrs(&kept);
    GetGenericAttrs(keptAttrs, syn, nosyn);

    Text const &name = instance->GetNameRef();
    if (init) {
        statements->WriteDefParamInitStatement(init, name);
        Put(*stream, ";", EOL);
    }
    PtrArray<Attribute *> others;
    ForEach(syn, [&](Attribute *attr) {
        if (attr != init)
            others.Add(attr);
    });
    WriteGenerics(others, nosyn,
                  [&](Attribute const *attr) { statements->WriteDefParamStatement(attr, name); });
}

} // namespace Vesk_Hdl
