// Runs the tool and its peers on one netlist, in turn, and prints the tool's share of their time
// and memory. The tool reads commands and writes VHDL and Verilog; the peers read and write Verilog
// alone. The minimal model does the tool's work without its rules.

#include <cstdio>
#include <fstream>
#include <map>
#include <stdexcept>

#include <CLI/CLI.hpp>

#include "bench/kinds.h"
#include "bench/measure.h"

namespace {

namespace fs = std::filesystem;

/// Programs that take minutes for a large design are left out of those.
constexpr long NO_LIMIT = 1000000000;

struct Program {
    char const *name;
    long mostInstances;
    std::vector<std::string> words;
};

struct Options {
    std::vector<long> sizes = {100000, 1000000};
    std::vector<std::string> kinds = {"chain", "net", "bus"};
    int runs = 3;
    std::string tool;
    std::string model;
};

std::vector<Program> Programs(Options const &options, std::string const &module) {
    return {
        {"vesk-hdl", NO_LIMIT, {options.tool, "run", "design.cmd"}},
        {"model", NO_LIMIT, {options.model, "design.cmd", "model.vhd", "model.v"}},
        {"OpenSTA", NO_LIMIT, {"sta", "-no_splash", "-exit", "peer.tcl"}},
        {"Yosys",
         100000,
         {"yosys", "-q", "-p",
          "read_verilog peer.v; hierarchy -top " + module + "; write_verilog -noattr yosys.v"}}};
}

/// The peers read what the tool wrote. OpenSTA knows no directives.
void WritePeerFiles(fs::path const &folder, std::string const &module) {
    std::ifstream from(folder / "design.v");
    std::ofstream to(folder / "peer.v");
    for (std::string line; std::getline(from, line);)
        if (!line.starts_with('`'))
            to << line << '\n';
    std::ofstream(folder / "peer.tcl")
        << "read_verilog peer.v\nlink_design " << module << "\nwrite_verilog sta.v\nexit\n";
    if (!to.flush())
        throw std::runtime_error((folder / "peer.v").string() + ": cannot be written");
}

void Compare(Options const &options, Kind const &kind, long size) {
    ScratchFolder const scratch;
    fs::path const &folder = scratch.GetPath();
    std::string const module = std::string("bench_") + kind.name;
    {
        std::ofstream lines(folder / "design.cmd");
        WriteDesign(lines, kind, size, "design.vhd", "design.v");
    }
    RunProgram({options.tool, "run", "design.cmd"}, folder, false);
    WritePeerFiles(folder, module);

    std::vector<Program> const programs = Programs(options, module);
    std::vector<Cost> least(programs.size());
    for (int run = 0; run < options.runs; ++run)
        for (std::size_t i = 0; i < programs.size(); ++i)
            if (size <= programs[i].mostInstances)
                least[i].Lower(RunProgram(programs[i].words, folder, true));

    Cost const &own = least.front();
    for (std::size_t i = 0; i < programs.size(); ++i) {
        Cost const &cost = least[i];
        if (size > programs[i].mostInstances)
            continue;
        std::printf("%-6s %8ld %-9s %8.3f %8.3f %8.0f %7.2f %7.2f\n", kind.name, size,
                    programs[i].name, cost.wall, cost.cpu, cost.peak / 1e6, own.wall / cost.wall,
                    own.peak / cost.peak);
    }
    std::fflush(stdout);
}

} // namespace

int main(int argc, char **argv) {
    CLI::App app("Compares the tool with other programs on the same netlist.", "vesk_hdl_peers");
    Options options;
    app.add_option("N", options.sizes, "Sizes")->check(CLI::PositiveNumber)->capture_default_str();
    app.add_option("--kind", options.kinds, "Only these kinds")->capture_default_str();
    app.add_option("--runs", options.runs, "Runs, of which the least counts")
        ->capture_default_str();
    app.add_option("--tool", options.tool, "The vesk-hdl")->required()->check(CLI::ExistingFile);
    app.add_option("--model", options.model, "The minimal model")
        ->required()
        ->check(CLI::ExistingFile);
    CLI11_PARSE(app, argc, argv);
    try {
        options.tool = fs::absolute(options.tool).string();
        options.model = fs::absolute(options.model).string();
        std::printf("%-6s %8s %-9s %8s %8s %8s %7s %7s\n", "kind", "N", "program", "wall s",
                    "cpu s", "MB", "time*", "MB*");
        for (std::string const &name : options.kinds)
            for (long const size : options.sizes) {
                Kind const *const kind = FindKind(name);
                if (!kind)
                    throw std::runtime_error(name + ": no such kind");
                Compare(options, *kind, size);
            }
        std::printf("* what vesk-hdl needs for each of the program's\n");
    } catch (std::exception const &error) {
        std::fprintf(stderr, "vesk_hdl_peers: %s\n", error.what());
        return 1;
    }
}
