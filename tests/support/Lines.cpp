#include "tests/support/Lines.h"

#include <algorithm>
#include <sstream>

using namespace Vesk_Hdl;

std::string Refusal(Model &model, Lines const &lines) {
    return MessageOf([&] {
        for (std::string const &line : lines)
            model.Execute(line.c_str());
    });
}

Design::Design(Lines const &lines) : model(&factory), netlist(*model.GetNetlist()) {
    for (std::string const &line : lines)
        model.Execute(line.c_str());
}

Lines Pieces(std::string const &text) {
    Lines pieces;
    std::istringstream stream(text);
    for (std::string piece; std::getline(stream >> std::ws, piece, ';');)
        pieces.push_back(piece);
    return pieces;
}

std::vector<std::pair<std::string, std::string>> Pairs(std::string const &text) {
    std::vector<std::pair<std::string, std::string>> pairs;
    for (std::string const &piece : Pieces(text)) {
        std::size_t const middle = piece.find('=');
        pairs.emplace_back(piece.substr(0, middle), piece.substr(middle + 1));
    }
    return pairs;
}

Lines Short(std::string const &text) {
    Lines lines = Pieces(text);
    for (std::string &line : lines)
        if (std::size_t const value = line.find(" = "); value != std::string::npos)
            line = "ASSIGN CONSTANT " + line.replace(value, 3, " ");
        else if (line.starts_with("port "))
            line = "ADD PORT " + line.substr(5);
        else if (line.starts_with("sig "))
            line = "ADD SIGNAL " + line.substr(4);
        else if (!line.starts_with("ADD ") && !line.starts_with("SET "))
            line = "CONNECT SIGNAL " + line;
    return lines;
}

Lines const &Cells() {
    static Lines const lines =
        Short("ADD COMPONENT CELL; ADD PIN CELL A in; ADD PIN CELL Y out; ADD PIN CELL IO bi;"
              "ADD PIN CELL B(3:0) in; ADD PIN CELL Q(3:0) out; ADD PIN CELL W(7:0) in;"
              "ADD PIN CELL S(2) in; ADD INSTANCE CELL u1; ADD INSTANCE CELL u2;"
              "ADD INSTANCE CELL u3");
    return lines;
}

Lines CellsAnd(std::string const &text) {
    Lines all = Cells();
    Lines const more = Short(text);
    all.insert(all.end(), more.begin(), more.end());
    return all;
}

namespace {

struct PlacedPin {
    Pin *pin;
    std::string name;
};

class WiringText {
public:
    explicit WiringText(Netlist const &netlist) {
        ForEach(netlist.GetInstanceIterator(), [this](Instance *instance) {
            ForEach(instance->GetPinIterator(), [&](Pin *pin) {
                pins.push_back(
                    {pin, std::string(instance->GetName()) + "." + pin->GetName().GetText()});
            });
        });
        ForEach(netlist.GetSignalIterator(), [this](Signal *signal) { inside.push_back(signal); });
        for (Signal *const signal : inside)
            AddLine(signal, "", "");
        for (PlacedPin const &placed : pins)
            Reach(placed.pin->GetSignal());
        for (std::size_t i = 0; i < outside.size(); ++i)
            AddLine(outside[i], "[", "]");
    }

    std::string text;

private:
    void Reach(Signal *signal) {
        auto const isIn = [signal](std::vector<Signal *> const &list) {
            return std::find(list.begin(), list.end(), signal) != list.end();
        };
        if (signal && !isIn(inside) && !isIn(outside))
            outside.push_back(signal);
    }

    void AddLine(Signal *signal, char const *open, char const *close) {
        static char const *const PORTS[] = {"", "in ", "out ", "inout "};
        text += PORTS[signal->GetPortPolarity().GetValue() + 1];
        text += open + std::string(signal->GetName()) + close;
        auto const reach = [this](Signal *other) { Reach(other); };
        if (auto const *const compound = dynamic_cast<CompoundBus const *>(signal)) {
            text += " {" + NamesOf(compound->GetBusMemberIterator()) + "}";
            ForEach(compound->GetBusMemberIterator(), reach);
        }
        std::string const found = PinsOf(signal);
        text += found.empty() ? "" : ":" + found;
        if (signal->GetSignalIterator().HasMore())
            text += " <- " + NamesOf(signal->GetSignalIterator());
        ForEach(signal->GetSignalIterator(), reach);
        if (auto const *const bus = dynamic_cast<Bus const *>(signal))
            ForEach(bus->GetBusSliceIterator(), reach);
        text += "\n";
    }

    std::string PinsOf(Signal const *signal) const {
        std::string found;
        std::vector<Pin *> listed;
        ForEach(signal->GetPinIterator(), [&](Pin *pin) {
            listed.push_back(pin);
            for (PlacedPin const &placed : pins)
                if (placed.pin == pin)
                    found += " " + placed.name + (pin->GetSignal() == signal ? "" : "!");
        });
        for (PlacedPin const &placed : pins)
            if (placed.pin->GetSignal() == signal &&
                std::find(listed.begin(), listed.end(), placed.pin) == listed.end())
                found += " (" + placed.name + ")";
        return found;
    }

    std::vector<PlacedPin> pins;
    std::vector<Signal *> inside;
    std::vector<Signal *> outside;
};

} // namespace

std::string Wiring(Netlist const &netlist) { return WiringText(netlist).text; }
