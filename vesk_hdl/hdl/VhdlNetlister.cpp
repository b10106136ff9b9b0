// The VHDL writer. From WriteNetlist on it reads like the file that it writes.

#include "vesk_hdl/hdl/VhdlNetlister.h"

#include <unordered_map>
#include <unordered_set>

#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/Shared.h"
#include "vesk_hdl/hdl/Translate.h"
#include "vesk_hdl/hdl/VhdlStatements.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/ForEachAhead.h"
#include "vesk_hdl/text/basis/Functions.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// The statements of a netlister and its copies. The last of them deletes it.
struct SharedStatements : VhdlStatements {
    using VhdlStatements::VhdlStatements;
    int owners = 1;
};

/// Writes a port clause of an entity or component with an item for each object, in order.
template <class Objects, class Write>
void WritePortClause(OutStream &stream, Objects const &objects, Write writeItem) {
    Put(stream, "port", " ( ");
    ListSeparator separator(stream, "; ", 7); // the column after "port ("
    ForEachAhead(objects, [&](auto const *object) {
        separator.Next();
        writeItem(*object);
    });
    Put(stream, ");", EOL);
}

/// The instances that the declarations depend on: the first of each component and those with
/// attributes of their own. The others would add nothing to them, so that one walk over a million
/// instances is enough.
void FindRepresentatives(Netlist const *netlist, PtrArray<Instance *> &representatives) {
    std::unordered_set<Component const *> seen;
    Component const *last = nullptr;
    ForEachAhead(netlist->GetInstances(), [&](Instance *instance) {
        Component const *const component = instance->GetComponent();
        bool const isFirst = component != last && seen.insert(component).second;
        last = component;
        if (isFirst || instance->HasAttrs())
            representatives.Add(instance);
    });
}

Text BaseNameOf(Object const &object) { return Object::GetBaseName(object.GetNameRef()); }

} // namespace

namespace Vesk_Hdl {

VhdlNetlister::VhdlNetlister(OutStream &out) : statements(nullptr), stream(&out) {
    statements = new SharedStatements(out); // last: only the destructor deletes it
}

VhdlNetlister::VhdlNetlister(VhdlNetlister &other)
    : statements(other.statements), stream(other.stream), declaredAttrs(other.declaredAttrs) {
    ++static_cast<SharedStatements *>(statements)->owners;
}

VhdlNetlister::~VhdlNetlister() {
    auto *const shared = static_cast<SharedStatements *>(statements);
    if (--shared->owners == 0)
        delete shared;
}

void VhdlNetlister::WriteNetlist(Netlist *netlist, HdlOptions const *options) {
    if (!netlist || !options)
        return;
    HdlOptions::VhdlOption const &vhdl = options->vhdlOption;

    netlist->SortNetlist();
    netlist->CreateVhdlDummySignals();
    netlist->SetBoxTypeAttribute();
    if (!vhdl.openPin)
        netlist->ConnectOpenPinToDummy();

    Text const name = netlist->GetName();
    bool const isMacro = name.GetIndexOfString("MORVANE", Text::COMPARE_EXACT) != Basis::NOT_FOUND;
    options->macroNetlist = isMacro && InitDefined(netlist);

    if (options->writeHeader)
        HdlUtilities::WriteHeader(name, true, *options, *stream);
    statements->WriteComment(netlist);
    *stream << EOL;
    statements->WriteUserLibrary(vhdl.libraries);
    statements->WriteUseUserLibrary(vhdl.useLibraries);
    if (vhdl.useDefaultLibrary) {
        statements->WriteIEEELibrary();
        statements->WriteKorbalLibrary(false);
        *stream << EOL;
    }
    {
        SignalLists const signals(*netlist); // freed before the configuration needs as much memory
        WriteEntity(netlist, signals, options);
        WriteArchitecture(netlist, signals, options);
    }
    *stream << EOL;
    if (!vhdl.suppressConfiguration)
        WriteConfiguration(netlist);
    *stream << EOL;
}

/// Whether the macro takes INIT as a generic of its own, which it then passes on to its instances.
bool VhdlNetlister::InitDefined(AttributeHolder const *holder) {
    bool defined = false;
    if (holder && holder->HasAttrs())
        ForEach(holder->GetAttrIterator(), [&defined](Attribute const *attr) {
            defined |=
                attr->GetNameRef() == "INIT" && (attr->IsGenericSyn() || attr->IsGenericNoSyn());
        });
    return defined;
}

/// Required: an entity without ports has an empty port clause, unlike a component without pins.
void VhdlNetlister::WriteEntity(Netlist const *netlist, SignalLists const &signals,
                                HdlOptions const *options) {
    bool const useAttrType = options->vhdlOption.useAttrType;
    Put(*stream, "entity", " ", netlist->GetNameRef(), " ", "is", EOL);
    stream->Indent();
    WriteGenericMap(netlist, true);
    Iterator<Signal *> ports(&signals.ports);
    int const width = Netlist::GetLongestPortName(ports);
    WritePortClause(*stream, signals.ports, [&](Signal const &port) {
        statements->WritePortStatement(port.GetNameRef(), port.GetPortPolarity(), width);
    });
    ForEachAhead(ports, [&](Signal const *port) {
        if (!port->HasAttrs())
            return;
        statements->WriteAttrDeclaration(port, declaredAttrs, useAttrType, 0);
        statements->WriteAttrAssignment(port, BaseNameOf(*port), "signal", useAttrType);
    });
    stream->Unindent();
    Put(*stream, "end", " ", netlist->GetNameRef(), ";", EOL, EOL);
}

void VhdlNetlister::WriteArchitecture(Netlist const *netlist, SignalLists const &signals,
                                      HdlOptions const *options) {
    Put(*stream, "architecture", " BEHAVIORAL ", "of", " ", netlist->GetNameRef(), " ", "is", EOL);
    stream->Indent();
    Instances representatives;
    FindRepresentatives(netlist, representatives);
    WriteAttrDeclarations(signals.innerWithAttrs, representatives, options);
    Iterator<Signal *> all(&netlist->GetSignals());
    int const width = Netlist::GetLongestSignalName(all);
    ForEachAhead(all,
                 [&](Signal const *signal) { WriteSignalDeclaration(signal, options, width); });
    if (!options->vhdlOption.suppressComponent)
        WriteComponents(representatives, options);
    WriteSynthesisAttrAssignment(signals.innerWithAttrs, representatives, options);
    stream->Unindent();
    Put(*stream, "begin", EOL);
    stream->Indent();
    PutAssignments(Iterator<Signal *>(&signals.assigned), *statements, [] {});
    ForEachAhead(netlist->GetInstances(),
                 [&](Instance const *instance) { WriteInstance(instance, options); });
    stream->Unindent();
    Put(*stream, "end", " BEHAVIORAL;", EOL);
}

/// The attributes of ports were declared in the entity, and are declared once in a file: an
/// attribute declaration in an entity is visible in its architectures (IEEE 1076-1993, 10.2). The
/// width is that of Netlist::GetLongestAttrName, which would walk over all signals and instances.
void VhdlNetlister::WriteAttrDeclarations(PtrArray<Signal *> const &signals,
                                          Instances const &representatives,
                                          HdlOptions const *options) {
    bool const useAttrType = options->vhdlOption.useAttrType;
    auto const forEachHolder = [&](auto act) {
        ForEachAhead(signals, act);
        // At its later instances a component declares nothing more.
        std::unordered_set<Component const *> seen;
        ForEachAhead(representatives, [&](Instance const *instance) {
            Component const *const component = instance->GetComponent();
            if (component && component->HasAttrs() && seen.insert(component).second)
                act(component);
            act(instance);
        });
    };
    int width = 0;
    forEachHolder(
        [&width](AttributeHolder const *holder) { Netlist::GetLongestAttrName(holder, width); });
    forEachHolder([&](AttributeHolder const *holder) {
        statements->WriteAttrDeclaration(holder, declaredAttrs, useAttrType, width);
    });
}

void VhdlNetlister::WriteSignalDeclaration(Signal const *signal, HdlOptions const *, int width) {
    if (!signal || signal->GetPortPolarity() != Polarity::INVALID)
        return;
    if (signal->GetSignalType() == Signal::SIGNAL_BUS) {
        statements->WriteComment(signal);
        statements->WriteSignalVectorStatement(signal->GetNameRef(), width);
    } else if (signal->GetSignalType() == Signal::SIGNAL_SCALAR) {
        statements->WriteComment(signal);
        statements->WriteSignalStatement(signal->GetNameRef(), width);
    }
}

/// Writes each component once, at its first instance. A component without instances is not
/// declared.
void VhdlNetlister::WriteComponents(Instances const &representatives, HdlOptions const *options) {
    StringSet names;
    ForEachAhead(representatives, [&](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (!component || names.IContains(component->GetNameRef().View()))
            return;
        names.Add(component->GetNameRef());
        WriteComponent(component, options);
    });
}

void VhdlNetlister::WriteComponent(Component const *component, HdlOptions const *options) {
    if (!component)
        return;
    Iterator<Pin *> pins = component->GetPinIterator();
    statements->WriteComment(component);
    Put(*stream, "component", " ", component->GetNameRef(), EOL);
    stream->Indent();
    WriteGenericMap(component, true);
    if (pins.HasMore()) {
        int const width = Netlist::GetLongestPinName(pins);
        WritePortClause(*stream, pins, [&](Pin const &pin) {
            statements->WritePortStatement(pin.GetNameRef(), pin.GetPolarity(), width);
        });
    }
    stream->Unindent();
    Put(*stream, "end", " ", "component", ";", EOL);
    statements->WriteAttrAssignment(component, component->GetNameRef(), "component",
                                    options->vhdlOption.useAttrType);
    *stream << EOL;
}

void VhdlNetlister::WriteSynthesisAttrAssignment(PtrArray<Signal *> const &signals,
                                                 Instances const &representatives,
                                                 HdlOptions const *options) {
    ForEachAhead(signals, [&](Signal const *signal) {
        statements->WriteAttrAssignment(signal, BaseNameOf(*signal), "signal",
                                        options->vhdlOption.useAttrType);
    });
    ForEachAhead(representatives,
                 [&](Instance const *instance) { WriteInstanceAttrAssignment(instance, options); });
}

/// A configuration binds each instance for simulation. Synthesis tools do not read it, so that it
/// is always between the marks that they skip.
void VhdlNetlister::WriteConfiguration(Netlist const *netlist) {
    Text const &name = netlist->GetNameRef();
    // One walk finds the instances of all components, each in order; Netlist::GetInstances would
    // walk for each component.
    std::unordered_map<Component const *, PtrArray<Instance *>> instances;
    ForEachAhead(netlist->GetInstances(), [&instances](Instance *instance) {
        if (Component const *const component = instance->GetComponent())
            instances[component].Add(instance);
    });

    Put(*stream, Translate::VHDL_OFF, EOL);
    Put(*stream, "configuration", " ", "CFG_", name, " ", "of", "  ", name, " ", "is", EOL);
    stream->Indent();
    Put(*stream, "for", " ", "BEHAVIORAL", EOL);
    stream->Indent();
    ForEach(netlist->GetComponents(), [&](Component const *component) {
        auto const found = instances.find(component);
        if (found != instances.end())
            WriteConfigurationItem(component, found->second);
    });
    stream->Unindent();
    Put(*stream, "end", " ", "for", ";", EOL);
    stream->Unindent();
    Put(*stream, "end", " ", "CFG_", name, ";", EOL);
    Put(*stream, Translate::VHDL_ON, EOL);
}

/// Cells of the vendor's library are not configured: the library has their models.
void VhdlNetlister::WriteConfigurationItem(Component const *component,
                                           PtrArray<Instance *> const &instances) {
    if (!component || instances.IsEmpty())
        return;
    Attribute const *const level = component->GetAttr("Level");
    if (level && Basis::stricmp(level->GetValueString(), "ORVANE") == 0)
        return;
    Put(*stream, "for", " ");
    ListSeparator separator(*stream, ", ");
    ForEachAhead(instances, [&](Instance const *instance) {
        separator.Next();
        *stream << instance->GetNameRef();
    });
    Put(*stream, " : ", component->GetNameRef(), EOL);
    stream->Indent();
    Put(*stream, "use", " ", "configuration", " ", "WORK.CFG_", component->GetNameRef(), ";", EOL);
    stream->Unindent();
    Put(*stream, "end", " ", "for", ";", EOL);
}

} // namespace Vesk_Hdl
