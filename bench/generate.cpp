// Writes a command file of a chosen kind and size to standard output.

#include <iostream>

#include <CLI/CLI.hpp>

#include "bench/hostile_kinds.h"
#include "bench/kinds.h"

int main(int argc, char **argv) {
    CLI::App app("Writes a command file that declares, connects and writes a design.",
                 "vesk_hdl_generate");
    std::string kindName;
    long n = 0;
    std::string vhdlFile;
    std::string verilogFile;
    app.add_option("KIND", kindName, "What the design is like")->required();
    app.add_option("N", n, "How large it is")->required()->check(CLI::NonNegativeNumber);
    app.add_option("--vhdl", vhdlFile, "End with a line that writes this VHDL file");
    app.add_option("--verilog", verilogFile, "End with a line that writes this Verilog file");
    std::string footer = "Kinds:\n";
    for (Kind const &kind : GetKinds())
        footer.append("  ")
            .append(kind.name)
            .append(": ")
            .append(kind.shape)
            .append("; N counts ")
            .append(kind.counts)
            .append("\n");
    footer += "and the hostile kinds, which are written without a last line that writes";
    app.footer(footer);
    CLI11_PARSE(app, argc, argv);

    std::ios::sync_with_stdio(false);
    if (Kind const *const kind = FindKind(kindName)) {
        WriteDesign(std::cout, *kind, n, vhdlFile, verilogFile);
    } else if (HostileKind const *const hostile = FindHostileKind(kindName)) {
        WriteHostile(std::cout, *hostile, n);
    } else {
        std::cerr << kindName << ": no such kind\n" << footer << '\n';
        return 2;
    }
    std::cout.flush();
    return std::cout ? 0 : 1;
}
