// Attributes: whether what they need is declared, and whether their types take their values.

#include <cmath>
#include <unordered_map>

#include "tool/check/Attributes.h"
#include "tool/check/Digits.h"
#include "tool/check/SeededHash.h"
#include "tool/check/ValueChecks.h"

using namespace Vesk_Hdl;

namespace Checks {

std::string VhdlTypeOf(Attribute const &attribute) {
    switch (attribute.GetValueType()) {
    case Attribute::VALUE_STRING:
        return "string";
    case Attribute::VALUE_INTEGER:
        return "integer";
    case Attribute::VALUE_FLOAT:
        return "real";
    case Attribute::VALUE_BOOLEAN:
        return "boolean";
    case Attribute::VALUE_BIT:
        return "bit";
    case Attribute::VALUE_BIT_VECTOR:
        return "bit_vector";
    case Attribute::VALUE_USER:
        return Lowercase(static_cast<AttributeUser const &>(attribute).GetUserType().View());
    }
    return {};
}

namespace {

class AttributeChecker {
public:
    explicit AttributeChecker(Design const &checked)
        : design(checked), useAttrType(checked.options.vhdlOption.useAttrType),
          usesPackages(UsesPackages(checked.options.vhdlOption.useLibraries)), values(checked) {
        ForEachAttribute(design, [this](AttributeUse const &use) {
            if (use.generic)
                return;
            if (use.attribute->IsSynDeclared())
                (IsPort(use) ? declaredByPorts : declared)
                    .try_emplace(Lowercase(use.attribute->GetNameRef().View()), use.attribute);
            else
                hasUndeclaredOfPorts |= IsPort(use);
        });
    }

    void Run() {
        if (hasUndeclaredOfPorts)
            OrderPorts();
        ForEachAttribute(design, [this](AttributeUse const &use) {
            uses.emplace_back(use, values.Look(use));
            if (uses.size() == MAX_USES || values.IsFull())
                CheckUses();
        });
        CheckUses();
        values.CheckInherited();
        FindUnwritten();
        CheckLibraries(design, typed);
    }

private:
    static constexpr std::size_t MAX_USES = 256;

    /// Checks many uses at a time, so that the text of their values is read once.
    void CheckUses() {
        values.ReadFolds();
        for (auto const &[use, value] : uses) {
            if (!use.generic)
                CheckDeclared(use);
            else if (use.kind == AttributeUse::INSTANCE)
                CheckGeneric(use);
            CheckType(use);
            CheckLiteral(use);
            values.Report(use, value);
        }
        values.Clear();
        uses.clear();
    }

    /// Whether a use clause names a package of the user's: those of ieee and std declare none of
    /// the attributes.
    static bool UsesPackages(StringArray const &clauses) {
        for (int i = 0; i < clauses.GetSize(); ++i) {
            std::string const clause = Lowercase(clauses.At(i).View());
            if (clause.compare(0, 5, "ieee.") != 0 && clause.compare(0, 4, "std.") != 0)
                return true;
        }
        return false;
    }

    static bool IsPort(AttributeUse const &use) {
        return use.kind == AttributeUse::SIGNAL && static_cast<Signal const *>(use.owner)->IsPort();
    }

    void Add(Id id, AttributeUse const &use, Languages languages = BOTH,
             std::string detail = {}) const {
        AddFinding(design, id, use, languages, std::move(detail));
    }

    /// The entity declares and assigns the attributes of one port after the other. The places of
    /// the ports are only of use to attributes that other ports have to declare.
    void OrderPorts() {
        // A netlist sorts these copies like the ports themselves.
        Netlist sorted("");
        std::unordered_map<Signal const *, Object const *> portOfCopy;
        design.ForEachSignal([&](Signal const *signal) {
            if (!signal->IsPort() || !signal->HasAttrs())
                return;
            auto *const copy = new ScalarSignal(signal->GetNameRef());
            copy->SetPortPolarity(signal->GetPortPolarity());
            sorted.Add(copy);
            portOfCopy[copy] = signal;
        });
        sorted.SortNetlist();
        ForEach(sorted.GetSignalIterator(), [&](Signal const *copy) {
            placeOfPort.try_emplace(portOfCopy[copy], placeOfPort.size());
        });
        ForEachAttribute(design, [&](AttributeUse const &use) {
            if (use.generic || !IsPort(use) || !use.attribute->IsSynDeclared())
                return;
            std::size_t const place = placeOfPort[use.owner];
            std::string const name = Lowercase(use.attribute->GetNameRef().View());
            std::size_t &first = firstPlace.try_emplace(name, place).first->second;
            first = std::min(first, place);
        });
    }

    /// Whether the attribute of a port comes before its declaration by another one.
    bool ComesTooEarly(AttributeUse const &use, std::string const &name) const {
        if (!IsPort(use) || use.attribute->IsSynDeclared())
            return false;
        auto const first = firstPlace.find(name);
        return first != firstPlace.end() && placeOfPort.at(use.owner) < first->second;
    }

    /// The packages of the user may declare what nobody here does.
    void CheckDeclared(AttributeUse const &use) {
        std::string const name = Lowercase(use.attribute->GetNameRef().View());
        auto const findIn = [&name](auto const &map) {
            auto const found = map.find(name);
            return found == map.end() ? nullptr : found->second;
        };
        Attribute const *declaration = findIn(declaredByPorts);
        if (!declaration && !IsPort(use))
            declaration = findIn(declared);
        bool const isTyped = declaration && useAttrType;
        auto const typeOf = [](Attribute const &attribute) {
            std::string const type = VhdlTypeOf(attribute);
            return type.substr(type.rfind('.') + 1); // in whatever package
        };
        std::string const type = isTyped ? typeOf(*use.attribute) : "";
        std::string const declaredType = isTyped ? typeOf(*declaration) : "";
        if (type != declaredType && !type.empty() && !declaredType.empty())
            Add(Id::ATTRIBUTE_TYPE, use, VHDL, type + " for " + declaredType);
        bool const tooEarly = ComesTooEarly(use, name);
        if ((!declaration || tooEarly) && !IsLeftOut(design, use) && !usesPackages)
            Add(Id::UNDECLARED_ATTRIBUTE, use, VHDL,
                tooEarly ? "the port that declares it comes later in the entity" : "");
    }

    void CheckGeneric(AttributeUse const &use) {
        auto const *const instance = static_cast<Instance const *>(use.owner);
        if (use.attribute->GetNameRef() == "INIT" && instance->GetComponent() &&
            TakesInitOfMacro(design, *instance->GetComponent()))
            return; // is not written
        Attribute const *const generic = instance->GetComponentAttr(use.attribute->GetNameRef());
        bool const isKnown = generic && (generic->IsGenericSyn() || generic->IsGenericNoSyn());
        if (!isKnown && !design.options.vhdlOption.suppressComponent)
            return Add(Id::UNKNOWN_GENERIC, use, VHDL);
        // What a type of the user's takes is the user's affair.
        auto const isUser = [](Attribute const &attribute) {
            return attribute.GetValueType() == Attribute::VALUE_USER;
        };
        if (isKnown && generic->GetValueType() != use.attribute->GetValueType() &&
            !isUser(*generic) && !isUser(*use.attribute))
            Add(Id::GENERIC_TYPE, use, VHDL,
                use.attribute->GetValueTypeName().GetText() + std::string(" for ") +
                    generic->GetValueTypeName().GetText());
    }

    /// A type of the user's has a name of its own, which VHDL alone writes.
    void CheckType(AttributeUse const &use) {
        if (use.attribute->GetValueType() != Attribute::VALUE_USER)
            return;
        bool const isDeclared = use.generic
                                    ? use.kind != AttributeUse::INSTANCE && !IsLeftOut(design, use)
                                    : useAttrType && use.attribute->IsSynDeclared();
        if (isDeclared && VhdlTypeOf(*use.attribute).empty())
            Add(Id::ATTRIBUTE_WITHOUT_TYPE, use, VHDL);
        else if (isDeclared)
            typed.push_back(use);
    }

    /// The languages that refuse the value of a vector of bits, or take it for another one.
    static Languages RefuseBits(BitVectorValue const &value) {
        Digits const digits(value);
        std::string const &text = digits.GetText();
        bool const isOther =
            value.HasBaseAndLength()
                ? value.GetLength() < 1 ||
                      digits.GetLeastWidth() > static_cast<std::size_t>(value.GetLength())
                : std::min(text.find_first_not_of('0'), text.size()) + 1 < text.size();
        return digits.RefusedIn("") | (isOther ? VERILOG : NO_LANGUAGE);
    }

    /// A vector of bits may have any text for a value, and a number may have none.
    void CheckLiteral(AttributeUse const &use) {
        bool const inVhdl = (use.generic || useAttrType) && !IsLeftOut(design, use);
        Languages const written =
            (inVhdl ? VHDL : NO_LANGUAGE) | (use.generic ? VERILOG : NO_LANGUAGE);
        Languages bad = NO_LANGUAGE;
        if (auto const *const bits = dynamic_cast<AttributeBitVector const *>(use.attribute))
            bad = RefuseBits(bits->GetBitVectorValue());
        else if (auto const *const number = dynamic_cast<AttributeFloat const *>(use.attribute))
            bad = std::isfinite(number->GetValue()) ? NO_LANGUAGE : BOTH;
        if ((bad & written) != NO_LANGUAGE)
            Add(Id::ATTRIBUTE_VALUE, use, bad & written,
                Quoted(use.attribute->GetValueString().View()));
    }

    /// Attribute statements are written of whole nets, instances and components alone.
    void FindUnwritten() {
        auto const find = [this](AttributeHolder const &holder, Object const &owner) {
            if (holder.HasAttrs())
                ForEach(holder.GetAttrIterator(), [&](Attribute const *attribute) {
                    if (attribute->IsSynAssigned())
                        Add(Id::UNWRITTEN_ATTRIBUTE,
                            {attribute, AttributeUse::MODULE, &owner, false});
                });
        };
        find(design.netlist, design.netlist);
        design.ForEachSignal([&](Signal const *signal) {
            if (!signal->IsNeededToDeclared())
                find(*signal, *signal);
        });
        design.ForEachUsedComponent([&](Component const *component) {
            ForEach(component->GetPinIterator(), [&](Pin const *pin) { find(*pin, *pin); });
        });
    }

    Design const &design;
    bool useAttrType;
    bool usesPackages;
    ValueChecker values;
    std::vector<std::pair<AttributeUse, ValueChecker::Value>> uses;          ///< to be checked
    std::unordered_map<std::string, Attribute const *, SeededHash> declared; ///< by name, the first
    std::unordered_map<std::string, Attribute const *, SeededHash> declaredByPorts;
    std::vector<AttributeUse> typed; ///< with types of the user's
    bool hasUndeclaredOfPorts = false;
    std::unordered_map<Object const *, std::size_t> placeOfPort; ///< in the entity
    std::unordered_map<std::string, std::size_t, SeededHash>
        firstPlace; ///< that declares an attribute
};

} // namespace

void CheckAttributes(Design const &design) { AttributeChecker(design).Run(); }

} // namespace Checks
