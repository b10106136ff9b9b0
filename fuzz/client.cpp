// What a client does with the exported classes and no line of the language can: strings, arrays,
// sets, maps and expressions against plain models, and a design that is built, changed, taken apart
// and written by hand.

#include <algorithm>
#include <map>
#include <regex>
#include <vector>

#include "fuzz/Fuzz.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// The input as a row of choices; at its end all of them are 0.
class Choices {
public:
    Choices(std::uint8_t const *data, std::size_t size) : at(data), end(data + size) {}
    bool IsEmpty() const { return at == end; }
    unsigned int Below(unsigned int bound) { return IsEmpty() ? 0 : *at++ % bound; }
    std::string Text() {
        std::string text;
        for (unsigned int left = Below(8); left > 0; --left)
            text += "aAbBz1290_ ,()[:]-.*+?\"\\\n\t\xe9"[Below(27)];
        return text;
    }
    /// A name that others choose, too.
    std::string Name() {
        static char const *const NAMES[] = {"a", "A1",   "b(3:0)", "b[2]", "b(1:0)",  "c<0:7>",
                                            "",  "open", "d,b(0)", "in",   "a_DUMMY", "b(7:0)"};
        unsigned int const which = Below(15);
        return which < std::size(NAMES) ? NAMES[which] : Text();
    }
    Polarity::Value Polar() { return static_cast<Polarity::Value>(static_cast<int>(Below(4)) - 1); }

private:
    std::uint8_t const *at;
    std::uint8_t const *end;
};

std::string Upper(std::string text) {
    for (char &c : text)
        c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c;
    return text;
}

unsigned int PlaceOf(std::size_t found) {
    return found == std::string::npos ? Basis::NOT_FOUND : static_cast<unsigned int>(found);
}

void Strings(Choices &choices) {
    Text text;
    std::string model;
    while (!choices.IsEmpty()) {
        Text const before(text); // shares the text, and is not to see the change
        std::string const was = model;
        std::string const piece = choices.Text();
        unsigned int const first = choices.Below(6);
        Basis_Range const range = {first, choices.Below(6)};
        bool const isRange = range.first <= range.last && range.first < model.size();
        switch (choices.Below(10)) {
        case 0:
            text += piece.c_str();
            model += piece;
            break;
        case 1:
            text.Append(piece.c_str(), first);
            model += piece.substr(0, first);
            break;
        case 2:
            text.MakeUpper();
            model = Upper(model);
            break;
        case 3:
            text.Trim(piece.c_str(), Text::TRIM_BOTH_ENDS);
            model.erase(0, std::min(model.find_first_not_of(piece), model.size()));
            model.erase(model.find_last_not_of(piece) + 1);
            break;
        case 4:
            text.Remove(range);
            if (isRange)
                model.erase(first, range.last + 1 - first);
            break;
        case 5:
            text = text.Extract(range);
            model = isRange ? model.substr(first, range.last + 1 - first) : "";
            break;
        case 6:
            text.ReplaceChars('a', 'Z');
            std::replace(model.begin(), model.end(), 'a', 'Z');
            break;
        case 7:
            text.Format("%s|%5u", piece.c_str(), first);
            model = piece + "|    " + std::to_string(first);
            break;
        case 8:
            text += text;
            model += model;
            break;
        default:
            text.MakeLower();
            for (char &c : model)
                c = c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c;
        }
        if (model.size() > 500)
            return;
        FUZZ_EXPECT(text.View() == model && before.View() == was, "%s", model.c_str());
        FUZZ_EXPECT(text.GetIndexOfString(piece.c_str(), Text::COMPARE_EXACT) ==
                        PlaceOf(model.find(piece)),
                    "%s in %s", piece.c_str(), model.c_str());
        FUZZ_EXPECT(text.GetIndexOfString(piece.c_str(), Text::COMPARE_IGNORING_CASE) ==
                        PlaceOf(Upper(model).find(Upper(piece))),
                    "%s in %s", piece.c_str(), model.c_str());
        FUZZ_EXPECT(text.GetIndexOfFirstChar('a', 0) == PlaceOf(model.find('a')) &&
                        text.GetIndexOfLastChar('a', 0) == PlaceOf(model.rfind('a')),
                    "%s", model.c_str());
        FUZZ_EXPECT((text.Compare(piece.c_str(), Text::COMPARE_IGNORING_CASE) == 0) ==
                        (Upper(model) == Upper(piece)),
                    "%s", piece.c_str());
    }
}

/// The leftmost longest match, by trying all.
void Expressions(Choices &choices) {
    std::string pattern;
    for (unsigned int atoms = 1 + choices.Below(5); atoms > 0; --atoms) {
        static char const *const ATOMS[] = {"a", "b", ".", "[ab1]", "[^a]", "[0-9]", "\\."};
        static char const *const TIMES[] = {"", "", "*", "+", "?"};
        pattern += ATOMS[choices.Below(std::size(ATOMS))];
        pattern += TIMES[choices.Below(std::size(TIMES))];
    }
    std::string text;
    for (unsigned int size = choices.Below(12); size > 0; --size)
        text += "ab1.z"[choices.Below(5)];
    std::regex const whole(pattern);
    Basis_Range expected = {1, 0};
    for (unsigned int first = 0; first < text.size() && expected.first > expected.last; ++first)
        for (auto size = static_cast<unsigned int>(text.size()) - first; size > 0; --size)
            if (std::regex_match(text.substr(first, size), whole)) {
                expected = {first, first + size - 1};
                break;
            }
    Basis_Range const found = Text(text.c_str()).GetRangeOfMatch(Basis_Regexp(pattern.c_str()));
    FUZZ_EXPECT(found.first == expected.first && found.last == expected.last, "%s in %s: %u to %u",
                pattern.c_str(), text.c_str(), found.first, found.last);
}

void Collections(Choices &choices) {
    StringArray array;
    std::vector<std::string> strings;
    StringSet set;
    std::map<std::string, bool> exact; // of the set
    std::map<std::string, bool> folded;
    IStringPtrMap<int *> map;
    std::map<std::string, int *> pointers;
    int numbers[3] = {};
    while (!choices.IsEmpty() && strings.size() < 100) {
        std::string const name = choices.Name();
        unsigned int const at = choices.Below(12);
        switch (choices.Below(8)) {
        case 0:
            array.Add(name.c_str());
            strings.push_back(name);
            break;
        case 1:
            array.SetAt(static_cast<int>(at), name.c_str());
            strings.resize(std::max<std::size_t>(strings.size(), at + 1));
            strings[at] = name;
            break;
        case 2:
            array.Sort();
            std::sort(strings.begin(), strings.end());
            break;
        case 3:
            set.Add(name.c_str());
            exact[name] = folded[Upper(name)] = true;
            break;
        case 4:
            set.Remove(name.c_str());
            exact.erase(name);
            folded.erase(Upper(name));
            break;
        case 5:
            set.Empty(); // what ignores case stays known
            exact.clear();
            break;
        case 6:
            map.Add(name.c_str(), &numbers[at % 3]);
            pointers[Upper(name)] = &numbers[at % 3];
            break;
        default:
            map.Remove(name.c_str());
            pointers.erase(Upper(name));
        }
        StringArray copy(array);
        FUZZ_EXPECT(copy.Contains(array) && copy.IContains(array), "a copy");
        FUZZ_EXPECT(!array.Contains(name.c_str()) || array.IContains(Upper(name).c_str()), "case");
        copy.Add(array);
        FUZZ_EXPECT(copy.GetSize() == 2 * array.GetSize() && copy[-1].IsEmpty() &&
                        copy.GetAt(array.GetSize()) == array.GetAt(0),
                    "twice");
        copy = array;
        std::string joined;
        for (std::size_t i = 0; i < strings.size(); ++i)
            (joined += i > 0 ? "|" : "") += strings[i];
        FUZZ_EXPECT(copy.Concatenate("|").View() == joined, "%s", joined.c_str());
        FUZZ_EXPECT(array.Contains(name.c_str()) ==
                        (std::find(strings.begin(), strings.end(), name) != strings.end()),
                    "%s", name.c_str());
        FUZZ_EXPECT(set.Contains(name.c_str()) == (exact.count(name) > 0) &&
                        set.IContains(name.c_str()) == (folded.count(Upper(name)) > 0),
                    "%s", name.c_str());
        StringSet other(set); // which knows again what was emptied out
        StringSetIterator place;
        place = other.GetBeginPos();
        FUZZ_EXPECT(exact.empty() || other.IContains((*place).GetText()), "copy");
        IStringPtrMap<int *> otherMap(map);
        FUZZ_EXPECT(otherMap.IsEmpty() == pointers.empty(), "copy");
        std::size_t walked = 0;
        for (StringSetIterator it = set.GetBeginPos(); it != set.GetEndPos(); ++it)
            walked += exact.count((*it).GetText());
        FUZZ_EXPECT(walked == exact.size() && set.IsEmpty() == exact.empty(), "%zu", walked);
        auto const pointer = pointers.find(Upper(name));
        FUZZ_EXPECT(map.Get(name.c_str()) ==
                        (pointer == pointers.end() ? nullptr : pointer->second),
                    "%s", name.c_str());
    }
}

/// Asks each object of a design for all that it tells.
class Questions : public ObjectVisitor,
                  public SignalVisitor,
                  public PinVisitor,
                  public AttributeVisitor {
public:
    explicit Questions(Netlist &netlist) {
        netlist.AcceptObject(*this);
        Holder(netlist);
        ForEach(netlist.GetComponentIterator(), [this](Component *component) { Ask(*component); });
        ForEach(netlist.GetInstanceIterator(), [this](Instance *instance) {
            Ask(*instance);
            told += instance->GetComponentName();
        });
        ForEach(netlist.GetSignalIterator(), [this](Signal *signal) {
            signal->AcceptObject(*this);
            signal->AcceptSignal(*this);
            Holder(*signal);
            told += signal->GetDummySignalName();
            told += std::to_string(signal->GetWidth()).c_str();
        });
    }

    unsigned int GetLength() const { return told.GetLength(); }

private:
    template <class Holding> void Ask(Holding &holding) {
        holding.AcceptObject(*this);
        Holder(holding);
        ForEach(holding.GetPinIterator(), [this](Pin *pin) {
            pin->AcceptObject(*this);
            pin->AcceptPin(*this);
            Holder(*pin);
            told += pin->GetPolarityName();
        });
    }
    void Holder(AttributeHolder const &holder) {
        if (holder.HasAttrs())
            ForEach(holder.GetAttrIterator(), [this](Attribute *attribute) {
                attribute->AcceptObject(*this);
                attribute->AcceptAttribute(*this);
                for (Text const &each : {attribute->GetGeneric(), attribute->GetSynAttr(),
                                         attribute->GetValueTypeName(), attribute->GetComment()})
                    told += each;
            });
    }
    void VisitNetlist(Netlist *netlist) override { told += netlist->GetSourceFileName(); }
    void VisitBus(Bus *bus) override { Bounds(*bus); }
    void VisitBusSlice(BusSlice *slice) override { Bounds(*slice); }
    void VisitBusIndex(BusIndex *index) override { told += index->GetBaseName(); }
    void VisitBusPin(BusPin *pin) override { Bounds(*pin); }
    void VisitBusIndexPin(BusIndexPin *pin) override { told += pin->GetIndex(); }
    void VisitAttributeString(AttributeString *attribute) override {
        told += attribute->GetValue();
    }
    void VisitAttributeBit(AttributeBit *attribute) override { told += attribute->GetValue(); }
    void VisitAttributeUser(AttributeUser *attribute) override { told += attribute->GetValue(); }

    template <class Ranged> void Bounds(Ranged &object) {
        Text left;
        Text right;
        object.GetIndex(left, right);
        told += object.IsDownTo() ? left : right;
        told += object.GetBaseName();
    }

    Text told;
};

/// A design that no Model keeps in order. What the interface leaves to the client is done first:
/// what points at an object that is removed is taken away, or the object stays.
class Builder {
public:
    explicit Builder(Choices &bytes) : choices(bytes), netlist("top") {}

    void Run() {
        while (!choices.IsEmpty() && ++steps < 200)
            Step();
        TextMemOutStream vhdl("");
        TextMemOutStream verilog("text");
        verilog.SetValue("");
        HdlOptions options;
        options.writeHeader = choices.Below(2) == 0;
        options.vhdlOption.useAttrType = choices.Below(2) == 0;
        options.vhdlOption.openPin = choices.Below(2) == 0;
        HdlOptions copied(options);
        copied = options;
        VhdlStatements(vhdl).WriteTimeStamp("f");
        VerilogStatements(verilog).WriteTimeStamp("f");
        int const longest = Netlist::GetLongestAttrName(&netlist);
        FUZZ_EXPECT(longest >= 0, "%d", longest);
        if (choices.Below(2))
            netlist.CreateVerilogDummySignals();
        unsigned int const told = Questions(netlist).GetLength();
        FUZZ_EXPECT(told == Questions(netlist).GetLength(), "asking changes the answer");
        VhdlNetlister first(vhdl);
        VhdlNetlister(first).WriteNetlist(&netlist, &copied);
        VerilogNetlister(verilog).WriteNetlist(&netlist, copied);
        FUZZ_EXPECT(vhdl.GetValue().GetIndexOfString("entity top is", Text::COMPARE_EXACT) !=
                        Basis::NOT_FOUND,
                    "no entity");
        FUZZ_EXPECT(verilog.GetValue().GetIndexOfString("endmodule", Text::COMPARE_EXACT) !=
                        Basis::NOT_FOUND,
                    "no module");
    }

private:
    template <class T> T *Any(Iterator<T *> walk) {
        std::vector<T *> all;
        ForEach(walk, [&all](T *each) { all.push_back(each); });
        return all.empty() ? nullptr : all[choices.Below(static_cast<unsigned int>(all.size()))];
    }
    Pin *AnyPin() {
        Instance const *const instance = Any(netlist.GetInstanceIterator());
        return instance ? Any(instance->GetPinIterator()) : nullptr;
    }

    void AddSignal() {
        std::string const name = choices.Name();
        Bus *const parent = netlist.GetParentBus(name.c_str());
        switch (choices.Below(5)) {
        case 0:
            return netlist.Add(new Bus(name.c_str()));
        case 1:
            return netlist.Add(new BusSlice(name.c_str(), parent));
        case 2:
            return netlist.Add(new BusIndex(name.c_str(), parent));
        case 3: {
            auto *const compound = new CompoundBus(name.c_str());
            for (unsigned int left = choices.Below(4); left > 0; --left)
                compound->AddBusMember(Any(netlist.GetSignalIterator()));
            return netlist.Add(compound);
        }
        default:
            return netlist.Add(new ScalarSignal(name.c_str()));
        }
    }

    void Change(AttributeHolder *holder) {
        static char const *const TYPES[] = {"String", "integer",   "Float", "BOOLEAN",
                                            "Bit",    "BitVector", "User",  "none"};
        if (!holder)
            return;
        std::unique_ptr<Attribute> attr(AttributeFactory::GetInstance().CreateAttribute(
            TYPES[choices.Below(std::size(TYPES))], choices.Name().c_str(),
            choices.Text().c_str()));
        if (!attr)
            return;
        static char const *const WORDS[] = {"SYN", "nosyn", "ASSIGN", "ASSIGNNODEC", "NONE", "x"};
        attr->SetGeneric(WORDS[choices.Below(std::size(WORDS))]);
        attr->SetSynAttr(WORDS[choices.Below(std::size(WORDS))]);
        if (choices.Below(2))
            attr->SetValue(choices.Text().c_str());
        std::unique_ptr<Attribute> const copy(attr->CloneAttribute());
        if (attr->GetValueType() != Attribute::VALUE_FLOAT) // a copy is told without its decimals
            FUZZ_EXPECT(*copy == *attr, "%s", copy->GetName().GetText());
        holder->AddAttr(attr.release());
    }

    void Remove(Component *component) {
        PtrArray<Instance *> placed;
        netlist.GetInstances(component->GetName(), placed);
        netlist.GetInstances(component, placed);
        if (placed.IsEmpty())
            netlist.Remove(component);
    }

    void Remove(Instance *instance) {
        FUZZ_EXPECT(instance->HasAttrs() || HdlUtilities::GetAttrNames(instance).IsEmpty(),
                    "names of no attributes");
        ForEach(instance->GetPinIterator(), [this](Pin *pin) {
            ForEach(netlist.GetSignalIterator(), [pin](Signal *on) { on->Disconnect(pin); });
        });
        netlist.Remove(instance);
    }

    void Remove(Signal *signal) {
        bool isFree = true;
        ForEach(netlist.GetSignalIterator(), [&](Signal *other) {
            other->Disconnect(signal);
            if (auto *const bus = dynamic_cast<Bus *>(other))
                bus->RemoveBusSlice(signal);
            if (auto const *const compound = dynamic_cast<CompoundBus *>(other))
                ForEach(compound->GetBusMemberIterator(),
                        [&](Signal const *member) { isFree = isFree && member != signal; });
        });
        ForEach(netlist.GetInstanceIterator(), [&](Instance *instance) {
            ForEach(instance->GetPinIterator(), [&](Pin *pin) {
                if (pin->GetSignal() == signal)
                    signal->Disconnect(pin);
            });
        });
        if (isFree)
            netlist.Remove(signal);
    }

    void Step() {
        Component *const component = Any(netlist.GetComponentIterator());
        Instance *const instance = Any(netlist.GetInstanceIterator());
        Signal *const signal = Any(netlist.GetSignalIterator());
        Pin *const pin = AnyPin();
        switch (choices.Below(17)) {
        case 0:
            return netlist.Add(new Component(choices.Name().c_str()));
        case 1:
            if (component)
                component->AddPin(choices.Name().c_str(), choices.Polar(), choices.Text().c_str());
            return;
        case 2:
            return netlist.Add(new Instance(choices.Name().c_str(), component));
        case 3:
            return AddSignal();
        case 4:
            if (signal)
                signal->SetPortPolarity(choices.Polar());
            return;
        case 5:
            if (signal)
                signal->Connect(pin);
            return;
        case 6:
            if (signal)
                signal->Disconnect(pin);
            return;
        case 7:
            if (signal)
                signal->Connect(Any(netlist.GetSignalIterator()));
            return;
        case 8:
            if (signal)
                signal->AssignConstantValue(choices.Text().c_str());
            return;
        case 9:
            if (pin)
                pin->SetName(choices.Name().c_str());
            return;
        case 10:
            if (Pin *const other = AnyPin(); pin && other &&
                                             other->GetPinType() == Pin::PIN_SCALAR &&
                                             pin->GetPinType() == Pin::PIN_SCALAR)
                static_cast<ScalarPin &>(*pin) = static_cast<ScalarPin const &>(*other);
            return;
        case 11:
            return Change(choices.Below(2)   ? static_cast<AttributeHolder *>(signal)
                          : choices.Below(2) ? static_cast<AttributeHolder *>(component)
                                             : static_cast<AttributeHolder *>(instance));
        case 12:
            for (Object *const object : {static_cast<Object *>(signal), static_cast<Object *>(pin),
                                         static_cast<Object *>(instance)})
                if (object && choices.Below(2))
                    object->AddComment(choices.Text().c_str());
            return;
        case 13:
            return component ? Remove(component) : void();
        case 14:
            return instance ? Remove(instance) : void();
        case 15:
            return signal ? Remove(signal) : void();
        default:
            if (Signal *const other = Any(netlist.GetSignalIterator())) {
                other->AssignConstantValue(signal->GetConstantValue());
                static_cast<AttributeHolder &>(*other) = *signal;
                static_cast<Object &>(*other) = *signal;
            }
        }
    }

    Choices &choices;
    Netlist netlist;
    int steps = 0;
};

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    Choices choices(data, size);
    switch (choices.Below(5)) {
    case 0:
        Strings(choices);
        break;
    case 1:
        Expressions(choices);
        break;
    case 2:
        Collections(choices);
        break;
    default:
        Builder(choices).Run();
    }
    return 0;
}
