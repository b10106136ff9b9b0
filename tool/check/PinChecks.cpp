// Pins of components and of instances, and the parts of buses that are on them.

#include <algorithm>
#include <map>
#include <unordered_map>

#include "tool/check/Design.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

bool IsScalarWithBrackets(Pin const &pin) {
    return pin.GetPinType() == Pin::PIN_SCALAR &&
           pin.GetNameRef().View().find('(') != std::string_view::npos;
}

/// One bit, or the bits of a bus pin.
long long WidthOf(Pin const &pin) {
    Range range;
    if (pin.GetPinType() == Pin::PIN_SCALAR && !IsScalarWithBrackets(pin))
        return 1;
    GetRange(pin.GetNameRef(), range);
    return range.Width();
}

void CheckComponent(Design const &design, Component const &component) {
    bool const isDeclared = !design.options.vhdlOption.suppressComponent;
    std::map<std::string, Pin const *> pinsByBase;
    ForEach(component.GetPinIterator(), [&](Pin const *pin) {
        bool const isBit = BusIndex::IsBusIndexName(pin->GetNameRef());
        CompactLocation const spot = design.MadeAt(pin);
        if (IsScalarWithBrackets(*pin) && (isBit || Bus::IsBusName(pin->GetNameRef())))
            design.findings.Add({Id::BRACKETED_PIN,
                                 spot,
                                 PinName(component, *pin),
                                 {},
                                 isBit && isDeclared ? BOTH : VERILOG});
        else if (isBit && isDeclared)
            design.findings.Add({Id::ONE_BIT_PIN, spot, PinName(component, *pin)});
        auto const [former, isNew] = pinsByBase.try_emplace(Lowercase(BaseOf(*pin)), pin);
        if (isNew || IsScalarWithBrackets(*pin))
            return;
        // Bits of one bus are a port map that VHDL takes, if a package declares the component.
        bool const formerIsBit = BusIndex::IsBusIndexName(former->second->GetNameRef());
        design.findings.Add({Id::REPEATED_PIN,
                             spot,
                             PinName(component, *pin),
                             {{former->second, "the other one is here"}},
                             isBit && formerIsBit ? VERILOG : BOTH});
    });
}

/// Pins are appended to the component: the late ones are those after the instance's. Each gets one
/// finding, with the first instance that lacks it.
void CheckLatePins(Design const &design) {
    std::unordered_map<Component const *, int> checkedFrom; ///< the pins from this one on
    design.ForEachInstance([&](Instance const *instance) {
        Component const *const component = instance->GetComponent();
        if (!component)
            return;
        auto const &all = *component->GetPinIterator().GetArray();
        int const own = instance->GetPinIterator().GetArray()->GetSize();
        if (own >= all.GetSize())
            return;
        int &end = checkedFrom.try_emplace(component, all.GetSize()).first->second;
        for (int i = own; i < end; ++i)
            design.findings.Add({Id::LATE_PIN,
                                 design.MadeAt(all.GetAt(i)),
                                 PinName(*component, *all.GetAt(i)),
                                 {{instance, "this instance goes without it"}}});
        end = std::min(end, own);
    });
}

void CheckInstancePin(Design const &design, Instance const &instance, Pin const &pin) {
    Signal const *const signal = pin.GetSignal();
    if (!signal) {
        bool const staysOpen =
            design.options.vhdlOption.openPin || pin.GetPinType() == Pin::PIN_BUS_INDEX;
        if (staysOpen && pin.GetPolarity() == Polarity::INPUT)
            design.findings.Add({Id::OPEN_INPUT, design.MadeAt(&instance), PinName(instance, pin)});
        return;
    }
    long long const pinWidth = WidthOf(pin);
    int const width = signal->GetWidth();
    if (width > 0 && width != pinWidth)
        design.findings.Add({Id::PIN_WIDTH,
                             design.ConnectedAt(instance, pin),
                             PinName(instance, pin),
                             {{signal, "the net is here"}},
                             BOTH,
                             std::to_string(pinWidth) + " to " + std::to_string(width) + " of " +
                                 Quoted(signal->GetNameRef().View())});
    // A bit of a pin takes a slice of one bit, a scalar pin does not.
    bool const isPlain = pin.GetPinType() == Pin::PIN_SCALAR && !IsScalarWithBrackets(pin);
    if (isPlain && width == 1 && signal->GetSignalType() == Signal::SIGNAL_BUS_SLICE)
        design.findings.Add({Id::ONE_BIT_SLICE,
                             design.ConnectedAt(instance, pin),
                             NetName(*signal),
                             {},
                             VHDL,
                             "on the scalar " + PinName(instance, pin)});
}

/// A part of a bus, wherever it is used.
void CheckSlice(Design const &design, Bus const &bus, BusSlice const &slice) {
    bool onPin = false;
    Design::ForEachPinOn(slice, [&onPin](Pin const *) { onPin = true; });
    bool inAssignment = slice.GetSignalIterator().HasMore() && design.IsInside(slice);
    for (Use const &use : design.FurtherUses(&slice)) {
        onPin |= use.pin != nullptr;
        inAssignment |= use.pin == nullptr;
    }
    bool const hasConstant = slice.HasConstantValue() && design.IsInside(slice);
    if (!onPin && !inAssignment && !hasConstant)
        return;
    Range range;
    Range whole;
    GetRange(slice.GetNameRef(), range);
    GetRange(bus.GetNameRef(), whole);
    if (whole.Width() < 2 || range.IsDown() == whole.IsDown()) {
        // One bit is written with "downto", also of a bus that runs up.
        if (range.Width() == 1 && whole.Width() > 1 && !whole.IsDown())
            design.findings.Add({Id::ONE_BIT_SLICE,
                                 design.NetAt(slice),
                                 NetName(slice),
                                 {},
                                 VHDL,
                                 "of a bus that runs up"});
    } else if (range.Width() > 1) {
        Languages const languages = (inAssignment || hasConstant ? VHDL : NO_LANGUAGE) |
                                    (inAssignment || onPin ? VERILOG : NO_LANGUAGE);
        design.findings.Add({Id::REVERSED_SLICE,
                             design.NetAt(slice),
                             NetName(slice),
                             {{&bus, "the bus is " + Quoted(bus.GetNameRef().View())}},
                             languages});
    }
}

} // namespace

void CheckPins(Design const &design) {
    design.ForEachUsedComponent(
        [&](Component const *component) { CheckComponent(design, *component); });
    CheckLatePins(design);
    design.ForEachPin(
        [&](Instance const &instance, Pin const &pin) { CheckInstancePin(design, instance, pin); });
    design.ForEachSignal([&](Signal const *signal) {
        auto const *const bus = dynamic_cast<Bus const *>(signal);
        if (bus)
            ForEach(bus->GetBusSliceIterator(), [&](Signal const *part) {
                if (auto const *const slice = dynamic_cast<BusSlice const *>(part))
                    CheckSlice(design, *bus, *slice);
            });
    });
}

} // namespace Checks
