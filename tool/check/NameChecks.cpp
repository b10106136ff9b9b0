// Names: whether the languages take them, and whether two of them meet.

#include <unordered_map>
#include <unordered_set>

#include "tool/check/Attributes.h"
#include "tool/check/Identifiers.h"
#include "tool/check/SeededHash.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

using VerilogOption = HdlOptions::VerilogOption;

/// A name as it is going to be written.
struct WrittenName {
    std::string_view name; ///< without brackets
    std::string_view what; ///< "net", "component", ...
    void const *object;
    VerilogOption::CaseType nameCase = VerilogOption::CASE_DEFAULT;
    Languages languages = BOTH;
    std::string_view shown = {};  ///< where it differs from the name
    std::string_view owner = {};  ///< of a pin
    bool inEntity = false;        ///< declared there
    bool inConfiguration = false; ///< visible in a configuration that takes components from work

    std::string Subject() const {
        std::string const own = Shortened(shown.empty() ? name : shown);
        return std::string(what) + " " + Quoted(owner.empty() ? own : Shortened(owner) + "." + own);
    }
};

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

Languages Of(bool vhdl, bool verilog) {
    return (vhdl ? VHDL : NO_LANGUAGE) | (verilog ? VERILOG : NO_LANGUAGE);
}

class NameChecker {
public:
    explicit NameChecker(Design const &checked) : design(checked) {
        FindUsedTypes();
        design.ForEachUsedComponent([this](Component const *component) {
            isConfigured |= IsConfigured(design, *component);
        });
        HdlOptions::VhdlOption const &vhdl = design.options.vhdlOption;
        if (vhdl.useDefaultLibrary)
            libraries = {"ieee", "korbal"};
        for (int i = 0; i < vhdl.libraries.GetSize(); ++i)
            libraries.insert(Lowercase(vhdl.libraries.At(i).View()));
    }

    void Run() {
        VerilogOption const &verilog = design.options.verilogOption;
        Check({design.netlist.GetNameRef().View(), "design", &design.netlist});
        design.ForEachUsedComponent([&](Component const *component) {
            WrittenName name{component->GetNameRef().View(), "component", component,
                             verilog.componentCase};
            name.inConfiguration = isConfigured;
            Check(name);
            ForEach(component->GetPinIterator(),
                    [&](Pin const *pin) { CheckPin(*component, *pin); });
        });
        design.ForEachInstance([&](Instance const *instance) {
            WrittenName name{instance->GetNameRef().View(), "instance", instance,
                             verilog.instanceCase};
            name.inConfiguration = isConfigured;
            Check(name);
        });
        design.ForEachSignal([&](Signal const *signal) {
            if (signal->IsNeededToDeclared())
                CheckSignal(*signal);
        });
        ForEachAttribute(design, [this](AttributeUse const &use) {
            WrittenName name{use.attribute->GetNameRef().View(), "attribute", use.attribute,
                             VerilogOption::CASE_DEFAULT, use.generic ? BOTH : VHDL};
            bool const isOuter = IsOuter(use);
            name.inEntity = isOuter && (use.generic || use.attribute->IsSynDeclared());
            name.inConfiguration = IsInConfiguration(use);
            Check(name);
        });
    }

private:
    /// Whether it is written in the entity.
    static bool IsOuter(AttributeUse const &use) {
        return use.kind == AttributeUse::MODULE ||
               (use.kind == AttributeUse::SIGNAL &&
                static_cast<Signal const *>(use.owner)->IsPort());
    }

    /// The types that declarations of the entity and of the architecture name.
    void FindUsedTypes() {
        ForEachAttribute(design, [this](AttributeUse const &use) {
            bool const isTyped = use.generic || design.options.vhdlOption.useAttrType;
            std::string type = isTyped ? VhdlTypeOf(*use.attribute) : "string";
            if (use.attribute->GetValueType() == Attribute::VALUE_USER)
                type.resize(std::min(type.find_first_of(" .("), type.size()));
            (IsOuter(use) ? outerTypes : innerTypes).insert(std::move(type));
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

    bool IsInConfiguration(AttributeUse const &use) const {
        if (use.generic && use.kind == AttributeUse::COMPONENT)
            return IsConfigured(design, static_cast<Component const &>(*use.owner));
        bool const isDeclared =
            use.generic ? use.kind == AttributeUse::MODULE : use.attribute->IsSynDeclared();
        return isDeclared && isConfigured;
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
        if (illegal != BOTH && name.name.size() <= LONGEST_WORD)
            CheckWords(name, illegal);
        CheckLibrary(name);
    }

    /// The design may not be called like a library that the file names, or VHDL does for every file
    /// (IEEE 1076-1993, 11.2).
    void CheckLibrary(WrittenName const &name) {
        bool const isDesign = name.object == &design.netlist;
        if (!isDesign && !name.inEntity && !name.inConfiguration)
            return;
        bool const isWork = SameIgnoringCase(name.name, "work");
        bool const isNamed =
            (isDesign || name.inEntity) && libraries.count(Lowercase(name.name)) > 0;
        if (isDesign && (isNamed || isWork || SameIgnoringCase(name.name, "std")))
            Add(Id::LIBRARY_NAME, name, VHDL);
        bool const isRead = name.inEntity && !design.options.vhdlOption.suppressConfiguration;
        if ((isRead && isNamed) || (name.inConfiguration && isWork))
            Add(Id::HIDDEN_LIBRARY, name, VHDL);
    }

    void CheckWords(WrittenName const &name, Languages illegal) {
        std::string const vhdl = Lowercase(name.name);
        // Most names of a large design are numbered, and no reserved word has such a digit.
        if (vhdl.find_first_of("23456789") == std::string::npos)
            CheckReserved(name, vhdl, illegal);
        CheckTypes(name, vhdl);
    }

    void CheckReserved(WrittenName const &name, std::string const &vhdl, Languages illegal) {
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
    }

    /// What the declarations of the file name besides reserved words.
    void CheckTypes(WrittenName const &name, std::string const &vhdl) {
        bool const isOuter =
            name.what == "port" || name.what == "design" || name.what == "attribute";
        if ((name.what == "pin" ? pinTypes : innerTypes).count(vhdl) > 0 ||
            (isOuter && outerTypes.count(vhdl) > 0))
            Add(Id::STANDARD_NAME, name, VHDL);
    }

    void CheckSignal(Signal const &signal) {
        WrittenName name{BaseOf(signal), signal.IsPort() ? "port" : "net", &signal,
                         design.options.verilogOption.signalCase};
        name.shown = signal.GetNameRef().View();
        name.inEntity = signal.IsPort();
        name.inConfiguration = isConfigured;
        if (SameIgnoringCase(name.shown, "open"))
            return Add(Id::OPEN_NAME, name, BOTH);
        if (signal.GetSignalType() == Signal::SIGNAL_SCALAR) {
            if (CheckScalar(signal, name))
                return;
            name.name = name.shown; // brackets and all
        }
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
        name.owner = component.GetNameRef().View();
        name.shown = pin.GetNameRef().View();
        if (!Bus::IsBusName(pin.GetNameRef()) && !BusIndex::IsBusIndexName(pin.GetNameRef()))
            name.name = name.shown; // brackets and all
        name.inConfiguration = IsConfigured(design, component);
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
    bool isConfigured = false;                             ///< some component
    std::unordered_set<std::string, SeededHash> libraries; ///< that clauses name
    std::unordered_set<std::string, SeededHash> pinTypes;
    std::unordered_set<std::string, SeededHash> innerTypes; ///< of the architecture
    std::unordered_set<std::string, SeededHash> outerTypes; ///< of the entity
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
    }

private:
    Languages Clash(Object const &left, Object const &right) const {
        return NameInVerilog(left, design.options) == NameInVerilog(right, design.options) ? BOTH
                                                                                           : VHDL;
    }

    void AddClash(Id id, std::string const &what, Object const &found, Object const &other,
                  Languages languages) {
        CompactLocation const spot = design.MadeAt(&found);
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
        if ((isInside || nameCase == VerilogOption::CASE_DEFAULT) && BaseOf(bus) == BaseOf(part))
            return;
        std::string const base = Cased(BaseOf(bus), nameCase);
        std::string const partBase =
            isInside ? Cased(BaseOf(part), nameCase) : std::string(BaseOf(part));
        // The dummy of a part is inside and takes its place.
        bool const isReplaced = !isInside && design.dummies.Find(&bus);
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

    /// The last pin of that base name; null if there is none. The attributes of a component come
    /// one after the other.
    Pin const *FindPin(Component const &component, std::string const &name) {
        if (pinsOf != &component) {
            pinsOf = &component;
            pins.clear();
            ForEach(component.GetPinIterator(),
                    [this](Pin const *pin) { pins[Lowercase(BaseOf(*pin))] = pin; });
        }
        auto const found = pins.find(Lowercase(name));
        return found == pins.end() ? nullptr : found->second;
    }

    void CheckAttribute(AttributeUse const &use) {
        std::string const name(use.attribute->GetNameRef().View());
        Object const *other = nullptr;
        if (use.generic && use.kind == AttributeUse::COMPONENT) {
            other = FindPin(*static_cast<Component const *>(use.owner), name);
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

    Design const &design;
    Component const *pinsOf = nullptr;
    std::unordered_map<std::string, Pin const *, SeededHash> pins; ///< by their base names
};

} // namespace

void CheckNames(Design const &design) {
    NameChecker(design).Run();
    ClashChecker(design).Run();
}

} // namespace Checks
