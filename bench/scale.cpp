// Runs the tool on designs of growing size and prints how its time and memory grow.

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <map>
#include <stdexcept>
#include <vector>

#include <CLI/CLI.hpp>

#include "bench/kinds.h"
#include "bench/measure.h"

namespace {

namespace fs = std::filesystem;

/// From this size on a point is measured once, unless --runs asks for more.
constexpr long LARGE = 1000000;
constexpr int RUNS = 3;
/// Time that grows by more than this, against the growth of N, gets a mark.
constexpr double BEND = 1.05;

struct Options {
    std::vector<long> sizes = {10000, 100000, LARGE};
    std::vector<std::string> kinds;
    std::string output = "vhdl";
    int runs = 0; ///< 0 if it depends on the size
    std::string tool;
    std::string otherTool;
    std::string lastFile;
};

/// The figures of the last run, in a file that is not part of the repository: they are valid on one
/// machine only.
class LastRun {
public:
    struct Figures {
        double cpu;
        double bytes;
    };

    /// Without the file, or with one that this program did not write, there was no last run.
    explicit LastRun(std::string fileName) : name(std::move(fileName)) {
        std::ifstream file(name);
        for (std::string line; std::getline(file, line);) {
            char point[64] = "";
            Figures figures = {};
            if (std::sscanf(line.c_str(), R"( {"point": "%63[^"]", "cpu": %lf, "bytes": %lf})",
                            point, &figures.cpu, &figures.bytes) == 3)
                last[point] = figures;
        }
    }

    /// Null if the point was not measured then.
    Figures const *Get(std::string const &point) const {
        auto const found = last.find(point);
        return found == last.end() ? nullptr : &found->second;
    }
    void Note(std::string const &point, Figures const &figures) { now[point] = figures; }

    /// Figures that were not measured now are kept.
    void Save() {
        if (name.empty())
            return;
        now.merge(last);
        std::ofstream file(name);
        char const *separator = "[\n";
        for (auto const &[point, figures] : now) {
            file << separator << R"({"point": ")" << point << R"(", "cpu": )" << figures.cpu
                 << R"(, "bytes": )" << figures.bytes << '}';
            separator = ",\n";
        }
        file << "\n]\n";
        if (!file.flush())
            throw std::runtime_error(name + ": cannot be written");
    }

private:
    std::string name;
    std::map<std::string, Figures> last;
    std::map<std::string, Figures> now;
};

class Measurement {
public:
    explicit Measurement(Options const &asked) : options(asked), last(asked.lastFile) {}

    void Run() {
        std::printf("%-13s %8s %9s %9s %7s %9s%s%s\n", "kind", "N", "wall s", "cpu s", "growth",
                    "bytes/N", options.lastFile.empty() ? "" : "  cpu and bytes to last",
                    options.otherTool.empty() ? "" : "  to other");
        for (Kind const &kind : GetKinds())
            if (options.kinds.empty() || std::find(options.kinds.begin(), options.kinds.end(),
                                                   kind.name) != options.kinds.end())
                RunKind(kind);
        last.Save();
    }

private:
    void RunKind(Kind const &kind) {
        double const empty = Point(kind, 0, 1).front().peak;
        Cost former;
        long formerSize = 0;
        for (long const size : options.sizes) {
            int const runs = options.runs > 0 ? options.runs : size >= LARGE ? 1 : RUNS;
            std::vector<Cost> const costs = Point(kind, size, runs);
            Cost const &cost = costs.front();
            auto const n = static_cast<double>(size);
            std::printf("%-13s %8ld %9.3f %9.3f ", kind.name, size, cost.wall, cost.cpu);
            if (formerSize == 0) {
                std::printf("%6s  ", "");
            } else {
                double const growth = cost.cpu / former.cpu;
                bool const bends = growth > BEND * n / static_cast<double>(formerSize);
                std::printf("%6.1f%c ", growth, bends ? '!' : ' ');
            }
            LastRun::Figures const figures = {cost.cpu, (cost.peak - empty) / n};
            std::printf("%9.0f", figures.bytes);
            PrintToLast(std::string(kind.name) + " " + options.output + " " + std::to_string(size),
                        figures);
            if (costs.size() > 1)
                std::printf("  %6.2f %6.2f", cost.cpu / costs[1].cpu, cost.peak / costs[1].peak);
            std::printf("\n");
            std::fflush(stdout);
            former = cost;
            formerSize = size;
        }
    }

    void PrintToLast(std::string const &point, LastRun::Figures const &figures) {
        if (options.lastFile.empty())
            return;
        if (LastRun::Figures const *const before = last.Get(point))
            std::printf("  %10.2f %10.2f", figures.cpu / before->cpu,
                        figures.bytes / before->bytes);
        else
            std::printf("  %10s %10s", "-", "-");
        last.Note(point, figures);
    }

    /// What a design costs each tool. The tools take turns, so that other load on the machine
    /// affects both.
    std::vector<Cost> Point(Kind const &kind, long size, int runs) const {
        fs::path const design = scratch.GetPath() / "design.cmd";
        {
            std::ofstream lines(design);
            bool const both = options.output == "both";
            WriteDesign(lines, kind, size, both || options.output == "vhdl" ? "design.vhd" : "",
                        both || options.output == "verilog" ? "design.v" : "");
            lines.close();
            if (!lines)
                throw std::runtime_error(design.string() + ": cannot be written");
        }
        std::vector<std::string> tools = {options.tool};
        if (!options.otherTool.empty())
            tools.push_back(options.otherTool);
        std::vector<Cost> least(tools.size());
        for (int run = 0; run < runs; ++run)
            for (std::size_t i = 0; i < tools.size(); ++i)
                least[i].Lower(
                    RunProgram({tools[i], "run", design.string()}, scratch.GetPath(), false));
        return least;
    }

    Options const &options;
    LastRun last;
    ScratchFolder scratch;
};

} // namespace

int main(int argc, char **argv) {
    CLI::App app("Measures how the tool's time and memory grow with the design.", "vesk_hdl_scale");
    Options options;
    std::vector<std::string> kindNames;
    for (Kind const &kind : GetKinds())
        kindNames.emplace_back(kind.name);
    app.add_option("N", options.sizes, "Sizes, ascending")
        ->check(CLI::PositiveNumber)
        ->capture_default_str();
    app.add_option("--kind", options.kinds, "Only these kinds")->check(CLI::IsMember(kindNames));
    app.add_option("--output", options.output, "What is written; none only reads")
        ->check(CLI::IsMember({"none", "vhdl", "verilog", "both"}))
        ->capture_default_str();
    app.add_option("--runs", options.runs, "Runs for each point, of which the least counts");
    app.add_option("--tool", options.tool, "The vesk-hdl to measure")
        ->required()
        ->check(CLI::ExistingFile);
    app.add_option("--against", options.otherTool, "Another vesk-hdl to compare it with")
        ->check(CLI::ExistingFile);
    app.add_option("--last", options.lastFile, "Keeps the figures here, and compares with those");
    CLI11_PARSE(app, argc, argv);
    try {
        options.tool = fs::absolute(options.tool).string();
        if (!options.otherTool.empty())
            options.otherTool = fs::absolute(options.otherTool).string();
        Measurement(options).Run();
    } catch (std::exception const &error) {
        std::fprintf(stderr, "vesk_hdl_scale: %s\n", error.what());
        return 1;
    }
}
