// The least that could do the tool's work on a plain design: it reads the same commands and writes
// about the same text, but checks nothing, sorts nothing and does not distinguish a bus from a
// scalar. The difference to the tool is the cost of the tool's rules.

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace {

struct Component {
    std::string name;
    std::vector<std::string> pins;
};

struct Signal {
    std::string name;
    bool isPort = false;
};

struct Instance {
    std::string name;
    Component const *component;
    std::vector<int> signals; ///< by pin; -1 for an open one
};

class Model {
public:
    void Run(std::vector<std::string_view> const &words) {
        std::string const keyword = std::string(words[0]).append(" ").append(words[1]);
        if (keyword == "CONNECT SIGNAL")
            Connect(words[2], words[3]);
        else if (keyword == "ADD SIGNAL" || keyword == "ADD PORT")
            signals[Find(words[2])].isPort = keyword == "ADD PORT";
        else if (keyword == "ADD INSTANCE")
            AddInstance(components[std::string(words[2])], words[3]);
        else if (keyword == "ADD COMPONENT")
            components[std::string(words[2])].name = words[2];
        else if (keyword == "ADD PIN")
            components[std::string(words[2])].pins.emplace_back(words[3]);
        else if (keyword == "SET NETLIST")
            name = words[3];
    }

    void Write(std::ostream &out, bool isVhdl) const {
        out << (isVhdl ? "entity " : "module ") << name << " (";
        for (Signal const &signal : signals)
            if (signal.isPort)
                out << signal.name << (isVhdl ? ": std_logic; " : ", ");
        out << ")\n";
        for (Signal const &signal : signals)
            if (!signal.isPort)
                out << (isVhdl ? "   signal " : "   wire ") << signal.name
                    << (isVhdl ? " : std_logic;\n" : ";\n");
        for (auto const &[left, right] : links)
            out << "   assign " << signals[left].name << " = " << signals[right].name << ";\n";
        for (Instance const &instance : instances)
            WriteInstance(out, instance, isVhdl);
        out << "end\n";
    }

private:
    std::size_t Find(std::string_view signal) {
        auto const [found, isNew] = signalsByName.try_emplace(std::string(signal), signals.size());
        if (isNew)
            signals.push_back({std::string(signal)});
        return found->second;
    }

    void AddInstance(Component const &component, std::string_view instance) {
        instancesByName[std::string(instance)] = instances.size();
        instances.push_back(
            {std::string(instance), &component, std::vector<int>(component.pins.size(), -1)});
    }

    void Connect(std::string_view signal, std::string_view target) {
        std::size_t const left = Find(signal);
        std::size_t const point = target.find('.');
        if (point == target.npos) {
            links.emplace_back(left, Find(target));
            return;
        }
        Instance &instance = instances[instancesByName[std::string(target.substr(0, point))]];
        std::vector<std::string> const &pins = instance.component->pins;
        for (std::size_t i = 0; i < pins.size(); ++i)
            if (pins[i] == target.substr(point + 1))
                instance.signals[i] = static_cast<int>(left);
    }

    void WriteInstance(std::ostream &out, Instance const &instance, bool isVhdl) const {
        constexpr std::size_t WIDTH = 80;
        Component const &component = *instance.component;
        std::string line = isVhdl ? instance.name + " : " + component.name + "\n   port map ("
                                  : component.name + " " + instance.name + " (";
        std::size_t begin = isVhdl ? line.rfind('\n') + 1 : 0;
        for (std::size_t i = 0; i < component.pins.size(); ++i) {
            int const signal = instance.signals[i];
            std::string const &on = signal < 0 ? "open" : signals[std::size_t(signal)].name;
            std::string const item =
                isVhdl ? component.pins[i] + "=>" + on : "." + component.pins[i] + "(" + on + ")";
            if (line.size() - begin + item.size() > WIDTH) {
                line += "\n         ";
                begin = line.size();
            }
            line.append(item).append(", ");
        }
        out << line << ");\n\n";
    }

    std::string name;
    std::unordered_map<std::string, Component> components;
    std::unordered_map<std::string, std::size_t> signalsByName;
    std::unordered_map<std::string, std::size_t> instancesByName;
    std::vector<Signal> signals;
    std::vector<Instance> instances;
    std::vector<std::pair<std::size_t, std::size_t>> links;
};

std::vector<std::string_view> Split(std::string_view line) {
    std::vector<std::string_view> words;
    for (std::size_t begin = 0; begin < line.size();) {
        std::size_t const end = std::min(line.find(' ', begin), line.size());
        words.push_back(line.substr(begin, end - begin));
        begin = end + 1;
    }
    return words;
}

} // namespace

int main(int argc, char **argv) {
    if (argc != 4) {
        std::fputs("usage: vesk_hdl_minimal COMMANDS VHDL VERILOG\n", stderr);
        return 2;
    }
    Model model;
    std::ifstream commands(argv[1]);
    for (std::string line; std::getline(commands, line);)
        model.Run(Split(line));
    for (bool const isVhdl : {true, false}) {
        std::ofstream out(argv[isVhdl ? 2 : 3]);
        model.Write(out, isVhdl);
    }
    std::_Exit(0); // all is written; freeing the memory would only take time
}
