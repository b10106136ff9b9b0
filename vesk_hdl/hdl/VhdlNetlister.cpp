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

/// The statements of a netlister and its copies, which the last of them deletes.
struct SharedStatements : VhdlStatements {
    using VhdlStatements::VhdlStatements;
    int owners = 1;
};

/// A port clause of an entity or component: the caller writes the items.
class PortClause {
public:
    explicit PortClause(OutStream &out) : stream(out) { Put(stream, "port", " ( "); }
    /// Ends the item before, if there is one, and begins the next line under it.
    void NextItem() {
        stream << separator;
        if (*separator)
            Put(stream, EOL, "       ");
        separator = "; ";
    }
    void End() { Put(stream, ");", EOL); }

private:
    OutStream &stream;
    char const *separator = "";
};

/// The instances that the declarations need: the first of each component and those with attributes
/// of their own. The others would add nothing, so that one walk over a million of them is enough.
void FindTelling(Netlist const *netlist, PtrArray<Instance *> &telling) {
    std::unordered_set<Component const *> seen;
    Component const *last = nullptr;
    ForEachAhead(netlist->GetInstances(), [&](Instance *instance) {
        Component const *const component = instance->GetComponent();
        bool const isFirst = component != last && seen.insert(component).second;
        last = component;
        if (isFirst || instance->HasAttrs())
            telling.Add(instance);
    });
}

Text BaseNameOf(Object const &object) { return Object::GetBaseName(object.GetNameRef()); }

} // namespace

namespace Vesk_Hdl {

VhdlNetlister::VhdlNetlister(OutStream &out) : statements(nullptr), stream(&out) {
    statements = new SharedStatements(out); // last: nobody but the destructor gives it back
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
    WriteEntity(netlist, options);
    WriteArchitecture(netlist, options);
    *stream << EOL;
    if (!vhdl.suppressConfiguration)
        WriteConfiguration(netlist);
    *stream << EOL;
}

/// Whether the macro takes INIT as a generic of its own, for its instances to be handed on.
bool VhdlNetlister::InitDefined(AttributeHolder const *holder) {
    bool defined = false;
    if (holder && holder->HasAttrs())
        ForEach(holder->GetAttrIterator(), [&defined](Attribute const *attr) {
            defined |=
                attr->GetNameRef() == "INIT" && (attr->IsGenericSyn() || attr->IsGenericNoSyn());
        });
    return defined;
}

void VhdlNetlister::WriteEntity(Netlist const *netlist, HdlOptions const *options) {
    if (!netlist)
        return;
    SignalLists const signals(*netlist);
    bool const useAttrType = options->vhdlOption.useAttrType;
    Put(*stream, "entity", " ", netlist->GetNameRef(), " ", "is", EOL);
    stream->Indent();
    WriteGenericMap(netlist, true);
    Iterator<Signal *> ports(&signals.ports);
    int const width = Netlist::GetLongestPortName(ports);
    PortClause clause(*stream);
    ForEachAhead(ports, [&](Signal const *port) {
        clause.NextItem();
        statements->WritePortStatement(port->GetNameRef(), port->GetPortPolarity(), width);
    });
    clause.End();
    ForEachAhead(ports, [&](Signal const *port) {
        if (!port->HasAttrs())
            return;
        statements->WriteAttrDeclaration(port, declaredAttrs, useAttrType, 0);
        statements->WriteAttrAssignment(port, BaseNameOf(*port), "signal", useAttrType);
    });
    stream->Unindent();
    Put(*stream, "end", " ", netlist->GetNameRef(), ";", EOL, EOL);
}

void VhdlNetlister::WriteArchitecture(Netlist const *netlist, HdlOptions const *options) {
    Put(*stream, "architecture", " BEHAVIORAL ", "of", " ", netlist->GetNameRef(), " ", "is", EOL);
    stream->Indent();
    Instances telling;
    FindTelling(netlist, telling);
    SignalLists const signals(*netlist);
    WriteAttrDeclarations(signals.innerWithAttrs, telling, options);
    Iterator<Signal *> all(&netlist->GetSignals());
    int const width = Netlist::GetLongestSignalName(all);
    ForEachAhead(all,
                 [&](Signal const *signal) { WriteSignalDeclaration(signal, options, width); });
    if (!options->vhdlOption.suppressComponent)
        WriteComponents(telling, options);
    WriteSynthesisAttrAssignment(signals.innerWithAttrs, telling, options);
    stream->Unindent();
    Put(*stream, "begin", EOL);
    stream->Indent();
    WriteAssignments(signals.assigned);
    ForEachAhead(netlist->GetInstances(),
                 [&](Instance const *instance) { WriteInstance(instance, options); });
    stream->Unindent();
    Put(*stream, "end", " BEHAVIORAL;", EOL);
}

/// The attributes of ports were declared in the entity. The width is that of
/// Netlist::GetLongestAttrName, which would walk over all signals and instances.
void VhdlNetlister::WriteAttrDeclarations(PtrArray<Signal *> const &signals,
                                          Instances const &telling, HdlOptions const *options) {
    bool const useAttrType = options->vhdlOption.useAttrType;
    auto const forEachHolder = [&](auto act) {
        ForEachAhead(signals, act);
        // A component declares nothing more at its later instances.
        std::unordered_set<Component const *> seen;
        ForEachAhead(telling, [&](Instance const *instance) {
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

/// Each component once, at its first instance.
void VhdlNetlister::WriteComponents(Instances const &telling, HdlOptions const *options) {
    StringSet names;
    ForEachAhead(telling, [&](Instance const *instance) {
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
        PortClause ports(*stream);
        ForEach(pins, [&](Pin const *pin) {
            ports.NextItem();
            statements->WritePortStatement(pin->GetNameRef(), pin->GetPolarity(), width);
        });
        ports.End();
    }
    stream->Unindent();
    Put(*stream, "end", " ", "component", ";", EOL);
    statements->WriteAttrAssignment(component, component->GetNameRef(), "component",
                                    options->vhdlOption.useAttrType);
    *stream << EOL;
}

void VhdlNetlister::WriteSynthesisAttrAssignment(PtrArray<Signal *> const &signals,
                                                 Instances const &telling,
                                                 HdlOptions const *options) {
    ForEachAhead(signals, [&](Signal const *signal) {
        statements->WriteAttrAssignment(signal, BaseNameOf(*signal), "signal",
                                        options->vhdlOption.useAttrType);
    });
    ForEachAhead(telling,
                 [&](Instance const *instance) { WriteInstanceAttrAssignment(instance, options); });
}

/// Constants first, then what is assigned from another signal.
void VhdlNetlister::WriteAssignments(PtrArray<Signal *> const &signals) {
    ForEachAhead(signals, [&](Signal const *signal) {
        if (!signal->HasConstantValue())
            return;
        statements->WriteConstantSignalAssignment(signal->GetNameRef(), IsOneDigit(*signal),
                                                  signal->GetConstantValue());
    });
    ForEachAhead(signals, [&](Signal const *target) {
        ForEach(target->GetSignalIterator(), [&](Signal const *source) {
            statements->WriteSignalAssignment(target->GetNameRef(), source->GetNameRef());
        });
    });
}

void VhdlNetlister::WriteConfiguration(Netlist const *netlist) {
    Text const &name = netlist->GetNameRef();
    // One walk gives each component its instances, in order.
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

/// Primitives of the vendor's library are not configured.
void VhdlNetlister::WriteConfigurationItem(Component const *component,
                                           PtrArray<Instance *> const &instances) {
    if (!component || instances.IsEmpty())
        return;
    Attribute const *const level = component->GetAttr("Level");
    if (level && Basis::stricmp(level->GetValueString(), "ORVANE") == 0)
        return;
    Put(*stream, "for", " ");
    char const *separator = "";
    ForEachAhead(instances, [&](Instance const *instance) {
        Put(*stream, separator, instance->GetNameRef());
        separator = ", ";
    });
    Put(*stream, " : ", component->GetNameRef(), EOL);
    stream->Indent();
    Put(*stream, "use", " ", "configuration", " ", "WORK.CFG_", component->GetNameRef(), ";", EOL);
    stream->Unindent();
    Put(*stream, "end", " ", "for", ";", EOL);
}

} // namespace Vesk_Hdl
