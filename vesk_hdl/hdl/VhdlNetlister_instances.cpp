// Generic clauses and instance statements of the VHDL writer, callee after caller.

#include "vesk_hdl/hdl/VhdlNetlister.h"

#include <algorithm>
#include <limits>
#include <vector>

#include "vesk_hdl/hdl/Pieces.h"
#include "vesk_hdl/hdl/Translate.h"
#include "vesk_hdl/hdl/VhdlStatements.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/CompoundWalk.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/basis/Ascii.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// Writes the association of one pin in a port map, whatever kind of signal the pin is on. A signal
/// that cannot be associated whole becomes several associations.
class WritePortAssignmentVisitor : public SignalVisitor {
public:
    /// `sharedSeparator` is that of the whole port map: what stands in front of the next
    /// association, empty before the first.
    WritePortAssignmentVisitor(Text const &pinName, char const *&sharedSeparator, char const *next,
                               VhdlStatements &vhdl, OutStream &out)
        : separator(sharedSeparator), nextSeparator(next), statements(vhdl), stream(out) {
        SetFormal(pinName);
    }

    /// What the next association names on its left: one bit of a range by its index.
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
        if (IsOpen(name))
            WriteOrOpen(name);
        else
            statements.WriteBus(name);
    }

    /// Each member takes its piece of the pin.
    void VisitCompoundBus(CompoundBus *compound) override {
        Pieces pieces(*this);
        WalkCompound(*compound, pieces);
    }

    /// A pin on no signal: a scalar or a bus without a name.
    void AssociateBit(Text const &name) {
        BeginAssociation();
        Put(stream, formal, "=>");
        WriteOrOpen(name);
    }

    void AssociateBus(Text const &name) {
        BeginAssociation();
        if (name.IsEmpty())
            stream << Object::GetBaseName(formal);
        else
            WriteFormal();
        stream << "=>";
        if (IsOpen(name))
            WriteOrOpen(name);
        else if (Names::IsOneBitBus(name.View()))
            stream << OneBit(name);
        else
            statements.WriteBus(name);
    }

private:
    /// Cuts the pin into the pieces that the members of a compound take, one after the other.
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
            Text whole;
            long long position; ///< of the next piece, in bits
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
        std::vector<Level> levels; ///< of the compounds that are open
    };

    /// A range against the direction of its bus cannot be associated whole (IEEE 1076-1993, 6.5).
    void AssociateBits(Text const &name) {
        Text const whole = formal;
        Names::BusParts parts;
        Names::Bounds bounds;
        if (!Bus::IsBusName(name) || !Names::SplitBusName(name.View(), parts) ||
            !Names::ParseBounds(name.View(), bounds))
            return;
        for (unsigned int position = 0;; ++position) {
            if (!BusIndex::IsBusIndexName(whole))
                SetFormal(Bus::GetBusSliceName(whole, static_cast<int>(position), 1));
            AssociateBit(Names::BitName(parts.base, bounds.IndexAt(position)));
            if (position == bounds.Distance())
                return;
        }
    }

    static bool IsOpen(Text const &name) {
        return name.IsEmpty() || Basis::Ascii::EqualIgnoringCase(name.View(), "open");
    }
    void WriteOrOpen(Text const &name) {
        if (name.IsEmpty())
            stream << "open";
        else
            stream << name;
    }

    /// The name of the bit of a one-bit bus: D(3) for D(3:3).
    static Text OneBit(Text const &name) { return Bus::GetBusSliceName(name, 0, 1); }

    void BeginAssociation() {
        stream << separator;
        separator = nextSeparator;
    }

    void WriteFormal() {
        if (formalIsPlain)
            stream << formal;
        else
            statements.WriteBus(formal);
    }

    char const *&separator;
    char const *nextSeparator;
    Text formal;
    VhdlStatements &statements;
    OutStream &stream;
    bool formalIsPlain = true;
};

} // namespace

namespace Vesk_Hdl {

/// What a generic clause lists.
struct VhdlNetlister::GenericItems {
    Attribute const *init = nullptr; ///< the macro's INIT, which is handed on
    PtrArray<Attribute *> syn;
    PtrArray<Attribute *> nosyn;

    void Add(Attribute *attr) {
        if (attr->IsGenericSyn())
            syn.Add(attr);
        else if (attr->IsGenericNoSyn())
            nosyn.Add(attr);
    }
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

/// A component's attributes are generic defaults, no items of a map, but for a macro's INIT.
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

/// The separator of an item is written when the next one comes. In a mixed clause the one behind
/// the last item for synthesis stands inside the translate brackets, so that both kinds of reader
/// see a well-formed list.
void VhdlNetlister::WriteGenericClause(GenericItems const &items, bool isDeclaration) {
    if (items.IsEmpty())
        return;
    bool const onlyNosyn = items.syn.IsEmpty() && !items.init;
    if (onlyNosyn)
        Put(*stream, Translate::VHDL_OFF, EOL);
    Put(*stream, (isDeclaration ? "generic" : "generic map"), "( ");
    char const *pending = "";
    bool first = true;
    if (items.init) {
        statements->WriteGenericMapInitAttr(items.init);
        pending = ",";
        first = false;
    }
    auto const writeItem = [&](Attribute const *attr) {
        *stream << pending;
        if (*pending)
            *stream << EOL;
        if (!first)
            *stream << "         ";
        first = false;
        if (isDeclaration)
            statements->WriteGenericMapAttrType(attr);
        else
            statements->WriteGenericMapAttr(attr);
        pending = isDeclaration ? ";" : ",";
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
        char const *separator = "";
        char const *const next = options->portOnePerLine ? ",\n          " : ", ";
        ForEach(pins, [&](Pin const *pin) {
            WritePortAssignmentVisitor visitor(pin->GetNameRef(), separator, next, *statements,
                                               *stream);
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

/// What merely repeats the component's attribute is covered by the component's assignment.
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
