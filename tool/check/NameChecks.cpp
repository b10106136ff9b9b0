// Names: whether the languages take them, and whether two of them meet.

#include <set>
#include <unordered_set>

#include "tool/check/Attributes.h"
#include "tool/check/Design.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

using VerilogOption = HdlOptions::VerilogOption;

/// A name as it is going to be written.
struct WrittenName {
    std::string_view name; ///< without brackets
    std::string what;      ///< "net", "component", ...
    void const *object;
    VerilogOption::CaseType nameCase = VerilogOption::CASE_DEFAULT;
    Languages languages = BOTH;
    std::string_view shown = {}; ///< where it differs from the name
    std::string owner = {};      ///< with a point, of a pin

    std::string Subject() const {
        return what + " " + Quoted(owner + std::string(shown.empty() ? name : shown));
    }
};

bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }
bool IsDigit(char c) { return c >= '0' && c <= '9'; }

bool IsVhdlIdentifier(std::string_view name) {
    if (name.size() > 2 && name.front() == '\\' && name.back() == '\\')
        return name.substr(1, name.size() - 2).find('\\') == std::string_view::npos;
    if (name.empty() || !IsLetter(name.front()) || name.back() == '_' ||
        name.find("__") != std::string_view::npos)
        return false;
    return std::all_of(name.begin(), name.end(),
                       [](char c) { return IsLetter(c) || IsDigit(c) || c == '_'; });
}

bool IsVerilogIdentifier(std::string_view name) {
    if (name.size() > 2 && name.front() == '\\')
        return name.find(' ') == name.size() - 1;
    if (name.empty() || IsDigit(name.front()) || name.front() == '$')
        return false;
    return std::all_of(name.begin(), name.end(),
                       [](char c) { return IsLetter(c) || IsDigit(c) || c == '_' || c == '$'; });
}

std::unordered_set<std::string_view> const VHDL_2008_WORDS = {
    "assume",   "assume_guarantee", "context",  "cover",   "default",  "fairness",
    "force",    "parameter",        "property", "release", "restrict", "restrict_guarantee",
    "sequence", "strong",           "vmode",    "vprop",   "vunit",    "protected"};

std::unordered_set<std::string_view> const SYSTEM_VERILOG_WORDS = {
    // Verilog-2001 and 2005
    "automatic", "cell", "config", "design", "endconfig", "endgenerate", "generate", "genvar",
    "incdir", "include", "instance", "liblist", "library", "localparam", "noshowcancelled",
    "pulsestyle_ondetect", "pulsestyle_onevent", "showcancelled", "signed", "unsigned", "use",
    "uwire",
    // SystemVerilog
    "accept_on", "alias", "always_comb", "always_ff", "always_latch", "assert", "assume", "before",
    "bind", "bins", "binsof", "bit", "break", "byte", "chandle", "checker", "class", "clocking",
    "const", "constraint", "context", "continue", "cover", "covergroup", "coverpoint", "cross",
    "dist", "do", "endchecker", "endclass", "endclocking", "endgroup", "endinterface", "endpackage",
    "endprogram", "endproperty", "endsequence", "enum", "eventually", "expect", "export", "extends",
    "extern", "final", "first_match", "foreach", "forkjoin", "global", "iff", "ignore_bins",
    "illegal_bins", "implements", "implies", "import", "inside", "int", "interconnect", "interface",
    "intersect", "join_any", "join_none", "let", "local", "logic", "longint", "matches", "modport",
    "nettype", "new", "nexttime", "null", "package", "packed", "priority", "program", "property",
    "protected", "pure", "rand", "randc", "randcase", "randsequence", "ref", "reject_on",
    "restrict", "return", "s_always", "s_eventually", "s_nexttime", "s_until", "s_until_with",
    "sequence", "shortint", "shortreal", "soft", "solve", "static", "string", "strong", "struct",
    "super", "sync_accept_on", "sync_reject_on", "tagged", "this", "throughout", "timeprecision",
    "timeunit", "type", "typedef", "union", "unique", "unique0", "until", "until_with", "untyped",
    "var", "virtual", "void", "wait_order", "weak", "wildcard", "with", "within"};

/// No reserved word of any version is longer, and a text of that size is put together quickly.
constexpr std::size_t LONGEST_WORD = 20;

std::string Cased(std::string_view name, VerilogOption::CaseType nameCase) {
    Text text(name);
    if (nameCase == VerilogOption::CASE_UPPER)
        text.MakeUpper();
    else if (nameCase == VerilogOption::CASE_LOWER)
        text.MakeLower();
    return text.GetText();
}

Languages Of(bool vhdl, bool verilog) {
    return (vhdl ? VHDL : NO_LANGUAGE) | (verilog ? VERILOG : NO_LANGUAGE);
}

class NameChecker {
public:
    explicit NameChecker(Design const &checked) : design(checked) { FindUsedTypes(); }

    void Run() {
        VerilogOption const &verilog = design.options.verilogOption;
        Check({design.netlist.GetNameRef().View(), "design", &design.netlist});
        design.ForEachUsedComponent([&](Component const *component) {
            Check({component->GetNameRef().View(), "component", component, verilog.componentCase});
            ForEach(component->GetPinIterator(),
                    [&](Pin const *pin) { CheckPin(*component, *pin); });
        });
        design.ForEachInstance([&](Instance const *instance) {
            Check({instance->GetNameRef().View(), "instance", instance, verilog.instanceCase});
        });
        design.ForEachSignal([&](Signal const *signal) {
            if (signal->IsNeededToDeclared())
                CheckSignal(*signal);
        });
        ForEachAttribute(design, [this](AttributeUse const &use) {
            Check({use.attribute->GetNameRef().View(), "attribute", use.attribute,
                   VerilogOption::CASE_DEFAULT, use.generic ? BOTH : VHDL});
        });
    }

private:
    /// The types that declarations of the entity and of the architecture name.
    void FindUsedTypes() {
        ForEachAttribute(design, [this](AttributeUse const &use) {
            bool const isOuter = use.kind == AttributeUse::MODULE ||
                                 (use.kind == AttributeUse::SIGNAL &&
                                  static_cast<Signal const *>(use.owner)->IsPort());
            bool const isTyped = use.generic || design.options.vhdlOption.useAttrType;
            (isOuter ? outerTypes : innerTypes)
                .insert(isTyped ? VhdlTypeOf(*use.attribute) : "string");
        });
        pinTypes.insert("std_logic");
        bool hasVectors = false;
        design.ForEachSignal([&](Signal const *signal) {
            hasVectors |= signal->GetSignalType() == Signal::SIGNAL_BUS;
        });
        design.ForEachUsedComponent([&](Component const *component) {
            ForEach(component->GetPinIterator(),
                    [&](Pin const *pin) { hasVectors |= pin->GetPinType() == Pin::PIN_BUS; });
        });
        if (hasVectors)
            pinTypes.insert("std_logic_vector");
        innerTypes.insert(pinTypes.begin(), pinTypes.end());
    }

    void Add(Id id, WrittenName const &name, Languages languages, std::string detail = {}) {
        Finding finding{id, design.MadeAt(name.object), name.Subject()};
        finding.languages = languages & name.languages;
        finding.detail = std::move(detail);
        design.findings.Add(std::move(finding));
    }

    void Check(WrittenName const &name) {
        Languages const illegal = Of(!IsVhdlIdentifier(name.name), !IsVerilogIdentifier(name.name));
        if (illegal != NO_LANGUAGE)
            Add(Id::ILLEGAL_NAME, name, illegal);
        if (illegal == BOTH || name.name.size() > LONGEST_WORD)
            return;
        CheckWords(name, illegal);
    }

    void CheckWords(WrittenName const &name, Languages illegal) {
        std::string const vhdl = Lowercase(name.name);
        std::string const verilog = Cased(name.name, name.nameCase);
        // "force" is missing in the library's table and reserved all the same.
        bool const reservedInVerilog =
            Engine::IsVerilogKeyword(verilog.c_str()) || verilog == "force";
        Languages const reserved = Of(Engine::IsVhdlKeyword(vhdl.c_str()), reservedInVerilog);
        if (reserved != NO_LANGUAGE)
            Add(Id::RESERVED_WORD, name, reserved & ~illegal,
                reserved == BOTH   ? "of VHDL and Verilog"
                : reserved == VHDL ? "of VHDL"
                                   : "of Verilog");
        Languages const newer =
            Of(VHDL_2008_WORDS.count(vhdl) > 0, SYSTEM_VERILOG_WORDS.count(verilog) > 0);
        if ((newer & ~reserved) != NO_LANGUAGE)
            Add(Id::NEWER_RESERVED_WORD, name, newer & ~reserved,
                newer == BOTH   ? "VHDL-2008 and SystemVerilog"
                : newer == VHDL ? "VHDL-2008"
                                : "SystemVerilog");
        bool const isOuter =
            name.what == "port" || name.what == "design" || name.what == "attribute";
        if ((name.what == "pin" ? pinTypes : innerTypes).count(vhdl) > 0 ||
            (isOuter && outerTypes.count(vhdl) > 0))
            Add(Id::STANDARD_NAME, name, VHDL);
        if (name.what == "design" && IsLibrary(vhdl))
            Add(Id::LIBRARY_NAME, name, VHDL);
    }

    /// Whether the file names a library so, or VHDL does for every file (IEEE 1076-1993, 11.2).
    bool IsLibrary(std::string const &folded) const {
        HdlOptions::VhdlOption const &vhdl = design.options.vhdlOption;
        for (int i = 0; i < vhdl.libraries.GetSize(); ++i)
            if (SameIgnoringCase(vhdl.libraries.At(i).View(), folded))
                return true;
        return folded == "std" || folded == "work" ||
               (vhdl.useDefaultLibrary && (folded == "ieee" || folded == "korbal"));
    }

    void CheckSignal(Signal const &signal) {
        WrittenName name{BaseOf(signal), signal.IsPort() ? "port" : "net", &signal,
                         design.options.verilogOption.signalCase};
        name.shown = signal.GetNameRef().View();
        if (SameIgnoringCase(name.shown, "open"))
            return Add(Id::OPEN_NAME, name, BOTH);
        if (signal.GetSignalType() == Signal::SIGNAL_SCALAR && CheckScalar(signal, name))
            return;
        Check(name);
    }

    /// A name with brackets on a scalar: true if that is all there is to say.
    bool CheckScalar(Signal const &signal, WrittenName const &name) {
        Text const &whole = signal.GetNameRef();
        if (HasNegativeBound(whole.View())) {
            Add(Id::NEGATIVE_BOUND, name, BOTH);
            return true;
        }
        Origin const origin = design.recorder.GetOrigin(&signal);
        if (!BusIndex::IsBusIndexName(whole) && origin == Origin::DECLARED)
            return false;
        Add(origin == Origin::COMPOUND   ? Id::BIT_WITHOUT_BUS
            : origin == Origin::BRACKETS ? Id::BRACKETED_BIT
                                         : Id::ONE_BIT_DECLARATION,
            name, BOTH);
        return true;
    }

    void CheckPin(Component const &component, Pin const &pin) {
        WrittenName name{BaseOf(pin), "pin", &pin};
        name.owner = std::string(component.GetNameRef().View()) + ".";
        name.shown = pin.GetNameRef().View();
        if (HasNegativeBound(name.shown))
            Add(Id::NEGATIVE_BOUND, name, BOTH);
        else
            Check(name);
    }

    static bool HasNegativeBound(std::string_view name) {
        std::size_t const open = name.find('(');
        return open != std::string_view::npos &&
               (name.find("::", open) != std::string_view::npos || name.substr(open, 2) == "(:");
    }

    Design const &design;
    std::set<std::string> pinTypes;
    std::set<std::string> innerTypes; ///< of the architecture
    std::set<std::string> outerTypes; ///< of the entity
};

/// Names that meet although the library took both.
class ClashChecker {
public:
    explicit ClashChecker(Design const &checked) : design(checked) {}

    void Run() {
        design.ForEachSignal([this](Signal const *signal) {
            if (auto const *const bus = dynamic_cast<Bus const *>(signal))
                CheckBus(*bus);
        });
        CheckNetlistName();
        ForEachAttribute(design, [this](AttributeUse const &use) { CheckAttribute(use); });
        for (auto const &[signal, dummy] : design.dummies)
            CheckDummy(*signal, dummy);
    }

private:
    /// How a name is spelled in Verilog, for which names have to be alike in case to clash.
    std::string InVerilog(Object const &object) const {
        VerilogOption const &verilog = design.options.verilogOption;
        VerilogOption::CaseType nameCase = VerilogOption::CASE_DEFAULT;
        if (object.GetObjectType() == Object::OBJECT_SIGNAL)
            nameCase = verilog.signalCase;
        else if (object.GetObjectType() == Object::OBJECT_INSTANCE)
            nameCase = verilog.instanceCase;
        else if (object.GetObjectType() == Object::OBJECT_COMPONENT)
            nameCase = verilog.componentCase;
        return Cased(BaseOf(object), nameCase);
    }

    Languages Clash(Object const &left, Object const &right) const {
        return InVerilog(left) == InVerilog(right) ? BOTH : VHDL;
    }

    void AddClash(Id id, std::string const &what, Object const &found, Object const &other,
                  Languages languages) {
        Spot const spot = design.MadeAt(&found);
        design.findings.Add({id,
                             spot.line > 0 ? spot : design.MadeAt(&other),
                             what + " " + Quoted(found.GetNameRef().View()),
                             {{&other, "the other one is here"}},
                             languages,
                             Quoted(other.GetNameRef().View())});
    }

    void CheckBus(Bus const &bus) {
        std::string const base(BaseOf(bus));
        if (Signal const *const scalar = design.netlist.GetSignal(base.c_str()))
            AddClash(Id::NET_BESIDE_BUS, "net", *scalar, bus, Clash(*scalar, bus));
        if (Instance const *const instance = design.netlist.GetInstance(base.c_str()))
            AddClash(Id::INSTANCE_NAMED_LIKE_BUS, "instance", *instance, bus,
                     Clash(*instance, bus));
        Component const *const component = design.netlist.GetComponent(base.c_str());
        if (component && design.IsUsed(component))
            AddClash(Id::COMPONENT_NAMED_LIKE_BUS, "component", *component, bus, VHDL);
        ForEach(bus.GetBusSliceIterator(), [&](Signal const *part) { CheckCase(*part, bus); });
    }

    void CheckCase(Signal const &part, Bus const &bus) {
        VerilogOption::CaseType const nameCase = design.options.verilogOption.signalCase;
        bool const isInside = design.IsInside(part);
        std::string const base = Cased(BaseOf(bus), nameCase);
        std::string const partBase =
            isInside ? Cased(BaseOf(part), nameCase) : std::string(BaseOf(part));
        // The dummy of a part is inside and stands in its place.
        bool const isReplaced = !isInside && design.DummyOf(&bus);
        if (base == partBase || isReplaced || !design.IsWritten(part))
            return;
        Id const id = isInside || nameCase == VerilogOption::CASE_DEFAULT ? Id::BIT_IN_OTHER_CASE
                                                                          : Id::WIDENED_SLICE_CASE;
        design.findings.Add({id,
                             design.NetAt(part),
                             NetName(part),
                             {{&bus, "the bus is called " + Quoted(BaseOf(bus)) + " here"}}});
    }

    void CheckNetlistName() {
        Text const &name = design.netlist.GetNameRef();
        Component const *const component = design.netlist.GetComponent(name);
        if (!component || !design.IsUsed(component))
            return;
        AddClash(Id::NETLIST_NAMED_LIKE_COMPONENT, "design", design.netlist, *component,
                 Clash(design.netlist, *component));
    }

    void CheckAttribute(AttributeUse const &use) {
        std::string const name(use.attribute->GetNameRef().View());
        Object const *other = nullptr;
        if (use.generic && use.kind == AttributeUse::COMPONENT) {
            ForEach(static_cast<Component const *>(use.owner)->GetPinIterator(),
                    [&](Pin const *pin) {
                        if (SameIgnoringCase(BaseOf(*pin), name))
                            other = pin;
                    });
        } else if (!use.generic || use.kind == AttributeUse::MODULE) {
            other = design.netlist.GetSignal(name.c_str());
            if (!other)
                other = design.netlist.GetParentBus(name.c_str());
            if (!other)
                other = design.netlist.GetInstance(name.c_str());
            Component const *const component = design.netlist.GetComponent(name.c_str());
            if (!other && component && design.IsUsed(component))
                other = component;
            Attribute const *const generic = design.netlist.GetAttr(name.c_str());
            if (!other && generic != use.attribute && generic &&
                (generic->IsGenericSyn() || generic->IsGenericNoSyn()))
                other = generic;
        }
        if (other)
            AddClash(Id::ATTRIBUTE_NAMED_LIKE_NET, "attribute", *use.attribute, *other,
                     use.generic && use.kind == AttributeUse::MODULE &&
                             other->GetObjectType() != Object::OBJECT_COMPONENT
                         ? Clash(*use.attribute, *other)
                         : VHDL);
    }

    void CheckDummy(Signal const &signal, Design::Dummy const &dummy) {
        if (signal.GetSignalType() == Signal::SIGNAL_COMPOUND_BUS)
            return;
        Text const dummyName = signal.GetDummySignalName();
        if (dummy.again)
            return design.findings.Add({Id::DUMMY_OF_DUMMY,
                                        design.MadeAt(&signal),
                                        NetName(signal),
                                        {{dummy.again, "it is a member of this compound"}},
                                        BOTH,
                                        Quoted(dummyName.View())});
        std::string const base(BaseOf(dummyName.View()));
        bool const itself = SameIgnoringCase(base, BaseOf(signal));
        Object const *taken = design.netlist.GetSignal(base.c_str());
        if (!taken)
            taken = design.netlist.GetParentBus(base.c_str());
        if (!taken)
            taken = design.netlist.GetInstance(base.c_str());
        if (!taken)
            return;
        bool const alike =
            Cased(base, design.options.verilogOption.signalCase) == InVerilog(*taken);
        design.findings.Add({itself ? Id::DUMMY_OF_DUMMY : Id::DUMMY_NAME_TAKEN,
                             design.MadeAt(&signal),
                             NetName(signal),
                             {{itself ? dummy.demand : taken, "the other one is here"}},
                             itself || alike ? BOTH : VHDL,
                             Quoted(dummyName.View())});
    }

    Design const &design;
};

} // namespace

void CheckNames(Design const &design) {
    NameChecker(design).Run();
    ClashChecker(design).Run();
}

} // namespace Checks
