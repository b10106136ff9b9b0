// Names of the nets that a write makes: dummy signals of ports, and in VHDL the nets of open pins
// after the line Set Open Pin false.

#include <unordered_map>

#include "tool/check/Attributes.h"
#include "tool/check/SeededHash.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

class MadeNetChecker {
public:
    MadeNetChecker(Design const &checked, bool vhdlIsWritten)
        : design(checked), opens(!checked.options.vhdlOption.openPin), opensForBoth(vhdlIsWritten) {
    }

    void Run() {
        for (int i = 0; i < design.dummies.GetSize(); ++i)
            CheckDummy(design.dummies.GetAt(i));
        if (opens || design.places.HasOpen())
            design.ForEachPin([this](Instance const &instance, Pin const &pin) {
                if (IsOpened(pin))
                    CheckOpen(instance, pin);
            });
    }

private:
    /// What else the design declares by a name.
    struct Taken {
        Object const *object = nullptr;
        bool inVerilog = false; ///< also a declaration there
    };

    Taken FindTaken(std::string const &name) {
        Netlist const &netlist = design.netlist;
        Signal const *signal = netlist.GetSignal(name.c_str());
        if (!signal || design.places.IsOpen(signal))
            signal = netlist.GetParentBus(name.c_str());
        if (signal && !design.places.IsOpen(signal))
            return {signal, true};
        if (Instance const *const instance = netlist.GetInstance(name.c_str()))
            return {instance, true};
        Attribute const *const generic =
            netlist.HasAttrs() ? netlist.GetAttr(name.c_str()) : nullptr;
        if (generic && (generic->IsGenericSyn() || generic->IsGenericNoSyn()))
            return {generic, true};
        Component const *const component = netlist.GetComponent(name.c_str());
        if (component && design.IsUsed(component))
            return {component, false};
        return {FindAttribute(name), false};
    }

    /// An attribute that is written in VHDL by a statement of its own.
    Attribute const *FindAttribute(std::string const &name) {
        if (!attributesAreKnown)
            ForEachAttribute(design, [this](AttributeUse const &use) {
                if (!use.generic)
                    attributes.try_emplace(Lowercase(use.attribute->GetNameRef().View()),
                                           use.attribute);
            });
        attributesAreKnown = true;
        auto const found = attributes.empty() ? attributes.end() : attributes.find(Lowercase(name));
        return found == attributes.end() ? nullptr : found->second;
    }

    bool IsTakenInVerilog(std::string const &name, Taken const &taken) const {
        return taken.inVerilog && Cased(name, design.options.verilogOption.signalCase) ==
                                      NameInVerilog(*taken.object, design.options);
    }

    /// A net gets one finding, whatever becomes of its dummy signal.
    void CheckDummy(DummyPlan::Step const &step) {
        Signal const &signal = *step.net;
        if (signal.GetSignalType() == Signal::SIGNAL_COMPOUND_BUS || step.former != DummyPlan::NONE)
            return;
        Text const dummyName = signal.GetDummySignalName();
        auto const add = [&](Id id, Related related, Languages languages) {
            design.findings.Add({id,
                                 design.MadeAt(&signal),
                                 NetName(signal),
                                 {std::move(related)},
                                 languages,
                                 Quoted(dummyName.View())});
        };
        if (step.later != DummyPlan::NONE)
            return add(Id::DUMMY_OF_DUMMY,
                       {design.dummies.GetAt(step.later).demand, "it is a member of this compound"},
                       BOTH);
        std::string const base(BaseOf(dummyName.View()));
        if (SameIgnoringCase(base, BaseOf(signal)))
            return add(Id::DUMMY_OF_DUMMY, {step.demand, "the other one is here"}, BOTH);
        Taken const taken = FindTaken(base);
        if (taken.object)
            add(Id::DUMMY_NAME_TAKEN, {taken.object, "the other one is here"},
                IsTakenInVerilog(base, taken) ? BOTH : VHDL);
    }

    /// Whether a write gave the pin a net of its own, or one in VHDL is going to.
    bool IsOpened(Pin const &pin) const {
        if (Signal const *const signal = pin.GetSignal())
            return design.places.IsOpen(signal);
        return opens && pin.GetPolarity() == Polarity::INPUT &&
               pin.GetPinType() != Pin::PIN_BUS_INDEX;
    }

    void CheckOpen(Instance const &instance, Pin const &pin) {
        Languages const writers = pin.GetSignal() || opensForBoth ? BOTH : VHDL;
        bool const isBus = pin.GetPinType() == Pin::PIN_BUS;
        std::string name(instance.GetNameRef().View());
        name += '_';
        name += isBus ? BaseOf(pin) : pin.GetNameRef().View();
        name += "_openSignal";
        auto const add = [&](Id id, CompactLocation spot, std::string subject, Languages languages,
                             std::vector<Related> related = {}) {
            design.findings.Add({id, spot, std::move(subject), std::move(related),
                                 languages & writers, Quoted(name)});
        };
        if (name.find('(') != std::string::npos)
            add(Id::OPEN_NET_NAME, design.MadeAt(&instance), PinName(instance, pin), BOTH);
        Taken taken = FindTaken(name);
        auto const [former, isNew] = pins.try_emplace(Lowercase(name), OpenedPin{&instance, name});
        bool isAlike = taken.object && IsTakenInVerilog(name, taken);
        if (!taken.object && !isNew) {
            auto const nameCase = design.options.verilogOption.signalCase;
            taken.object = former->second.instance;
            isAlike = Cased(name, nameCase) == Cased(former->second.net, nameCase);
        }
        if (taken.object)
            add(Id::OPEN_NET_NAME, design.MadeAt(&instance), PinName(instance, pin),
                isAlike ? BOTH : VHDL, {{taken.object, "the other one is here"}});
    }

    struct OpenedPin {
        Instance const *instance;
        std::string net;
    };

    Design const &design;
    bool opens;        ///< a VHDL write opens pins
    bool opensForBoth; ///< it comes before the text that is checked
    bool attributesAreKnown = false;
    std::unordered_map<std::string, Attribute const *, SeededHash> attributes;
    std::unordered_map<std::string, OpenedPin, SeededHash> pins; ///< by their nets
};

} // namespace

void CheckMadeNets(Design const &design, bool vhdlIsWritten) {
    MadeNetChecker(design, vhdlIsWritten).Run();
}

} // namespace Checks
