// Client calls in any order: objects are made, connected, copied, renamed, removed and written, and
// their owners end in any order. Some calls leave pointers to objects that no longer exist. On
// objects with such pointers only those calls are then made that use the object's own data: its
// name, lists whose pointers are compared but not dereferenced, the pins of an instance.

#include <random>

#include "fuzz/World.h"
#include "tests/support/RandomLines.h"

using namespace Vesk_Hdl;
using namespace Vesk_Hdl::Fuzz;

namespace {

/// One call with the objects that it is made on.
struct Call {
    explicit Call(World &of) : world(of) {}

    World &world;
    Netlist *netlist = nullptr;
    Model *model = nullptr;
    Signal *signal = nullptr, *other = nullptr;
    Pin *pin = nullptr, *otherPin = nullptr;
    Component *component = nullptr;
    Instance *instance = nullptr;
    Attribute *attribute = nullptr;
    AttributeHolder *holder = nullptr, *otherHolder = nullptr;
    Object *object = nullptr, *otherObject = nullptr;
    std::string name, text;
    unsigned int number = 0;
    std::string picked; ///< what was chosen, to be printed with SHOW_CALLS

    Bus &AsBus() const { return *static_cast<Bus *>(signal); }
    CompoundBus &AsCompound() const { return *static_cast<CompoundBus *>(signal); }
    Polarity::Value Direction() const { // sometimes a value outside of the enumeration
        int const value = static_cast<int>(number) - 1;
        return static_cast<Polarity::Value>(value > 4 ? value << 16 : value);
    }

    template <class T> T *Of(Known<T> const &known, std::vector<T *> const &all) {
        T *const found = world.choices.Of(all);
        picked += found ? " #" + std::to_string(known.NumberOf(found)) : "";
        return found;
    }
    template <class T> T *Of(Known<T> const &known) { return Of(known, known.Living()); }
    Signal *OfClass(Signal::SignalType type) {
        return Of(world.signals, world.signals.All([type](auto const &entry) {
            return entry.lives && entry.object->GetSignalType() == type;
        }));
    }
    template <class T> T *OfAny() {
        std::vector<T *> all;
        auto const take = [&all](auto const &living) {
            all.insert(all.end(), living.begin(), living.end());
        };
        take(world.signals.Living());
        take(world.pins.Living());
        take(world.components.Living());
        take(world.instances.Living());
        take(world.netlists.Living());
        return world.choices.Of(all);
    }
};

/// What the letters of Operation::picks choose; null or false if there is none.
struct Letter {
    char letter;
    bool (*pick)(Call &);
};
constexpr Letter LETTERS[] = {
    {'n', [](Call &c) { return !!(c.netlist = c.Of(c.world.netlists)); }},
    {'m', // a netlist with a model
     [](Call &c) {
         c.netlist = c.Of(c.world.netlists);
         return c.netlist && (c.model = c.world.models[c.netlist]);
     }},
    {'s', [](Call &c) { return !!(c.signal = c.Of(c.world.signals)); }},
    {'t', [](Call &c) { return !!(c.other = c.Of(c.world.signals)); }},
    {'g', // may be gone
     [](Call &c) {
         auto const all = c.world.signals.All([](auto const &) { return true; });
         return !!(c.other = c.Of(c.world.signals, all));
     }},
    {'b', [](Call &c) { return !!(c.signal = c.OfClass(Signal::SIGNAL_BUS)); }},
    {'k', [](Call &c) { return !!(c.signal = c.OfClass(Signal::SIGNAL_COMPOUND_BUS)); }},
    {'p', [](Call &c) { return !!(c.pin = c.Of(c.world.pins)); }},
    {'q', [](Call &c) { return !!(c.otherPin = c.Of(c.world.pins)); }},
    {'c', [](Call &c) { return !!(c.component = c.Of(c.world.components)); }},
    {'i', [](Call &c) { return !!(c.instance = c.Of(c.world.instances)); }},
    {'a', [](Call &c) { return !!(c.attribute = c.Of(c.world.attributes)); }},
    {'h', [](Call &c) { return !!(c.holder = c.OfAny<AttributeHolder>()); }},
    {'H', [](Call &c) { return !!(c.otherHolder = c.OfAny<AttributeHolder>()); }},
    {'o', [](Call &c) { return !!(c.object = c.OfAny<Object>()); }},
    {'O', [](Call &c) { return !!(c.otherObject = c.OfAny<Object>()); }},
    {'N', [](Call &c) { return c.picked += " " + (c.name = c.world.choices.Name()), true; }},
    {'V', [](Call &c) { return c.picked += " " + (c.text = c.world.choices.Text()), true; }},
    {'#',
     [](Call &c) {
         c.number = c.world.choices.Below(8);
         return c.picked += " " + std::to_string(c.number), true;
     }},
};

/// The netlist owns two thirds of the objects, the client the others.
template <class T> void Give(Call &c, Known<T> &known, T *made) {
    bool const isOwn = c.world.choices.Below(3) == 2;
    if (!isOwn)
        c.netlist->Add(made);
    known.Add(made, isOwn ? nullptr : c.netlist);
}
template <class T> void HandOver(Call &c, Known<T> &known, T *object) {
    if (!known.IsOwn(object))
        return;
    c.netlist->Add(object);
    known.Get(object).owner = c.netlist;
}

void MakeSignal(Call &c) {
    char const *const name = c.name.c_str();
    Bus *const parent = c.netlist->GetParentBus(name);
    Signal *const made = c.number < 2    ? static_cast<Signal *>(new ScalarSignal(name))
                         : c.number < 4  ? static_cast<Signal *>(new Bus(name))
                         : c.number == 4 ? static_cast<Signal *>(new BusSlice(name, parent))
                         : c.number == 5 ? static_cast<Signal *>(new BusIndex(name, parent))
                                         : new CompoundBus(name);
    Give(c, c.world.signals, made);
}

void MakeAttribute(Call &c) {
    static char const *const TYPES[] = {"String", "integer",   "Float", "BOOLEAN",
                                        "Bit",    "BitVector", "User",  "none"};
    static char const *const WORDS[] = {"SYN", "nosyn", "ASSIGN", "ASSIGNNODEC", "NONE", "x"};
    Attribute *const made = AttributeFactory::GetInstance().CreateAttribute(
        TYPES[c.number], c.name.c_str(), c.text.c_str());
    if (!made)
        return;
    made->SetGeneric(WORDS[c.world.choices.Below(std::size(WORDS))]);
    made->SetSynAttr(WORDS[c.world.choices.Below(std::size(WORDS))]);
    c.world.attributes.Add(made, nullptr);
}

/// A netlist of the client, of a model of the client, or of a model of the engine.
void MakeNetlist(Call &c) {
    World &world = c.world;
    if (world.netlists.Living().size() > 3)
        return;
    bool const isEngines =
        c.number % 3 == 0 && world.engine.CreateAndAddModel(c.name.c_str(), nullptr);
    Model *const model = isEngines           ? world.engine.GetModel(c.name.c_str())
                         : c.number % 3 == 1 ? new Model(&world.factory)
                                             : nullptr;
    Netlist *const made = model ? model->GetNetlist() : new Netlist(c.name.c_str());
    if (model)
        model->SetWriteOpener(&world.capture);
    world.netlists.Add(made, isEngines ? &world.engine : nullptr);
    world.models[made] = model;
}

template <class Class, class Base> bool AssignAs(Base &to, Base const &from) {
    auto *const target = dynamic_cast<Class *>(&to);
    auto const *const source = dynamic_cast<Class const *>(&from);
    if (target && source)
        *target = *source;
    return target && source;
}

void AssignPin(Call &c) {
    Pin &to = *c.pin;
    Pin const &from = *c.otherPin;
    AssignAs<ScalarPin>(to, from) || AssignAs<BusPin>(to, from) ||
        AssignAs<BusIndexPin>(to, from) || AssignAs<Pin>(to, from);
    FUZZ_EXPECT(to == from && to.GetSignal() == from.GetSignal() &&
                    to.GetPolarity() == from.GetPolarity(),
                "%s", from.GetName().GetText());
}

void AssignAttribute(Call &c) {
    if (!c.holder->HasAttrs())
        return;
    Attribute &to = *c.holder->GetAttrIterator().Current();
    Attribute const &from = *c.attribute;
    AssignAs<AttributeString>(to, from) || AssignAs<AttributeInteger>(to, from) ||
        AssignAs<AttributeFloat>(to, from) || AssignAs<AttributeBoolean>(to, from) ||
        AssignAs<AttributeBit>(to, from) || AssignAs<AttributeBitVector>(to, from) ||
        AssignAs<AttributeUser>(to, from) || AssignAs<Attribute>(to, from);
    c.world.attributes.Add(to.CloneAttribute(), nullptr);
}

/// Assignment through the base class copies name and comment only.
void AssignObject(Call &c) {
    auto const *const pin = dynamic_cast<Pin *>(c.object);
    Polarity const polarity = pin ? pin->GetPolarity() : Polarity();
    Signal const *const signal = pin ? pin->GetSignal() : nullptr;
    *c.object = *c.otherObject;
    FUZZ_EXPECT(c.object->GetNameRef() == c.otherObject->GetNameRef(), "another name");
    FUZZ_EXPECT(!pin || (pin->GetPolarity() == polarity && pin->GetSignal() == signal), "a pin");
}

void AddTwentyPins(Call &c) { // more than a component finds without an index
    for (int i = 0; i < 20; ++i)
        c.component->AddPin(("p" + std::to_string(i)).c_str(), static_cast<Polarity::Value>(i % 3),
                            "");
}

void HandOverAttribute(Call &c) {
    c.world.attributes.Bury(c.attribute);
    c.holder->AddAttr(c.attribute);
}

void SetPolarity(Call &c) {
    c.pin->SetPolarity(c.Direction());
    FUZZ_EXPECT(c.pin->GetPolarity() == c.Direction(), "%d", c.Direction());
}

void ConnectAllPins(Call &c) {
    for (Pin *const pin : c.world.pins.Living())
        c.signal->Connect(pin);
}

void AddMember(Call &c) {
    int const size = c.AsCompound().GetSize();
    c.AsCompound().AddBusMember(c.other);
    FUZZ_EXPECT(c.AsCompound().GetSize() == size + 1 && c.AsCompound().GetAt(size) == c.other,
                "a member is left out");
}

void SetMember(Call &c) {
    int const place = static_cast<int>(c.number);
    c.AsCompound().SetAt(place, c.other);
    FUZZ_EXPECT(c.AsCompound().GetAt(place) == c.other, "a member is left out");
}

/// The first of that name is found.
template <class Holder> void FindPin(Holder const &holder, std::string const &name) {
    Basis::StringBase<char> wanted(name.c_str());
    Object::NormalizeName(wanted);
    Pin *first = nullptr;
    ForEach(holder.GetPinIterator(),
            [&](Pin *pin) { first = !first && pin->IsNamed(wanted) ? pin : first; });
    FUZZ_EXPECT(holder.GetPin(name.c_str()) == first, "%s", name.c_str());
}

void AskSignal(Call &c) {
    SignalVisitor visitor;
    StringSet names;
    c.signal->AcceptSignal(visitor);
    c.signal->GetBaseName(names);
    c.signal->SetPortPolarity(c.signal->GetPortPolarity());
    FUZZ_EXPECT(c.signal->GetWidth() >= 0 && !names.IsEmpty(), "no name");
    FUZZ_EXPECT(!c.signal->IsPort() || c.signal->GetPortPolarity() != Polarity::INVALID, "a port");
    c.signal->GetDummySignalName();
}

void AskInstance(Call &c) {
    PtrArray<Pin *> open, inputs;
    FUZZ_EXPECT(c.instance->GetOpenPin(open, false) || !c.instance->GetOpenPin(inputs, true),
                "an open input is no open pin");
    FindPin(*c.instance, c.name);
    c.instance->SortPinName();
    FindPin(*c.instance, c.name);
}

void AskForPorts(Call &c) {
    PtrArray<Pin *> found;
    c.instance->GetOutPortConnectedToInPin(found);
    c.instance->GetInPortConnectedToOutPin(found);
}

void AskNetlist(Call &c) {
    char const *const name = c.name.c_str();
    Signal const *const signal = c.netlist->GetSignal(name);
    Instance const *const instance = c.netlist->GetInstance(name);
    Component const *const component = c.netlist->GetComponent(name);
    FUZZ_EXPECT((!signal || c.world.signals.Lives(signal)) &&
                    (!instance || c.world.instances.Lives(instance)) &&
                    (!component || c.world.components.Lives(component)),
                "%s is gone", name);
    PtrArray<Instance *> placed;
    c.netlist->GetInstances(c.instance->GetComponent(), placed);
    FUZZ_EXPECT(
        placed.Contains(c.instance) ==
            (c.instance->GetComponent() && c.world.instances.Get(c.instance).owner == c.netlist),
        "%s", name);
}

void Write(Call &c) {
    TextMemOutStream text("");
    HdlOptions options;
    options.writeHeader = c.number == 7;
    options.vhdlOption.openPin = c.number & 1;
    options.vhdlOption.useAttrType = c.number & 2;
    if (c.number & 4)
        VerilogNetlister(text).WriteNetlist(c.netlist, options);
    else
        VhdlNetlister(text).WriteNetlist(c.netlist, &options);
    FUZZ_EXPECT(!text.GetValue().IsEmpty(), "nothing is written");
}

void RunLines(Call &c) {
    std::mt19937 random(c.number);
    RandomLines lines(random);
    for (unsigned int left = 1 + c.world.choices.Below(20); left > 0; --left)
        try {
            c.model->Execute(lines.Next().c_str());
        } catch (Exception const &) {
        }
    c.world.capture.Take();
}

/// First clears all pointers to the signal, except those of compounds.
void RemoveSignalNeatly(Call &c) {
    for (Signal *const other : c.world.signals.Living()) {
        other->Disconnect(c.signal);
        if (auto *const bus = dynamic_cast<Bus *>(other))
            bus->RemoveBusSlice(c.signal);
    }
    for (Pin *const pin : c.world.pins.Living())
        if (pin->GetSignal() == c.signal)
            pin->Disconnect();
    c.world.Remove(c.world.signals, c.signal);
}

void RemoveInstanceNeatly(Call &c) {
    for (Signal *const signal : c.world.signals.Living())
        ForEach(c.instance->GetPinIterator(), [&](Pin *pin) { signal->Disconnect(pin); });
    c.world.Remove(c.world.instances, c.instance);
}

using May = bool (*)(Call const &);
bool Always(Call const &) { return true; }
bool PinsLive(Call const &c) {
    return c.world.PinsLive(c.signal) && (!c.other || c.world.PinsLive(c.other));
}
bool CanAskSignal(Call const &c) { return c.world.CanWalk({c.signal}, MEMBERS); }
bool CanAskForPorts(Call const &c) { return c.world.CanWalk(SignalsOn(c.instance), MEMBERS); }
bool CanSort(Call const &c) { return c.world.CanWalk(c.netlist, MEMBERS); }
bool CanPrepare(Call const &c) { return c.world.CanWalk(c.netlist, PINS | SLICES); }
bool CanWrite(Call const &c) { return c.world.CanWrite(c.netlist); }
bool CanWiden(Call const &c) { return c.world.CanWiden(c.netlist); }
bool CanRunLines(Call const &c) { return CanWrite(c) && CanWiden(c); }
bool ComponentLives(Call const &c) { return c.world.ComponentLives(c.instance); }
bool IsOwnPin(Call const &c) { return c.world.pins.IsOwn(c.pin); }

struct Operation {
    char const *name;
    char const *picks;
    void (*act)(Call &);
    May may = Always;
};

constexpr Operation OPERATIONS[] = {
    // Objects are made.
    {"make a signal", "nN#", MakeSignal},
    {"make an attribute", "NV#", MakeAttribute},
    {"make a netlist", "N#", MakeNetlist},
    {"make a component", "nN",
     [](Call &c) { Give(c, c.world.components, new Component(c.name.c_str())); }},
    {"make an instance", "nNc",
     [](Call &c) { Give(c, c.world.instances, new Instance(c.name.c_str(), c.component)); }},
    {"make an instance of nothing", "nN",
     [](Call &c) { Give(c, c.world.instances, new Instance(c.name.c_str(), nullptr)); }},
    {"add a pin", "cN#V",
     [](Call &c) { c.component->AddPin(c.name.c_str(), c.Direction(), c.text.c_str()); }},
    {"add twenty pins", "c", AddTwentyPins},
    {"add a pin like another", "cp", [](Call &c) { c.component->AddPin(*c.pin); }},
    {"clone a pin", "p", [](Call &c) { c.world.pins.Add(c.pin->ClonePin(), nullptr); }},
    {"hand over a signal", "ns", [](Call &c) { HandOver(c, c.world.signals, c.signal); }},
    {"hand over a component", "nc", [](Call &c) { HandOver(c, c.world.components, c.component); }},
    {"hand over an instance", "ni", [](Call &c) { HandOver(c, c.world.instances, c.instance); }},
    {"hand over an attribute", "ah", HandOverAttribute},
    // They change.
    {"rename", "oN", [](Call &c) { c.object->SetName(c.name.c_str()); }},
    {"comment", "oV", [](Call &c) { c.object->AddComment(c.text.c_str()); }},
    {"assign an object", "oO", AssignObject},
    {"assign all attributes", "hH", [](Call &c) { *c.holder = *c.otherHolder; }},
    {"assign an attribute", "ha", AssignAttribute},
    {"assign a pin", "pq", AssignPin},
    {"set a polarity", "p#", SetPolarity},
    {"set a default", "pV", [](Call &c) { c.pin->SetDefaultValue(c.text.c_str()); }},
    {"set a port", "s#", [](Call &c) { c.signal->SetPortPolarity(c.Direction()); }, CanAskSignal},
    {"assign a constant", "sV", [](Call &c) { c.signal->AssignConstantValue(c.text.c_str()); }},
    // They are wired.
    {"connect a pin", "sp", [](Call &c) { c.signal->Connect(c.pin); }},
    {"connect all pins", "s", ConnectAllPins},
    {"connect one way", "pg", [](Call &c) { c.pin->Connect(c.other); }},
    {"link", "sg", [](Call &c) { c.signal->Connect(c.other); }},
    {"disconnect a pin", "sp", [](Call &c) { c.signal->Disconnect(c.pin); }},
    {"disconnect one way", "p", [](Call &c) { c.pin->Disconnect(); }},
    {"unlink", "sg", [](Call &c) { c.signal->Disconnect(c.other); }},
    {"disconnect all", "s", [](Call &c) { c.signal->DisconnectAll(); }, PinsLive},
    {"clone connection", "st", [](Call &c) { c.signal->CloneConnection(c.other); }, PinsLive},
    {"add a member", "kg", AddMember},
    {"set a member", "kg#", SetMember},
    {"add a slice", "bg", [](Call &c) { c.AsBus().AddBusSlice(c.other); }},
    {"remove a slice", "bg", [](Call &c) { c.AsBus().RemoveBusSlice(c.other); }},
    {"empty the slices", "b", [](Call &c) { c.AsBus().EmptyBusSlice(); }},
    // They are asked.
    {"ask a signal", "s", AskSignal, CanAskSignal},
    {"ask for drivers", "s", [](Call &c) { c.signal->HasMultiDriver(); }, PinsLive},
    {"ask a component", "cN", [](Call &c) { FindPin(*c.component, c.name); }},
    {"ask an instance", "iN", AskInstance},
    {"ask for ports", "i", AskForPorts, CanAskForPorts},
    {"ask for a component", "i", [](Call &c) { c.instance->GetComponentName(); }, ComponentLives},
    {"ask a netlist", "niN", AskNetlist},
    {"sort", "n", [](Call &c) { c.netlist->SortNetlist(); }, CanSort},
    // They are prepared and written.
    {"make VHDL dummies", "n", [](Call &c) { c.netlist->CreateVhdlDummySignals(); }, CanPrepare},
    {"make Verilog dummies", "n", [](Call &c) { c.netlist->CreateVerilogDummySignals(); },
     CanPrepare},
    {"connect open pins", "n", [](Call &c) { c.netlist->ConnectOpenPinToDummy(); }},
    {"set box types", "n", [](Call &c) { c.netlist->SetBoxTypeAttribute(); }},
    {"write", "n#", Write, CanWrite},
    // By name.
    {"connect a pin by name", "mNip",
     [](Call &c) {
         c.model->ConnectSignalToPin(c.name.c_str(), c.instance->GetName(), c.pin->GetName());
     },
     CanWiden},
    {"link by name", "msN",
     [](Call &c) { c.model->ConnectSignals(c.signal->GetName(), c.name.c_str()); }, CanWiden},
    {"assign a constant by name", "mNV",
     [](Call &c) { c.model->AssignConstantToSignal(c.name.c_str(), c.text.c_str()); }, CanWiden},
    {"tie a pin by name", "mipV",
     [](Call &c) {
         c.model->AssignConstantToPin(c.instance->GetName(), c.pin->GetName(), c.text.c_str());
     }},
    {"declare by name", "mN", [](Call &c) { c.model->AddSignal(c.name.c_str()); }},
    {"run lines", "m#", RunLines, CanRunLines},
    // They are removed.
    {"remove a signal", "s", [](Call &c) { c.world.Remove(c.world.signals, c.signal); }, PinsLive},
    {"remove a signal neatly", "s", RemoveSignalNeatly, PinsLive},
    {"remove a component", "c", [](Call &c) { c.world.Remove(c.world.components, c.component); }},
    {"remove an instance", "i", [](Call &c) { c.world.Remove(c.world.instances, c.instance); }},
    {"remove an instance neatly", "i", RemoveInstanceNeatly},
    {"delete a pin", "p", [](Call &c) { c.world.Remove(c.world.pins, c.pin); }, IsOwnPin},
    {"delete an attribute", "a", [](Call &c) { c.world.Remove(c.world.attributes, c.attribute); }},
    {"delete a netlist", "n", [](Call &c) { c.world.Remove(c.netlist); }},
};

void Run(World &world, Operation const &operation) {
    static bool const isShown = std::getenv("SHOW_CALLS");
    Call call(world);
    for (char const *letter = operation.picks; *letter; ++letter)
        for (Letter const &each : LETTERS)
            if (each.letter == *letter && !each.pick(call))
                return;
    if (!operation.may(call))
        return;
    if (isShown)
        std::fprintf(stderr, "%s%s\n", operation.name, call.picked.c_str());
    try {
        operation.act(call);
    } catch (Exception const &) {
    }
    world.Look();
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    constexpr int MAX_CALLS = 200;
    Choices choices(data, size);
    World world(choices);
    Call first(world);
    first.number = choices.Below(3);
    MakeNetlist(first);
    for (int calls = 0; calls < MAX_CALLS && !choices.IsEmpty(); ++calls)
        Run(world, OPERATIONS[choices.Below(std::size(OPERATIONS))]);
    // The kinds of objects end in their order, from any of them on.
    constexpr void (*REMOVALS[])(World &) = {[](World &w) { w.RemoveOwn(w.signals); },
                                             [](World &w) { w.RemoveOwn(w.pins); },
                                             [](World &w) { w.RemoveOwn(w.components); },
                                             [](World &w) { w.RemoveOwn(w.instances); },
                                             [](World &w) { w.RemoveOwn(w.attributes); },
                                             [](World &w) {
                                                 for (Netlist *const netlist : w.netlists.Living())
                                                     w.Remove(netlist);
                                             }};
    constexpr unsigned int KINDS = std::size(REMOVALS);
    for (unsigned int kind = choices.Below(KINDS), left = KINDS; left > 0; ++kind, --left)
        REMOVALS[kind % KINDS](world);
    return 0;
}
