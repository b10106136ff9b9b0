#include "tool/check/ValueChecks.h"

#include <algorithm>
#include <functional>
#include <unordered_map>
#include <unordered_set>

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

ValueChecker::Value ValueChecker::Look(AttributeUse const &use) {
    Value value;
    Languages const quoted = QuotedIn(use);
    if (quoted == NO_LANGUAGE)
        return value;
    Text const bare = HdlUtilities::RemoveQuotes(use.attribute->GetValueString());
    Text const verilog = ValueInVerilog(*use.attribute);
    value.broken = quoted & ((BreaksVhdl(bare.View()) ? VHDL : NO_LANGUAGE) |
                             (BreaksVerilog(verilog.View()) ? VERILOG : NO_LANGUAGE));
    if (!HasBlank(bare) || !design.findings.Wants(Id::FOLDED_VALUE))
        return value;
    if ((quoted & VHDL) != NO_LANGUAGE)
        LookInVhdl(value, use, bare);
    if ((quoted & VERILOG) != NO_LANGUAGE)
        LookInVerilog(value, use, verilog);
    return value;
}

void ValueChecker::ReadFolds() {
    text.ReadFolds();
    // Further generics of the clause may come after its text is gone.
    if (!clauseIsRead)
        std::erase_if(clause,
                      [this](Item const &item) { return !text.IsFoldedWithin(item.range); });
    clauseIsRead = true;
}

void ValueChecker::Report(AttributeUse const &use, Value const &value) const {
    if (value.broken != NO_LANGUAGE)
        AddFinding(design, Id::QUOTED_VALUE, use, value.broken);
    Languages const folded = value.folded | (text.IsFoldedWithin(value.vhdl) ? VHDL : NO_LANGUAGE) |
                             (text.IsFoldedWithin(value.verilog) ? VERILOG : NO_LANGUAGE);
    if (folded != NO_LANGUAGE)
        AddFinding(design, Id::FOLDED_VALUE, use, folded);
}

void ValueChecker::LookInVhdl(Value &value, AttributeUse const &use, Text const &bare) {
    if (!use.generic) {
        value.vhdl = AddStatement(
            [&](OutStream &stream) {
                VhdlStatements(stream).WriteAttrAssignment(
                    use.attribute, std::string(BaseOf(*use.owner)).c_str(), ClassOf(use.kind),
                    design.options.vhdlOption.useAttrType);
            },
            bare);
        return;
    }
    if (clauseOwner != use.owner)
        AddClause(use);
    auto const item = std::lower_bound(clause.begin(), clause.end(), use.attribute,
                                       [](Item const &left, Attribute const *right) {
                                           return std::less<>()(left.generic, right);
                                       });
    if (item == clause.end() || item->generic != use.attribute)
        return;
    if (clauseIsRead)
        value.folded |= VHDL;
    else
        value.vhdl = item->range;
}

/// A component's generics are written at its instances, a module's as parameters.
void ValueChecker::LookInVerilog(Value &value, AttributeUse const &use, Text const &verilog) {
    if (use.kind == AttributeUse::INSTANCE)
        value.verilog =
            AddDefparam(static_cast<Instance const &>(*use.owner), *use.attribute, verilog);
    else if (use.kind == AttributeUse::MODULE)
        value.verilog = AddStatement(
            [&use](OutStream &stream) {
                VerilogStatements(stream).WriteParameterStatement(use.attribute);
                stream << ";" << OutStream::NEW_LINE;
            },
            verilog);
}

WrittenText::Range ValueChecker::AddDefparam(Instance const &instance, Attribute const &attribute,
                                             Text const &value) {
    return AddStatement(
        [&](OutStream &stream) {
            VerilogStatements(stream).WriteDefParamStatement(&attribute, instance.GetNameRef());
            stream << ";" << OutStream::NEW_LINE;
        },
        value);
}

/// Adds a statement of an architecture or a module and returns the place of the value at its end.
WrittenText::Range ValueChecker::AddStatement(WrittenText::Write const &write, Text const &value) {
    if (!text.Add(1, write))
        return {};
    std::size_t const end = text.GetPlain().rfind('"');
    return {end - value.GetLength(), end};
}

/// Adds a clause and finds the places of its strings. Where an item begins and what follows it on
/// its line depends on the others: the clause is written as a whole.
void ValueChecker::AddClause(AttributeUse const &use) {
    auto const &holder = dynamic_cast<AttributeHolder const &>(*use.owner);
    clauseOwner = use.owner;
    clauseIsRead = false;
    clause.clear();
    bool const mayFold = text.Add(use.kind == AttributeUse::COMPONENT ? 2 : 1, [&](OutStream &to) {
        VhdlNetlister netlister(to);
        if (use.kind == AttributeUse::INSTANCE)
            netlister.WriteGenericAssociations(static_cast<Instance const &>(*use.owner),
                                               HandsInitOn(design));
        else
            netlister.WriteGenericDeclarations(holder);
    });
    if (!mayFold)
        return;
    std::size_t from = text.GetLastBegin();
    auto const lookAt = [&](Attribute const *generic) {
        std::string const item = " " + ItemOf(use, *generic);
        std::size_t const begin = text.GetPlain().find(item, from);
        if (begin == std::string::npos)
            return; // in its place the macro hands its own one on
        from = begin + item.size() - 1;
        Text const value = HdlUtilities::RemoveQuotes(generic->GetValueString());
        if (generic->GetValueType() == Attribute::VALUE_STRING)
            clause.push_back({generic, {from - value.GetLength(), from}});
    };
    // Generics for simulation only come last.
    for (bool const isSyn : {true, false})
        ForEach(holder.GetAttrIterator(), [&](Attribute const *generic) {
            if (isSyn ? generic->IsGenericSyn() : generic->IsGenericNoSyn())
                lookAt(generic);
        });
    std::sort(clause.begin(), clause.end(), [](Item const &left, Item const &right) {
        return std::less<>()(left.generic, right.generic);
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
    std::unordered_set<Attribute const *> reported;
    std::vector<Inherited> added;
    auto const report = [&] {
        text.ReadFolds();
        for (Inherited const &one : added)
            if (text.IsFoldedWithin(one.range) && reported.insert(one.use.attribute).second)
                AddFinding(design, Id::FOLDED_VALUE, one.use, VERILOG,
                           "at the instance " + Quoted(one.instance->GetNameRef().View()));
        added.clear();
        text.Clear();
    };
    design.ForEachInstance([&](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (!component || !component->HasAttrs())
            return;
        auto const [known, isNew] = inheritable.try_emplace(component);
        std::vector<AttributeUse> &uses = known->second;
        if (isNew)
            uses = FindInheritable(*component);
        std::erase_if(uses,
                      [&](AttributeUse const &use) { return reported.count(use.attribute) > 0; });
        for (AttributeUse const &use : uses) {
            if (instance->GetAttr(use.attribute->GetNameRef()))
                continue;
            WrittenText::Range const range =
                AddDefparam(*instance, *use.attribute, ValueInVerilog(*use.attribute));
            if (range.end > 0)
                added.push_back({use, instance, range});
        }
        if (text.IsFull())
            report();
    });
    report();
}

} // namespace Checks
