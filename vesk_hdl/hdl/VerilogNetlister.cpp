#include "vesk_hdl/hdl/VerilogNetlister.h"

#include <string>
#include <unordered_map>
#include <vector>

#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/Shared.h"
#include "vesk_hdl/hdl/Translate.h"
#include "vesk_hdl/hdl/VerilogStatements.h"
#include "vesk_hdl/netlist/CompoundWalk.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/ForEachAhead.h"
#include "vesk_hdl/text/basis/Ascii.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

using VerilogOption = HdlOptions::VerilogOption;

/// Separates the items of a list: on one line, or each under the first one.
class ListSeparator {
public:
    ListSeparator(OutStream &out, bool onePerLine, std::size_t column)
        : stream(out), isOnePerLine(onePerLine), padding(onePerLine ? column : 0, ' ') {}
    void Next() {
        if (!first)
            stream << ", ";
        if (!first && isOnePerLine)
            Put(stream, EOL, padding.c_str());
        first = false;
    }

private:
    OutStream &stream;
    bool isOnePerLine;
    std::string padding;
    bool first = true;
};

/// Writes the signal side of a pin connection.
class WriteSignalVisitor : public SignalVisitor {
public:
    WriteSignalVisitor(OutStream &out, VerilogStatements const &verilog)
        : stream(out), statements(verilog) {}

    void VisitScalarSignal(ScalarSignal *signal) override {
        if (!IsOpen(*signal))
            stream << signal->GetNameRef();
    }
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
    /// {first, second}; nothing for a compound without members.
    class Concatenation {
    public:
        Concatenation(OutStream &out, SignalVisitor &toWrite) : stream(out), members(toWrite) {}

        void Enter(CompoundBus const &compound) {
            if (!separators.empty())
                Separate();
            separators.push_back("");
            if (compound.GetSize() > 0)
                stream << "{";
        }
        void Leave(CompoundBus const &compound) {
            separators.pop_back();
            if (compound.GetSize() > 0)
                stream << "}";
        }
        void Visit(Signal &member) {
            Separate();
            member.AcceptSignal(members);
        }

    private:
        void Separate() {
            stream << separators.back();
            separators.back() = ", ";
        }

        OutStream &stream;
        SignalVisitor &members;
        std::vector<char const *> separators; ///< of each compound that is open
    };

    static bool IsOpen(Signal const &signal) {
        std::string_view const name = signal.GetNameRef().View();
        return name.empty() || Basis::Ascii::EqualIgnoringCase(name, "open");
    }

    void WriteBracketed(Signal const &signal, Text name) {
        if (IsOpen(signal))
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

/// The attributes of a component that may be written at its instances. They are collected once: a
/// component may have many that are never written, and as many instances.
struct VerilogNetlister::ComponentAttrs {
    PtrArray<Attribute *> synthesis; ///< of each name the first, if it is written
    PtrArray<Attribute *> generics;  ///< and INIT, which a macro hands on in any case

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
    netlist->CreateVhdlDummySignals(); // the VHDL pass, so that both languages get one structure
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

/// Only the names of signals, components and instances are touched.
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

/// Whether the macro takes INIT as a parameter of its own. Unlike in VHDL, one of option "NOSYN"
/// does not count: meant so.
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
    ForEach(attrs, [&](Attribute *attr) {
        if (attr->IsGenericSyn())
            syn.Add(attr);
        else if (attr->IsGenericNoSyn())
            nosyn.Add(attr);
    });
}

void VerilogNetlister::WriteModulelAndPorts(Text const &name, Iterator<Signal *> const &signals,
                                            HdlOptions const &options) {
    Put(*stream, "module", " ", name, "(");
    ListSeparator separator(*stream, options.portOnePerLine, name.GetLength() + 8);
    ForEachAhead(signals, [&](Signal const *signal) {
        if (!IsDeclaredPort(*signal))
            return;
        separator.Next();
        bool const isBus = signal->GetSignalType() == Signal::SIGNAL_BUS;
        *stream << (isBus ? Object::GetBaseName(signal->GetNameRef()) : signal->GetName());
    });
    Put(*stream, ");", EOL, EOL);
}

/// Writes items as lines, those for simulation only between translate marks.
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

/// Ends a statement, with its attributes inside it or behind it.
template <class WriteAttrs>
void VerilogNetlister::EndWithAttrs(HdlOptions const &options, WriteAttrs writeAttrs) {
    bool const before = options.verilogOption.IsSemiColonWrittenBeforeAttr();
    if (before)
        Put(*stream, ";", EOL);
    writeAttrs();
    if (!before)
        Put(*stream, ";", EOL);
}

void VerilogNetlister::WritePortDeclarations(Iterator<Signal *> const &signals,
                                             HdlOptions const &options) {
    ForEachAhead(signals, [&](Signal const *signal) {
        if (WritePortDeclaration(signal))
            EndWithAttrs(options, [&] { WriteSynthesisAttr(signal, options); });
    });
    *stream << EOL;
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
    ForEachAhead(signals, [&](Signal const *signal) {
        if (WriteSignalDeclaration(signal))
            EndWithAttrs(options, [&] { WriteSynthesisAttr(signal, options); });
    });
    *stream << EOL;
}

bool VerilogNetlister::WriteSignalDeclaration(Signal const *signal) {
    if (!signal || !IsDeclaredWire(*signal))
        return false;
    statements->WriteComment(signal);
    statements->WriteSignalDeclaration(signal->GetNameRef());
    return true;
}

/// Constants first, then what is assigned from another signal.
void VerilogNetlister::WriteSignalAssignments(Iterator<Signal *> const &signals) {
    ForEachAhead(signals, [this](Signal const *signal) {
        if (!signal->HasConstantValue())
            return;
        statements->WriteConstantSignalAssignment(signal->GetNameRef(), IsOneDigit(*signal),
                                                  signal->GetConstantValue());
        Put(*stream, ";", EOL);
    });
    ForEachAhead(signals, [this](Signal const *target) {
        ForEach(target->GetSignalIterator(), [this, target](Signal const *source) {
            statements->WriteSignalAssignment(target->GetNameRef(), source->GetNameRef());
            Put(*stream, ";", EOL);
        });
    });
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

/// The component's comment is repeated at each instance.
bool VerilogNetlister::WriteInstance(Instance const *instance, HdlOptions const &options) {
    if (!instance)
        return false;
    Text const componentName = instance->GetComponentName();
    Text const &instanceName = instance->GetNameRef();
    statements->WriteComment(instance->GetComponent());
    statements->WriteComment(instance);
    Put(*stream, componentName, " ", instanceName, " ", "(");
    ListSeparator separator(*stream, options.portOnePerLine,
                            componentName.GetLength() + instanceName.GetLength() + 3);
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

/// The instance's attributes, then those of its component that it does not have itself.
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
        return; // this tool gets no attributes
    case VerilogOption::SYNTHESIS_PRECISION:
        return statements->WritePrecisionAttr(attrs, target);
    }
}

/// The instance's generics, then those of its component that it does not have itself. In a macro
/// INIT is handed on instead of set. It is left out of the lines for synthesis but not of those
/// between the translate marks: meant so.
void VerilogNetlister::WriteDefParam(Instance const *instance, ComponentAttrs const &inherited,
                                     HdlOptions const &options) {
    if (!instance->HasAttrs() && inherited.generics.IsEmpty())
        return;
    bool const macro = options.macroNetlist;
    Attribute const *init = nullptr;
    PtrArray<Attribute *> syn;
    PtrArray<Attribute *> nosyn;
    IStringPtrMap<Attribute *> names;

    /// Whether the attribute is the macro's INIT, now or before.
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
