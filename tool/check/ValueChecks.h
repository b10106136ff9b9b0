#pragma once

#include <unordered_set>

#include "tool/check/Attributes.h"
#include "tool/check/WrittenText.h"

namespace Checks {

/// Attribute values that are written as strings: whether quotes and backslashes leave the string
/// whole, and whether its line is folded within it.
class ValueChecker {
public:
    explicit ValueChecker(Design const &checked) : design(checked) {}

    void Check(AttributeUse const &use);
    /// The generics of components in the Verilog lines of their instances. A component's generic is
    /// written at each instance that has none of its own; one that breaks gets one finding.
    void CheckInherited();

private:
    Languages QuotedIn(AttributeUse const &use) const;
    bool FoldsInVhdl(AttributeUse const &use, Text const &value);
    bool FoldsInVerilog(AttributeUse const &use, Text const &value);
    bool FoldsAsDefparam(Vesk_Hdl::Instance const &instance, Vesk_Hdl::Attribute const &attribute);
    bool FoldsInStatement(WrittenText::Write const &write, Text const &value);
    void ReadClause(AttributeUse const &use);
    std::vector<AttributeUse> FindInheritable(Vesk_Hdl::Component const &component) const;

    Design const &design;
    WrittenText text;
    /// Whose generic clause was looked at last: the generics of an owner come one after the other.
    Vesk_Hdl::Object const *clauseOwner = nullptr;
    std::unordered_set<Vesk_Hdl::Attribute const *> foldedInClause;
};

} // namespace Checks
