#include "tool/check/Recorder.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

constexpr char const *CONNECT = "CONNECT SIGNAL";
constexpr char const *ASSIGN = "ASSIGN CONSTANT";

bool EndsIn(std::string_view text, std::string_view end) {
    return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

bool Contains(std::string_view text, std::string_view part) {
    return text.find(part) != std::string_view::npos;
}

} // namespace

void Recorder::Before(LineTokens const &lineTokens, CommandHelp const *command, int words,
                      std::uint32_t line) {
    tokens = &lineTokens;
    lineNumber = line;
    nets.clear();
    buses.clear();
    pin = nullptr;
    holder = nullptr;
    keyword = command ? command->keyword : "";
    firstArgument = words;
    std::string const first(lineTokens.At(firstArgument));
    if (keyword == CONNECT) {
        Name(first, firstArgument);
        NamePin(firstArgument + 1);
    } else if (keyword == ASSIGN) {
        NamePin(firstArgument);
    } else if (keyword == "ADD SIGNAL" || keyword == "ADD PORT") {
        nets.push_back(
            {first, firstArgument, model.GetSignal(first.c_str()) != nullptr, Origin::DECLARED});
    } else if (Contains(keyword, " ATTRIBUTE")) {
        bool const module = Contains(keyword, "MODULE");
        attributeToken = firstArgument + (module ? 0 : 1);
        if (keyword.substr(0, 4) == "ADD " &&
            SameIgnoringCase(lineTokens.At(attributeToken).substr(0, 6), "-TYPE="))
            ++attributeToken;
        holder = HolderOf(firstArgument, keyword);
        if (holder && holder->GetAttr(Normal(lineTokens.At(attributeToken)).c_str()))
            holder = nullptr;
    }
}

/// Whether the net was there before the line.
bool Recorder::Knows(std::string const &name, int token) {
    Bus const *const bus = netlist.GetParentBus(name.c_str());
    if (bus && places.TakeOpen(bus))
        places.Put(Places::MADE, bus, SpotOf(token));
    Signal const *const signal = model.GetSignal(name.c_str());
    return signal && !places.TakeOpen(signal);
}

/// A net as CONNECT and ASSIGN name it, who make it if there is none. The form of a name is that of
/// the text as it was typed.
void Recorder::Name(std::string const &name, int token) {
    Text const typed(name.c_str());
    bool const existed = Knows(name, token);
    bool const compound = CompoundBus::IsCompoundBusName(typed);
    nets.push_back({name, token, existed, Origin::BRACKETS});
    if (existed)
        return;
    WatchBus(name, token);
    if (!compound)
        return;
    StringArray members;
    CompoundBus::ParseCompoundBusName(typed, members, false);
    for (int i = 0; i < members.GetSize(); ++i)
        NameMember(members.At(i).GetText(), token, Origin::COMPOUND);
}

void Recorder::NameMember(std::string const &name, int token, Origin origin) {
    nets.push_back({name, token, Knows(name, token), origin});
    if (!nets.back().existed)
        WatchBus(name, token);
}

void Recorder::WatchBus(std::string const &name, int token) {
    Range wanted;
    Range present;
    Bus *const bus = netlist.GetParentBus(name.c_str());
    if (bus && Bus::IsBusName(name.c_str()) && GetRange(name.c_str(), wanted) &&
        GetRange(bus->GetNameRef(), present) && wanted.Width() >= present.Width())
        buses.push_back({bus, bus->GetNameRef().GetText(), LossesOf(*bus), token});
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
    if (!SplitPin(text, owner, pinName)) {
        Name(std::string(text), token);
        return;
    }
    if (Instance const *const instance = model.GetInstance(owner.c_str()))
        pin = instance->GetPin(pinName.c_str());
    formerNet = pin ? pin->GetSignal() : nullptr;
    if (places.IsOpen(formerNet))
        formerNet = nullptr;
    formerNetName = formerNet ? formerNet->GetNameRef() : Text();
}

AttributeHolder *Recorder::HolderOf(int token, std::string_view kind) const {
    std::string const name(tokens->At(token));
    std::string owner;
    std::string pinName;
    if (Contains(kind, " PIN ")) {
        if (!SplitPin(name, owner, pinName))
            return nullptr;
        return Contains(kind, "INSTANCE")
                   ? model.GetPin(pinName.c_str(), model.GetInstance(owner.c_str()))
                   : model.GetPin(pinName.c_str(), model.GetComponent(owner.c_str()));
    }
    if (Contains(kind, "COMPONENT"))
        return model.GetComponent(name.c_str());
    if (Contains(kind, "INSTANCE"))
        return model.GetInstance(name.c_str());
    if (Contains(kind, "SIGNAL"))
        return model.GetSignal(name.c_str());
    return &netlist;
}

void Recorder::After(bool ran) {
    RecordNets();
    for (Widened const &widened : buses)
        if (netlist.GetParentBus(widened.name.c_str()) != widened.bus)
            RecordWidening(widened);
    if (!ran)
        return;
    RecordPin();
    RecordAssignment();
    RecordDeclaration();
    RecordAttribute();
    RecordText();
}

void Recorder::RecordNets() {
    for (Named const &named : nets) {
        Signal const *const signal = model.GetSignal(named.name.c_str());
        if (!signal)
            continue;
        if (named.existed) {
            CompareSpelling(named, *signal);
            continue;
        }
        places.TakeOpen(signal);
        places.Put(Places::MADE, signal, SpotOf(named.token));
        respelled.erase(signal);
        bool const bracketed = named.origin == Origin::BRACKETS &&
                               named.name.find_first_of("[]{}<>") != std::string::npos;
        if (signal->GetSignalType() == Signal::SIGNAL_SCALAR &&
            (bracketed || BusIndex::IsBusIndexName(signal->GetNameRef())))
            origins[signal] = named.origin;
    }
}

/// Two nets to the eye, one to the library.
void Recorder::CompareSpelling(Named const &named, Signal const &signal) {
    std::string const typed = Normal(named.name);
    std::string_view const made = signal.GetNameRef().View();
    if (typed == made || !SameIgnoringCase(typed, made) || named.origin == Origin::DECLARED ||
        !respelled.insert(&signal).second)
        return;
    findings.Add({Id::CASE_DIFFERS,
                  SpotOf(named.token),
                  "net " + Quoted(typed),
                  {{&signal, "it is called " + Quoted(made) + " here"}}});
}

void Recorder::RecordPin() {
    if (!pin || !pin->GetSignal())
        return;
    Signal *const net = pin->GetSignal();
    bool const connects = keyword == CONNECT;
    int const pinToken = firstArgument + (connects ? 1 : 0);
    if (!connects) {
        if (net != formerNet)
            places.Put(Places::MADE, net, SpotOf(pinToken));
        places.Put(Places::CONSTANT, net, SpotOf(pinToken));
    }
    if (net == formerNet && !connects)
        return;
    if (formerNet && net != formerNet) {
        moved[pin] = net;
        findings.Add(
            {Id::PIN_MOVED,
             SpotOf(pinToken),
             "pin " + Quoted(tokens->At(pinToken)),
             {{pin, "the former net was given here", Places::CONNECTED, lineNumber}},
             BOTH,
             "from " + Quoted(formerNetName.View()) + " to " + Quoted(net->GetNameRef().View())});
    }
    places.Put(Places::CONNECTED, pin, SpotOf(pinToken));
}

/// The old bus is gone: it is known by its name and by what it had.
void Recorder::RecordWidening(Widened const &widened) {
    Bus *const wide = netlist.GetParentBus(widened.name.c_str());
    if (!wide)
        return;
    places.Put(Places::MADE, wide, SpotOf(widened.token));
    ForEach(wide->GetBusSliceIterator(), [&](Signal const *slice) {
        if (slice->GetNameRef() == widened.name.c_str())
            places.Put(Places::MADE, slice, SpotOf(widened.token));
    });
    if (!widened.losses.empty())
        findings.Add({Id::WIDENED_BUS,
                      SpotOf(widened.token),
                      "bus " + Quoted(widened.name),
                      {{widened.bus, "it was made here", Places::MADE, lineNumber}},
                      BOTH,
                      "to " + Quoted(wide->GetNameRef().View()) + "; lost: " + widened.losses});
    for (auto &[movedPin, net] : moved) {
        Signal *const now = movedPin->GetSignal();
        if (net == widened.bus)
            net = now;
        else if (now && now != net && now->GetNameRef() == widened.name.c_str() && movedPin != pin)
            findings.Add({Id::PIN_RETURNS,
                          SpotOf(widened.token),
                          "pin " + Quoted(movedPin->GetNameRef().View()),
                          {{movedPin, "it was connected here", Places::CONNECTED, lineNumber}},
                          BOTH,
                          "widening takes along all that was ever connected"});
    }
}

void Recorder::RecordAssignment() {
    bool const isAssignment = keyword == CONNECT && nets.size() >= 2 && !pin;
    if (isAssignment || (keyword == ASSIGN && !pin && !nets.empty()))
        if (Signal const *const target = model.GetSignal(nets.front().name.c_str()))
            places.Put(isAssignment ? Places::ASSIGNED : Places::CONSTANT, target,
                       SpotOf(nets.front().token));
}

void Recorder::RecordDeclaration() {
    std::string const first(tokens->At(firstArgument));
    std::string const second(tokens->At(firstArgument + 1));
    Object const *made = nullptr;
    int token = firstArgument;
    if (keyword == "ADD COMPONENT") {
        made = model.GetComponent(first.c_str());
    } else if (keyword == "ADD PIN") {
        made = model.GetPin(second.c_str(), model.GetComponent(first.c_str()));
        ++token;
    } else if (keyword == "ADD INSTANCE") {
        made = model.GetInstance(second.c_str());
        ++token;
    } else if (keyword == "SET NETLIST NAME") {
        made = &netlist;
    }
    if (made)
        places.Put(Places::MADE, made, SpotOf(token));
}

void Recorder::RecordAttribute() {
    if (!holder)
        return;
    if (Attribute const *const made = holder->GetAttr(Normal(tokens->At(attributeToken)).c_str()))
        places.Put(Places::MADE, made, SpotOf(attributeToken));
}

/// What the line gave a comment, or the option that it set or added to; null for other lines.
void const *Recorder::OwnerOfText() const {
    if (EndsIn(keyword, " COMMENT") || keyword == "ADD NOTES")
        return dynamic_cast<Object const *>(HolderOf(firstArgument, keyword));
    HdlOptions const &options = *model.GetOptions();
    std::pair<std::string_view, void const *> const rows[] = {
        {"ADD LIBRARY", &options.vhdlOption.libraries},
        {"ADD USE LIBRARY", &options.vhdlOption.useLibraries},
        {"ADD INCLUDE", &options.verilogOption.includes},
        {"Set Application", &options.application},
        {"Set Command", &options.commandStr},
        {"Set Device", &options.device},
        {"Set Purpose", &options.purpose},
        {"Set Reference", &options.reference},
    };
    for (auto const &[command, option] : rows)
        if (keyword == command)
            return option;
    return nullptr;
}

void Recorder::RecordText() {
    if (void const *const owner = keyword == CONNECT ? nullptr : OwnerOfText())
        places.Put(Places::TEXT, owner,
                   SpotOf(firstArgument +
                          (Contains(keyword, " COMMENT") && !Contains(keyword, "MODULE") ? 1 : 0)));
}

Origin Recorder::GetOrigin(Signal const *signal) const {
    auto const found = origins.find(signal);
    return found == origins.end() ? Origin::DECLARED : found->second;
}

} // namespace Checks
