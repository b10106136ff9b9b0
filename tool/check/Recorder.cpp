#include "tool/check/Recorder.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

bool EndsIn(std::string_view text, std::string_view end) {
    return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

bool Contains(std::string_view text, std::string_view part) {
    return text.find(part) != std::string_view::npos;
}

/// A command that sets a text of the options or adds to a list of them, and that text or list.
struct OptionRow {
    std::string_view keyword;
    void const *(*in)(HdlOptions const &options);
};

constexpr OptionRow OPTIONS[] = {
    {"ADD LIBRARY", [](HdlOptions const &o) -> void const * { return &o.vhdlOption.libraries; }},
    {"ADD USE LIBRARY",
     [](HdlOptions const &o) -> void const * { return &o.vhdlOption.useLibraries; }},
    {"ADD INCLUDE", [](HdlOptions const &o) -> void const * { return &o.verilogOption.includes; }},
    {"Set Application", [](HdlOptions const &o) -> void const * { return &o.application; }},
    {"Set Command", [](HdlOptions const &o) -> void const * { return &o.commandStr; }},
    {"Set Device", [](HdlOptions const &o) -> void const * { return &o.device; }},
    {"Set Purpose", [](HdlOptions const &o) -> void const * { return &o.purpose; }},
    {"Set Reference", [](HdlOptions const &o) -> void const * { return &o.reference; }},
};

} // namespace

void Recorder::Before(LineTokens const &lineTokens, CommandHelp const *command, int words,
                      std::uint32_t line) {
    tokens = &lineTokens;
    lineNumber = line;
    nets.clear();
    netCount = 0;
    if (!buses.empty()) {
        buses.clear();
        busPlaces.clear();
    }
    pin = nullptr;
    holder = nullptr;
    keyword = command ? command->keyword : "";
    kind = KindOf(command);
    firstArgument = words;
    Text const &first = lineTokens.GetTokens().At(firstArgument);
    if (kind == Kind::CONNECT) {
        Name(first, firstArgument);
        NamePin(firstArgument + 1);
    } else if (kind == Kind::ASSIGN) {
        NamePin(firstArgument);
    } else if (kind == Kind::NET) {
        nets.push_back({first, firstArgument, model.GetSignal(first) != nullptr, Origin::DECLARED});
    } else if (kind == Kind::ATTRIBUTE) {
        NameAttribute();
    }
}

/// Asked for at each line, and answered from memory for all but the first line of a command.
Recorder::Kind Recorder::KindOf(CommandHelp const *command) {
    static constexpr std::pair<std::string_view, Kind> ROWS[] = {
        {"CONNECT SIGNAL", Kind::CONNECT},  {"ASSIGN CONSTANT", Kind::ASSIGN},
        {"ADD SIGNAL", Kind::NET},          {"ADD PORT", Kind::NET},
        {"ADD COMPONENT", Kind::COMPONENT}, {"ADD PIN", Kind::PIN},
        {"ADD INSTANCE", Kind::INSTANCE},   {"SET NETLIST NAME", Kind::NAME},
        {"ADD NOTES", Kind::TEXT},
    };
    if (!command)
        return Kind::OTHER;
    auto const [known, isNew] = kinds.try_emplace(command, Kind::OTHER);
    if (!isNew)
        return known->second;
    for (auto const &[word, rowKind] : ROWS)
        if (keyword == word)
            known->second = rowKind;
    for (OptionRow const &row : OPTIONS)
        if (keyword == row.keyword)
            known->second = Kind::TEXT;
    if (Contains(keyword, " ATTRIBUTE"))
        known->second = Kind::ATTRIBUTE;
    else if (Contains(keyword, " COMMENT"))
        known->second = Kind::TEXT;
    return known->second;
}

/// The holder of an attribute that is new.
void Recorder::NameAttribute() {
    attributeToken = firstArgument + (Contains(keyword, "MODULE") ? 0 : 1);
    if (keyword.substr(0, 4) == "ADD " && BeginsWith(tokens->At(attributeToken), "-TYPE="))
        ++attributeToken;
    holder = HolderOf(firstArgument);
    if (holder && holder->GetAttr(Normal(tokens->At(attributeToken)).c_str()))
        holder = nullptr;
}

/// A net as CONNECT and ASSIGN name it, who make it if there is none. The form of a name is that of
/// the text as it was typed.
void Recorder::Name(Text const &name, int token) {
    if (NameOne(name, token, Origin::BRACKETS) || !CompoundBus::IsCompoundBusName(name))
        return;
    StringArray members;
    CompoundBus::ParseCompoundBusName(name, members, false);
    for (int i = 0; i < members.GetSize(); ++i)
        NameOne(members.At(i), token, Origin::COMPOUND);
}

/// Whether the net was there before the line.
bool Recorder::NameOne(Text const &name, int token, Origin origin) {
    if (netCount++ == 0)
        firstNet = name;
    if (places.HasOpen()) {
        Bus const *const bus = netlist.GetParentBus(name);
        if (bus && places.TakeOpen(bus))
            places.Put(LocationMap::MADE, bus, LocationOf(token));
    }
    Signal const *const signal = model.GetSignal(name);
    bool const existed = signal && !places.TakeOpen(signal);
    if (!existed)
        WatchBus(name, token);
    if (!existed || signal->GetNameRef().View() != name.View())
        nets.push_back({name, token, existed, origin});
    return existed;
}

void Recorder::WatchBus(Text const &name, int token) {
    Range wanted;
    Range present;
    if (!Bus::IsBusName(name) || !GetRange(name, wanted))
        return;
    Bus *const bus = netlist.GetParentBus(name);
    if (!bus || !GetRange(bus->GetNameRef(), present) || wanted.Width() < present.Width())
        return;
    auto const [known, isNew] = busPlaces.try_emplace(bus, buses.size());
    if (isNew)
        buses.push_back({bus, bus->GetNameRef(), LossesOf(*bus), token, token});
    else
        buses[known->second].lastToken = token;
}

std::string Recorder::LossesOf(Bus const &bus) {
    std::string losses;
    auto const add = [&losses](bool lost, char const *what) {
        if (lost)
            losses += (losses.empty() ? "" : ", ") + std::string(what);
    };
    add(bus.IsPort(), "port direction");
    add(bus.HasConstantValue(), "constant");
    add(bus.HasAttrs(), "attributes");
    add(bus.GetSignalIterator().HasMore(), "assignments");
    add(bus.HasComment(), "comment");
    return losses;
}

/// INSTANCE.PIN, or a net where there is no such point.
void Recorder::NamePin(int token) {
    std::string owner;
    std::string pinName;
    std::string_view const text = tokens->At(token);
    if (!SplitPinReference(text, owner, pinName)) {
        Name(tokens->GetTokens().At(token), token);
        return;
    }
    if (Instance const *const instance = model.GetInstance(owner.c_str()))
        pin = instance->GetPin(pinName.c_str());
    formerNet = pin ? pin->GetSignal() : nullptr;
    if (places.IsOpen(formerNet))
        formerNet = nullptr;
    formerNetName = formerNet ? formerNet->GetNameRef() : Text();
}

AttributeHolder *Recorder::HolderOf(int token) const {
    std::string const name(tokens->At(token));
    std::string owner;
    std::string pinName;
    if (Contains(keyword, " PIN ")) {
        if (!SplitPinReference(name, owner, pinName))
            return nullptr;
        return Contains(keyword, "INSTANCE")
                   ? model.GetPin(pinName.c_str(), model.GetInstance(owner.c_str()))
                   : model.GetPin(pinName.c_str(), model.GetComponent(owner.c_str()));
    }
    if (Contains(keyword, "COMPONENT"))
        return model.GetComponent(name.c_str());
    if (Contains(keyword, "INSTANCE"))
        return model.GetInstance(name.c_str());
    if (Contains(keyword, "SIGNAL"))
        return model.GetSignal(name.c_str());
    return &netlist;
}

void Recorder::After(bool ran) {
    RecordNets();
    for (Widened const &widened : buses)
        if (netlist.GetParentBus(widened.name) != widened.bus)
            RecordWidening(widened);
    if (!ran)
        return;
    if (kind == Kind::CONNECT || kind == Kind::ASSIGN) {
        RecordPin();
        RecordAssignment();
    } else if (kind == Kind::ATTRIBUTE) {
        RecordAttribute();
    } else if (kind == Kind::TEXT) {
        RecordText();
    } else if (kind != Kind::OTHER) {
        RecordDeclaration();
    }
}

void Recorder::RecordNets() {
    for (Named const &named : nets) {
        Signal const *const signal = model.GetSignal(named.name);
        if (!signal)
            continue;
        if (named.existed) {
            CompareSpelling(named, *signal);
            continue;
        }
        places.TakeOpen(signal);
        places.Put(LocationMap::MADE, signal, LocationOf(named.token));
        if (!respelled.empty())
            respelled.erase(signal);
        bool const bracketed = named.origin == Origin::BRACKETS &&
                               named.name.View().find_first_of("[]{}<>") != std::string_view::npos;
        if (signal->GetSignalType() == Signal::SIGNAL_SCALAR &&
            (bracketed || BusIndex::IsBusIndexName(signal->GetNameRef())))
            origins[signal] = named.origin;
    }
}

/// Two nets to the eye, one to the library.
void Recorder::CompareSpelling(Named const &named, Signal const &signal) {
    std::string const typed = Normal(named.name.View());
    std::string_view const made = signal.GetNameRef().View();
    if (typed == made || !SameIgnoringCase(typed, made) || named.origin == Origin::DECLARED ||
        !respelled.insert(&signal).second)
        return;
    findings.Add({Id::CASE_DIFFERS,
                  LocationOf(named.token),
                  "net " + Quoted(typed),
                  {{&signal, "it is called " + Quoted(made) + " here"}}});
}

void Recorder::RecordPin() {
    if (!pin || !pin->GetSignal())
        return;
    Signal *const net = pin->GetSignal();
    bool const connects = kind == Kind::CONNECT;
    int const pinToken = firstArgument + (connects ? 1 : 0);
    if (!connects) {
        if (net != formerNet)
            places.Put(LocationMap::MADE, net, LocationOf(pinToken));
        places.Put(LocationMap::CONSTANT, net, LocationOf(pinToken));
    }
    if (net == formerNet && !connects)
        return;
    if (formerNet && net != formerNet) {
        moved[pin] = net;
        if (!connects)
            movedTies.emplace(net, pin);
        findings.Add(
            {Id::PIN_MOVED,
             LocationOf(pinToken),
             "pin " + Quoted(tokens->At(pinToken)),
             {{pin, "the former net was given here", LocationMap::CONNECTED, lineNumber}},
             BOTH,
             "from " + Quoted(formerNetName.View()) + " to " + Quoted(net->GetNameRef().View())});
    }
    places.Put(LocationMap::CONNECTED, pin, LocationOf(pinToken));
}

/// The old bus is gone: it is known by its name and by what it had. A slice of the new one has its
/// name and its pins, in front of all that were slices before the line.
void Recorder::RecordWidening(Widened const &widened) {
    Bus *const wide = netlist.GetParentBus(widened.name);
    if (!wide)
        return;
    places.Put(LocationMap::MADE, wide, LocationOf(widened.lastToken));
    if (!widened.losses.empty())
        findings.Add({Id::WIDENED_BUS,
                      LocationOf(widened.firstToken),
                      "bus " + Quoted(widened.name.View()),
                      {{widened.bus, "it was made here", LocationMap::MADE, lineNumber}},
                      BOTH,
                      "to " + Quoted(wide->GetNameRef().View()) + "; lost: " + widened.losses});
    for (Iterator<Signal *> slices = wide->GetBusSliceIterator(); slices.HasMore();
         slices.Advance())
        if (slices.Current() && slices.Current()->GetNameRef() == widened.name) {
            places.Put(LocationMap::MADE, slices.Current(), LocationOf(widened.lastToken));
            RecordReturns(widened, *slices.Current());
            break;
        }
}

/// Pins that had left the bus and are taken along to the slice.
void Recorder::RecordReturns(Widened const &widened, Signal &slice) {
    if (moved.empty())
        return;
    ForEach(slice.GetPinIterator(), [&](Pin *listed) {
        auto const found = moved.find(listed);
        if (found == moved.end() || listed->GetSignal() != &slice)
            return;
        if (found->second == widened.bus)
            found->second = &slice;
        else if (found->second != &slice && listed != pin)
            findings.Add({Id::PIN_RETURNS,
                          LocationOf(widened.firstToken),
                          "pin " + Quoted(listed->GetNameRef().View()),
                          {{listed, "it was connected here", LocationMap::CONNECTED, lineNumber}},
                          BOTH,
                          "widening takes along all that was ever connected"});
    });
    auto const [first, last] = movedTies.equal_range(widened.bus);
    for (auto tie = first; tie != last; ++tie)
        if (Signal *&net = moved[tie->second]; net == widened.bus)
            net = tie->second->GetSignal();
    movedTies.erase(first, last);
}

void Recorder::RecordAssignment() {
    bool const isAssignment = kind == Kind::CONNECT && netCount >= 2 && !pin;
    if (isAssignment || (kind == Kind::ASSIGN && !pin && netCount > 0))
        if (Signal const *const target = model.GetSignal(firstNet))
            places.Put(isAssignment ? LocationMap::ASSIGNED : LocationMap::CONSTANT, target,
                       LocationOf(firstArgument));
}

void Recorder::RecordDeclaration() {
    auto const argument = [this](int index) -> Text const & {
        return tokens->GetTokens().At(firstArgument + index);
    };
    Object const *made = nullptr;
    int token = firstArgument;
    if (kind == Kind::COMPONENT) {
        made = model.GetComponent(argument(0));
    } else if (kind == Kind::PIN) {
        made = model.GetPin(argument(1), model.GetComponent(argument(0)));
        ++token;
    } else if (kind == Kind::INSTANCE) {
        made = model.GetInstance(argument(1));
        ++token;
    } else if (kind == Kind::NAME) {
        made = &netlist;
    }
    if (made)
        places.Put(LocationMap::MADE, made, LocationOf(token));
}

void Recorder::RecordAttribute() {
    if (!holder)
        return;
    if (Attribute const *const made = holder->GetAttr(Normal(tokens->At(attributeToken)).c_str()))
        places.Put(LocationMap::MADE, made, LocationOf(attributeToken));
}

/// What the line gave a comment, or the option that it set or added to; null for other lines.
void const *Recorder::OwnerOfText() const {
    if (EndsIn(keyword, " COMMENT") || keyword == "ADD NOTES")
        return dynamic_cast<Object const *>(HolderOf(firstArgument));
    for (OptionRow const &row : OPTIONS)
        if (keyword == row.keyword)
            return row.in(*model.GetOptions());
    return nullptr;
}

void Recorder::RecordText() {
    if (void const *const owner = OwnerOfText())
        places.Put(
            LocationMap::TEXT, owner,
            LocationOf(firstArgument +
                       (Contains(keyword, " COMMENT") && !Contains(keyword, "MODULE") ? 1 : 0)));
}

Origin Recorder::GetOrigin(Signal const *signal) const {
    auto const found = origins.find(signal);
    return found == origins.end() ? Origin::DECLARED : found->second;
}

} // namespace Checks
