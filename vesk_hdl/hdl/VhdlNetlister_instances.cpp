// The generic clauses and instance statements of the VHDL writer.

#include "vesk_hdl/hdl/VhdlNetlister.h"

#include <algorithm>
#include <limits>
#include <vector>

#include "vesk_hdl/hdl/Shared.h"
#include "vesk_hdl/hdl/Translate.h"
#include "vesk_hdl/hdl/VhdlStatements.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/CompoundWalk.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Netlist.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// Writes the association of one pin in a port map, whatever class of signal the pin is on. A
/// signal that cannot be associated as a whole becomes several associations with parts of the pin
/// (IEEE 1076-1993, 4.3.2.2).
class WritePortAssignmentVisitor : public SignalVisitor {
public:
    /// `portMap` separates the associations of all pins of the instance.
    WritePortAssignmentVisitor(Text const &pinName, ListSeparator &portMap, VhdlStatements &vhdl,
                               OutStream &out)
        : separator(portMap), statements(vhdl), stream(out) {
        SetFormal(pinName);
    }

    /// Sets the left side of the next association. A range of one bit is named by its index: D(3)
    /// for D(3:3).
    void SetFormal(Text const &name) {
        formal = name;
        formalIsPlain = !Bus::IsBusName(name);
        if (!formalIsPlain && Names::IsOneBitBus(name.View())) {
            formal = OneBit(name);
            formalIsPlain = true;
        }
    }

    void VisitScalarSignal(ScalarSignal *signal) override { AssociateBit(signal->GetNameRef()); }
    void VisitBusIndex(BusIndex *signal) override { AssociateBit(signal->GetNameRef()); }
    void VisitBus(Bus *bus) override { AssociateBus(bus->GetNameRef()); }

    void VisitBusSlice(BusSlice *slice) override {
        if (!slice->IsSameDirectionAsParent())
            return AssociateBits(slice->GetNameRef());
        Text const &name = slice->GetNameRef();
        BeginAssociation();
        WriteFormal();
        stream << "=>";
        if (IsOpenName(name.View()))
            WriteOrOpen(name);
        else
            statements.WriteBus(name);
    }

    /// Associates each member with its piece of the pin.
    void VisitCompoundBus(CompoundBus *compound) override {
        Pieces pieces(*this);
        WalkCompound(*compound, pieces);
    }

    /// One association with a signal of one bit. An empty name means that the pin is open.
    void AssociateBit(Text const &name) {
        BeginAssociation();
        Put(stream, formal, "=>");
        WriteOrOpen(name);
    }

    /// One association with a whole bus. An empty name means that the pin is open; the pin is then
    /// named without its range.
    void AssociateBus(Text const &name) {
        BeginAssociation();
        if (name.IsEmpty())
            stream << Object::GetBaseName(formal);
        else
            WriteFormal();
        stream << "=>";
        if (IsOpenName(name.View()))
            WriteOrOpen(name);
        else if (Names::IsOneBitBus(name.View()))
            stream << OneBit(name);
        else
            statements.WriteBus(name);
    }

private:
    /// Cuts the pin into pieces as wide as the members of a compound, one after the other from the
    /// left. A piece past the end of the pin has an empty name.
    class Pieces {
    public:
        explicit Pieces(WritePortAssignmentVisitor &toWrite) : associations(toWrite) {}

        void Enter(CompoundBus const &compound) {
            if (!levels.empty())
                Cut(widths.Get(compound));
            levels.push_back({associations.formal, 0});
        }
        void Leave(CompoundBus const &) { levels.pop_back(); }
        void Visit(Signal &member) {
            Cut(member.GetWidth());
            member.AcceptSignal(associations);
        }

    private:
        struct Level {
            Text whole;         ///< the part of the pin that the compound has
            long long position; ///< where the next piece begins in it, in bits
        };

        void Cut(int width) {
            Level &level = levels.back();
            associations.SetFormal(
                Bus::GetBusSliceName(level.whole, static_cast<int>(level.position), width));
            level.position =
                std::min<long long>(level.position + width, std::numeric_limits<int>::max());
        }

        WritePortAssignmentVisitor &associations;
        CompoundWidths widths;
        std::vector<Level> levels; ///< one for each compound of the path
    };

    /// A range against the direction of its bus is no legal slice (IEEE 1076-1993, 6.5): its bits
    /// are associated one by one.
    void AssociateBits(Text const &name) {
        Text const whole = formal;
        std::string_view base;
        Names::Bounds bounds;
        if (!Names::ParseBus(name.View(), base, bounds))
            return;
        for (unsigned int position = 0;; ++position) {
            if (!BusIndex::IsBusIndexName(whole))
                SetFormal(Bus::GetBusSliceName(whole, static_cast<int>(position), 1));
            AssociateBit(Names::BitName(base, bounds.IndexAt(position)));
            if (position == bounds.Distance())
                return;
        }
    }

    /// Required: a signal that is called "open" keeps the case of its name.
    void WriteOrOpen(Text const &name) {
        if (name.IsEmpty())
            stream << "open";
        else
            stream << name;
    }

    /// The name of the bit of a one-bit bus: D(3) for D(3:3).
    static Text OneBit(Text const &name) { return Bus::GetBusSliceName(name, 0, 1); }

    void BeginAssociation() { separator.Next(); }

    void WriteFormal() {
        if (formalIsPlain)
            stream << formal;
        else
            statements.WriteBus(formal);
    }

    ListSeparator &separator;
    Text formal;
    VhdlStatements &statements;
    OutStream &stream;
    bool formalIsPlain = true; ///< `formal` is written as it is, and not as a bus with a direction
};

} // namespace

namespace Vesk_Hdl {

/// The items of a generic clause.
struct VhdlNetlister::GenericItems {
    Attribute const *init = nullptr; ///< the macro's INIT, which is passed on
    PtrArray<Attribute *> syn;       ///< for simulation and synthesis
    PtrArray<Attribute *> nosyn;     ///< for simulation only

    void Add(Attribute *attr) { AddGeneric(attr, syn, nosyn); }
    bool IsEmpty() const { return !init && syn.IsEmpty() && nosyn.IsEmpty(); }
};

void VhdlNetlister::WriteGenericDeclarations(AttributeHolder const &holder) {
    WriteGenericMap(&holder, true);
}

void VhdlNetlister::WriteGenericAssociations(Instance const &instance, bool handsInitOn) {
    WriteInstanceGenericMap(&instance, false, handsInitOn);
}

void VhdlNetlister::WriteGenericMap(AttributeHolder const *holder, bool isDeclaration) {
    if (!holder || !holder->HasAttrs())
        return;
    GenericItems items;
    ForEach(holder->GetAttrIterator(), [&items](Attribute *attr) { items.Add(attr); });
    WriteGenericClause(items, isDeclaration);
}

/// The attributes of a component are defaults of its generics and no items of a map, except for
/// INIT in a macro.
void VhdlNetlister::WriteInstanceGenericMap(Instance const *instance, bool isDeclaration,
                                            bool macroNetlist) {
    if (!instance)
        return;
    GenericItems items;
    if (macroNetlist)
        items.init = instance->GetComponentAttr("INIT");
    if (instance->HasAttrs())
        ForEach(instance->GetAttrIterator(), [&items](Attribute *attr) {
            if (!items.init || !(attr->GetNameRef() == "INIT"))
                items.Add(attr);
        });
    WriteGenericClause(items, isDeclaration);
}

/// In a clause with both kinds of items, the separator after the last item for synthesis is between
/// the marks that synthesis tools skip: it is written when the next item comes. So simulators and
/// synthesis tools both read a well-formed list.
void VhdlNetlister::WriteGenericClause(GenericItems const &items, bool isDeclaration) {
    if (items.IsEmpty())
        return;
    bool const onlyNosyn = items.syn.IsEmpty() && !items.init;
    if (onlyNosyn)
        Put(*stream, Translate::VHDL_OFF, EOL);
    Put(*stream, (isDeclaration ? "generic" : "generic map"), "( ");
    // Both separators put the items into the column after "generic(".
    ListSeparator separator(*stream, isDeclaration ? ";" : ",", 9);
    if (items.init) {
        separator.Next();
        statements->WriteGenericMapInitAttr(items.init);
    }
    auto const writeItem = [&](Attribute const *attr) {
        separator.Next();
        if (isDeclaration)
            statements->WriteGenericMapAttrType(attr);
        else
            statements->WriteGenericMapAttr(attr);
    };
    ForEach(items.syn, writeItem);
    if (!items.nosyn.IsEmpty()) {
        if (!onlyNosyn)
            Put(*stream, EOL, Translate::VHDL_OFF, EOL);
        ForEach(items.nosyn, writeItem);
        if (!onlyNosyn)
            Put(*stream, EOL, Translate::VHDL_ON, EOL);
    }
    Put(*stream, ")", (isDeclaration ? ";" : ""), EOL);
    if (onlyNosyn)
        Put(*stream, Translate::VHDL_ON, EOL);
}

void VhdlNetlister::WriteInstance(Instance const *instance, HdlOptions const *options) {
    if (!instance)
        return;
    statements->WriteComment(instance);
    Put(*stream, instance->GetNameRef(), " : ", instance->GetComponentName(), EOL);
    WriteInstanceGenericMap(instance, false, options->macroNetlist);
    stream->Indent();
    Iterator<Pin *> const pins = instance->GetPinIterator();
    if (pins.HasMore()) {
        Put(*stream, "port", " ", "map", " (");
        // Required: the line end is part of the text of the separator, and not the operand.
        ListSeparator separator(*stream, options->portOnePerLine ? ",\n          " : ", ");
        ForEach(pins, [&](Pin const *pin) {
            WritePortAssignmentVisitor visitor(pin->GetNameRef(), separator, *statements, *stream);
            if (Signal *const signal = pin->GetSignal())
                signal->AcceptSignal(visitor);
            else if (pin->GetPinType() == Pin::PIN_BUS)
                visitor.AssociateBus("");
            else
                visitor.AssociateBit("");
        });
        *stream << ")";
    }
    Put(*stream, ";", EOL);
    stream->Unindent();
    *stream << EOL;
}

/// Leaves out an attribute that only repeats the component's: the assignment to the component
/// covers it.
void VhdlNetlister::WriteInstanceAttrAssignment(Instance const *instance,
                                                HdlOptions const *options) {
    if (!instance || !instance->HasAttrs())
        return;
    ForEach(instance->GetAttrIterator(), [&](Attribute const *attr) {
        if (!attr->IsSynAssigned())
            return;
        Attribute const *const inherited = instance->GetComponentAttr(attr->GetNameRef());
        if (!inherited || !(*attr == *inherited))
            statements->WriteAttrAssignment(attr, instance->GetNameRef(), "label",
                                            options->vhdlOption.useAttrType);
    });
}

} // namespace Vesk_Hdl
