#pragma once

#include <vector>

#include "tool/check/Attributes.h"
#include "tool/check/WrittenText.h"

namespace Checks {

/// Attribute values that are written as strings: whether quotes and backslashes leave the string
/// whole, and whether its line is folded within it.
///
/// Many values are looked at before the text that they are written in is read once: call Look for
/// each, then ReadFolds, then Report for each, then Clear.
class ValueChecker {
public:
    /// What is known of a value before its text is read, and where the text has it.
    struct Value {
        Languages broken = NO_LANGUAGE; ///< by quotes or backslashes
        Languages folded = NO_LANGUAGE; ///< known before
        WrittenText::Range vhdl;
        WrittenText::Range verilog;
    };

    explicit ValueChecker(Design const &checked) : design(checked) {}

    Value Look(AttributeUse const &use);
    /// Whether so many values were looked at that their text should be read.
    bool IsFull() const { return text.IsFull(); }
    void ReadFolds();
    void Report(AttributeUse const &use, Value const &value) const;
    void Clear() { text.Clear(); }

    /// The generics of components in the Verilog lines of their instances. A component's generic is
    /// written at each instance that has none of its own; one that breaks gets one finding. Called
    /// when no other value waits for its text.
    void CheckInherited();

private:
    /// A string in a generic clause or map.
    struct Item {
        Vesk_Hdl::Attribute const *generic;
        WrittenText::Range range;
    };
    /// A generic of a component in the line of an instance.
    struct Inherited {
        AttributeUse use;
        Vesk_Hdl::Instance const *instance;
        WrittenText::Range range;
    };

    Languages QuotedIn(AttributeUse const &use) const;
    void LookInVhdl(Value &value, AttributeUse const &use, Text const &bare);
    void LookInVerilog(Value &value, AttributeUse const &use, Text const &verilog);
    WrittenText::Range AddDefparam(Vesk_Hdl::Instance const &instance,
                                   Vesk_Hdl::Attribute const &attribute, Text const &value);
    WrittenText::Range AddStatement(WrittenText::Write const &write, Text const &value);
    void AddClause(AttributeUse const &use);
    std::vector<AttributeUse> FindInheritable(Vesk_Hdl::Component const &component) const;

    Design const &design;
    WrittenText text;
    /// Whose generic clause was added last: the generics of an owner come one after the other.
    Vesk_Hdl::Object const *clauseOwner = nullptr;
    bool clauseIsRead = false;
    std::vector<Item> clause; ///< sorted by generic; once it is read, those that are folded
};

} // namespace Checks
