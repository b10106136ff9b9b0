#include "tool/check/ValueChecks.h"

#include <unordered_map>

using namespace Vesk_Hdl;

namespace Checks {

namespace {

bool BreaksVhdl(std::string_view value) {
    for (std::size_t i = 0; i < value.size(); ++i)
        if (value[i] == '"' && (i + 1 == value.size() || value[++i] != '"'))
            return true;
    return false;
}

/// Readers differ in what a backslash makes of other characters than these two.
bool BreaksVerilog(std::string_view value) {
    for (std::size_t i = 0; i < value.size(); ++i)
        if (value[i] == '"' ||
            (value[i] == '\\' && (++i == value.size() || (value[i] != '\\' && value[i] != '"'))))
            return true;
    return false;
}

/// Values of a user's type keep their quotes in Verilog.
Text ValueInVerilog(Attribute const &attribute) {
    Text const value = attribute.GetValueString();
    return attribute.GetValueType() == Attribute::VALUE_USER ? value
                                                             : HdlUtilities::RemoveQuotes(value);
}

bool HasBlank(Text const &value) { return value.View().find(' ') != std::string_view::npos; }

/// What an attribute statement of VHDL calls its target.
char const *ClassOf(AttributeUse::Kind kind) {
    return kind == AttributeUse::SIGNAL     ? "signal"
           : kind == AttributeUse::INSTANCE ? "label"
                                            : "component";
}

/// One item of a generic clause or map, which ends in the quote after the value.
std::string ItemOf(AttributeUse const &use, Attribute const &generic) {
    return WrittenText::Plain([&](OutStream &stream) {
        VhdlStatements statements(stream);
        if (use.kind == AttributeUse::INSTANCE)
            statements.WriteGenericMapAttr(&generic);
        else
            statements.WriteGenericMapAttrType(&generic);
    });
}

} // namespace

/// The languages in which the value is written as a string.
Languages ValueChecker::QuotedIn(AttributeUse const &use) const {
    Attribute::ValueType const type = use.attribute->GetValueType();
    bool const asString = type == Attribute::VALUE_STRING;
    Languages quoted = NO_LANGUAGE;
    if ((asString || (!use.generic && !design.options.vhdlOption.useAttrType)) &&
        !IsLeftOut(design, use))
        quoted |= VHDL;
    // A component's generic is a parameter of each instance; other attributes are comments.
    if (use.generic && (asString || type == Attribute::VALUE_USER))
        quoted |= VERILOG;
    return quoted;
}

void ValueChecker::Check(AttributeUse const &use) {
    Languages const quoted = QuotedIn(use);
    if (quoted == NO_LANGUAGE)
        return;
    Text const bare = HdlUtilities::RemoveQuotes(use.attribute->GetValueString());
    Text const verilog = ValueInVerilog(*use.attribute);
    Languages const bad = (BreaksVhdl(bare.View()) ? VHDL : NO_LANGUAGE) |
                          (BreaksVerilog(verilog.View()) ? VERILOG : NO_LANGUAGE);
    if ((bad & quoted) != NO_LANGUAGE)
        AddFinding(design, Id::QUOTED_VALUE, use, bad & quoted);
    if (!HasBlank(bare) || !design.findings.Wants(Id::FOLDED_VALUE))
        return;
    Languages folded = NO_LANGUAGE;
    if ((quoted & VHDL) != NO_LANGUAGE && FoldsInVhdl(use, bare))
        folded |= VHDL;
    if ((quoted & VERILOG) != NO_LANGUAGE && FoldsInVerilog(use, verilog))
        folded |= VERILOG;
    if (folded != NO_LANGUAGE)
        AddFinding(design, Id::FOLDED_VALUE, use, folded);
}

bool ValueChecker::FoldsInVhdl(AttributeUse const &use, Text const &value) {
    if (use.generic) {
        if (clauseOwner != use.owner)
            ReadClause(use);
        return foldedInClause.count(use.attribute) > 0;
    }
    return FoldsInStatement(
        [&](OutStream &stream) {
            VhdlStatements(stream).WriteAttrAssignment(
                use.attribute, std::string(BaseOf(*use.owner)).c_str(), ClassOf(use.kind),
                design.options.vhdlOption.useAttrType);
        },
        value);
}

/// A component's generics are written at its instances, a module's as parameters.
bool ValueChecker::FoldsInVerilog(AttributeUse const &use, Text const &value) {
    if (use.kind == AttributeUse::INSTANCE)
        return FoldsAsDefparam(static_cast<Instance const &>(*use.owner), *use.attribute);
    return use.kind == AttributeUse::MODULE &&
           FoldsInStatement(
               [&](OutStream &stream) {
                   VerilogStatements(stream).WriteParameterStatement(use.attribute);
                   stream << ";" << OutStream::NEW_LINE;
               },
               value);
}

bool ValueChecker::FoldsAsDefparam(Instance const &instance, Attribute const &attribute) {
    return FoldsInStatement(
        [&](OutStream &stream) {
            VerilogStatements(stream).WriteDefParamStatement(&attribute, instance.GetNameRef());
            stream << ";" << OutStream::NEW_LINE;
        },
        ValueInVerilog(attribute));
}

/// Of one statement in an architecture or a module, which has the value at its end.
bool ValueChecker::FoldsInStatement(WrittenText::Write const &write, Text const &value) {
    text.Take(1, write);
    std::size_t const end = text.GetPlain().rfind('"');
    return text.IsFoldedWithin(end - value.GetLength(), end);
}

/// Finds the generics of the clause that are folded within their quotes. Where an item begins and
/// what follows it on its line depends on the others: the clause is written as a whole.
void ValueChecker::ReadClause(AttributeUse const &use) {
    auto const &holder = dynamic_cast<AttributeHolder const &>(*use.owner);
    clauseOwner = use.owner;
    foldedInClause.clear();
    text.Take(use.kind == AttributeUse::COMPONENT ? 2 : 1, [&](OutStream &stream) {
        VhdlNetlister netlister(stream);
        if (use.kind == AttributeUse::INSTANCE)
            netlister.WriteGenericAssociations(static_cast<Instance const &>(*use.owner),
                                               HandsInitOn(design));
        else
            netlister.WriteGenericDeclarations(holder);
    });
    if (!text.IsFolded())
        return;
    std::size_t from = 0;
    auto const lookAt = [&](Attribute const *generic) {
        std::string const item = ItemOf(use, *generic);
        std::size_t const begin = text.GetPlain().find(" " + item, from);
        if (begin == std::string::npos)
            return; // in its place the macro hands its own one on
        from = begin + item.size();
        Text const value = HdlUtilities::RemoveQuotes(generic->GetValueString());
        if (generic->GetValueType() == Attribute::VALUE_STRING &&
            text.IsFoldedWithin(from - value.GetLength(), from))
            foldedInClause.insert(generic);
    };
    // Generics for simulation only come last.
    for (bool const isSyn : {true, false})
        ForEach(holder.GetAttrIterator(), [&](Attribute const *generic) {
            if (isSyn ? generic->IsGenericSyn() : generic->IsGenericNoSyn())
                lookAt(generic);
        });
}

/// The generics of a component that a Verilog line of an instance may break.
std::vector<AttributeUse> ValueChecker::FindInheritable(Component const &component) const {
    std::vector<AttributeUse> found;
    ForEach(component.GetAttrIterator(), [&](Attribute const *attribute) {
        AttributeUse const use{attribute, AttributeUse::COMPONENT, &component, true};
        if ((attribute->IsGenericSyn() || attribute->IsGenericNoSyn()) &&
            (QuotedIn(use) & VERILOG) != NO_LANGUAGE && HasBlank(ValueInVerilog(*attribute)))
            found.push_back(use);
    });
    return found;
}

void ValueChecker::CheckInherited() {
    if (!design.findings.Wants(Id::FOLDED_VALUE))
        return;
    std::unordered_map<Component const *, std::vector<AttributeUse>> inheritable;
    design.ForEachInstance([&](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (!component || !component->HasAttrs())
            return;
        auto const [known, isNew] = inheritable.try_emplace(component);
        std::vector<AttributeUse> &uses = known->second;
        if (isNew)
            uses = FindInheritable(*component);
        std::erase_if(uses, [&](AttributeUse const &use) {
            if (instance->GetAttr(use.attribute->GetNameRef()) ||
                !FoldsAsDefparam(*instance, *use.attribute))
                return false;
            AddFinding(design, Id::FOLDED_VALUE, use, VERILOG,
                       "at the instance " + Quoted(instance->GetNameRef().View()));
            return true;
        });
    });
}

} // namespace Checks
