// Hints that search the design: what the user most likely meant, or what is in the way.

#include "tool/diagnostics/Hints.h"

#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;

namespace {

/// How many pins are compared for one hint. Without a limit, a file that asks a large component
/// again and again for pins that it does not have would take time as the square of its length.
constexpr int MAX_PINS_COMPARED = 1000;

/// The first pin that differs from the wanted one by its range alone, null if there is none.
Pin const *PinOfThatBase(Iterator<Pin *> pins, std::string const &wanted) {
    auto const base = Object::GetBaseName(wanted.c_str());
    int compared = 0;
    for (; pins.HasMore() && compared < MAX_PINS_COMPARED; pins.Advance(), ++compared)
        if (Pin const *const pin = pins.Current()) {
            std::string_view const name = pin->GetNameRef().View();
            // The base name is cut off only where the first letters agree, as it takes memory.
            if (BeginsWith(name, base.View()) &&
                SameIgnoringCase(pin->GetBaseName().View(), base.View()))
                return pin;
        }
    return nullptr;
}

} // namespace

std::string HintForMissing(int kind, std::string_view name) {
    switch (kind) {
    case Exception::COMPONENT_NOT_FOUND:
        return "there is no component of that name: declare it first with ADD COMPONENT";
    case Exception::INSTANCE_NOT_FOUND:
        return "there is no instance of that name: declare it first with ADD INSTANCE";
    case Exception::ATTRIBUTE_NOT_FOUND:
        return "add it first with ADD ... ATTRIBUTE";
    case Exception::SIGNAL_NOT_FOUND: {
        Basis::StringBase<char> form(name);
        Object::NormalizeName(form);
        // A bit never brings its bus into being, so that its bus has to be declared.
        if (!BusIndex::IsBusIndexName(form))
            return "declare it first with ADD SIGNAL or ADD PORT";
        return "declare the bus first: ADD SIGNAL " +
               std::string(Object::GetBaseName(form).View()) + "(LEFT:RIGHT)";
    }
    default:
        return "";
    }
}

std::string HintForMissingPin(Model const &model, bool ofInstance, std::string const &holder,
                              std::string const &pin) {
    Instance const *const instance = ofInstance ? model.GetInstance(holder.c_str()) : nullptr;
    Component const *const component = ofInstance ? nullptr : model.GetComponent(holder.c_str());
    Pin const *const similar = instance    ? PinOfThatBase(instance->GetPinIterator(), pin)
                               : component ? PinOfThatBase(component->GetPinIterator(), pin)
                                           : nullptr;
    if (similar)
        return "the pin is called " + holder + "." + std::string(similar->GetNameRef().View());
    return ofInstance ? "declare it with ADD PIN before the instance is made: instances made "
                        "earlier do not get it"
                      : "declare it first with ADD PIN";
}

std::string HintForTaken(Model const &model, std::string const &name) {
    // The library refuses a name that a component, an instance or a signal has, and a second bus of
    // one base name.
    std::pair<char const *, Object const *> const owners[] = {
        {"component", model.GetComponent(name.c_str())},
        {"instance", model.GetInstance(name.c_str())},
        {"signal", model.GetSignal(name.c_str())},
        {"bus", model.GetNetlist()->GetParentBus(name.c_str())}};
    for (auto const &[kind, object] : owners)
        if (object)
            return std::string("the ") + kind + " " + Quoted(object->GetNameRef().View()) +
                   " has it; names ignore case";
    return "";
}
