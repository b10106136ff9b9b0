// A client that embeds the library: makes the commands of a shift register, has them run, looks at
// the design, and writes it.
#include <cstdlib>
#include <cstring>
#include <iostream>
#include <string>

#include "vesk_hdl/Vesk_Hdl.h"

namespace {

// Each line is one command; a refused one raises Vesk_Hdl::Exception.
void Build(Vesk_Hdl::Engine &engine, int length) {
    for (char const *line : {"ADD COMPONENT DFF", "ADD PIN DFF C in", "ADD PIN DFF D in",
                             "ADD PIN DFF Q out", "ADD PORT CLK in", "ADD PORT D in"})
        engine.Execute(line);
    std::string const bus = "Q(" + std::to_string(length - 1) + ":0)";
    engine.Execute(("ADD PORT " + bus + " out").c_str());

    std::string input = "D";
    for (int bit = 0; bit < length; ++bit) {
        std::string const instance = "FF" + std::to_string(bit);
        std::string const output = "Q(" + std::to_string(bit) + ")";
        engine.Execute(("ADD INSTANCE DFF " + instance).c_str());
        engine.Execute(("CONNECT SIGNAL CLK " + instance + ".C").c_str());
        engine.Execute(("CONNECT SIGNAL " + input + " " + instance + ".D").c_str());
        engine.Execute(("CONNECT SIGNAL " + output + " " + instance + ".Q").c_str());
        input = output;
    }
}

// The netlist may be walked at any time. The iterators belong to it and end with it.
void List(Vesk_Hdl::Netlist const &netlist) {
    Vesk_Hdl::ForEach(netlist.GetInstanceIterator(), [](Vesk_Hdl::Instance *instance) {
        std::cout << instance->GetName() << " : " << instance->GetComponent()->GetName() << '\n';
    });
}

// A write raises nothing when the file cannot be written: one has to ask.
bool Write(Vesk_Hdl::Engine &engine, std::string const &line) {
    engine.Execute(line.c_str());
    Vesk_Hdl::WriteStatus const &status = engine.GetCurrentModel()->GetLastWrite();
    if (status.error != 0)
        std::cerr << status.fileName << ": " << std::strerror(status.error) << '\n';
    return status.error == 0;
}

} // namespace

int main(int argc, char **argv) {
    int const length = argc == 2 ? std::atoi(argv[1]) : 0;
    if (length < 2) {
        std::cerr << "usage: shift_register LENGTH (at least 2)\n";
        return 2;
    }
    try {
        Vesk_Hdl::Engine engine;
        engine.CreateAndAddModel("shifter", nullptr);
        engine.UseModel("shifter");
        Build(engine, length);
        List(*engine.GetCurrentModel()->GetNetlist());
        bool const vhdl = Write(engine, "WRITE VHDL -NOHEADER shifter.vhd");
        bool const verilog = Write(engine, "WRITE VERILOG -NOHEADER shifter.v");
        return vhdl && verilog ? 0 : 1;
    } catch (Vesk_Hdl::Exception const &refusal) {
        std::cerr << refusal.getDescription();
        return 1;
    }
}
