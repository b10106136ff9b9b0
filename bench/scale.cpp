// Runs the tool on designs of growing size and tells how its time and memory grow.

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <limits>
#include <map>
#include <spawn.h>
#include <stdexcept>
#include <sys/resource.h>
#include <sys/wait.h>
#include <system_error>
#include <unistd.h>
#include <vector>

#include <CLI/CLI.hpp>

#include "bench/kinds.h"

namespace {

namespace fs = std::filesystem;

/// From this size on a point is measured once unless somebody asks for more.
constexpr long LARGE = 1000000;
constexpr int RUNS = 3;
/// Time that grows by more than this, against the growth of N, gets a mark.
constexpr double BEND = 1.2;

struct Options {
    std::vector<long> sizes = {10000, 100000, LARGE};
    std::vector<std::string> kinds;
    std::string output = "vhdl";
    int runs = 0; ///< 0 leaves it to the size
    std::string tool;
    std::string otherTool;
};

/// What a run costs, or the least of several runs.
struct Cost {
    double wall = std::numeric_limits<double>::infinity(); ///< in seconds
    double cpu = std::numeric_limits<double>::infinity();  ///< in seconds, user and system
    double peak = std::numeric_limits<double>::infinity(); ///< resident, in bytes

    void Lower(Cost const &other) {
        wall = std::min(wall, other.wall);
        cpu = std::min(cpu, other.cpu);
        peak = std::min(peak, other.peak);
    }
};

double Seconds(timeval const &time) {
    return static_cast<double>(time.tv_sec) + 1e-6 * static_cast<double>(time.tv_usec);
}

/// A folder that goes away with this object.
class ScratchFolder {
public:
    ScratchFolder() {
        std::string name = (fs::temp_directory_path() / "vesk_hdl_scale.XXXXXX").string();
        if (!::mkdtemp(name.data()))
            throw std::system_error(errno, std::generic_category(), name);
        path = name;
    }
    ~ScratchFolder() {
        std::error_code ignored;
        fs::remove_all(path, ignored);
    }
    ScratchFolder(ScratchFolder const &) = delete;
    ScratchFolder &operator=(ScratchFolder const &) = delete;

    fs::path const &GetPath() const { return path; }

private:
    fs::path path;
};

Cost RunTool(std::string tool, fs::path const &folder, fs::path const &design) {
    std::string words[] = {std::move(tool), "run", "--output-dir", folder.string(),
                           design.string()};
    std::vector<char *> arguments;
    for (std::string &word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);

    auto const begin = std::chrono::steady_clock::now();
    pid_t process = 0;
    int const error =
        ::posix_spawn(&process, arguments[0], nullptr, nullptr, arguments.data(), environ);
    if (error != 0)
        throw std::system_error(error, std::generic_category(), words[0]);
    int status = 0;
    rusage usage = {};
    if (::wait4(process, &status, 0, &usage) < 0)
        throw std::system_error(errno, std::generic_category(), words[0]);
    std::chrono::duration<double> const wall = std::chrono::steady_clock::now() - begin;
    if (!WIFEXITED(status) || WEXITSTATUS(status) != 0)
        throw std::runtime_error(words[0] + ": failed on " + words[4]);
    return {wall.count(), Seconds(usage.ru_utime) + Seconds(usage.ru_stime),
            1024.0 * static_cast<double>(usage.ru_maxrss)};
}

class Measurement {
public:
    explicit Measurement(Options const &asked) : options(asked) {}

    void Run() const {
        std::printf("%-10s %8s %9s %9s %7s %9s%s\n", "kind", "N", "wall s", "cpu s", "growth",
                    "bytes/N", options.otherTool.empty() ? "" : "  time and bytes to other");
        for (Kind const &kind : GetKinds())
            if (options.kinds.empty() || std::find(options.kinds.begin(), options.kinds.end(),
                                                   kind.name) != options.kinds.end())
                RunKind(kind);
    }

private:
    void RunKind(Kind const &kind) const {
        double const empty = Point(kind, 0, 1).front().peak;
        Cost former;
        long formerSize = 0;
        for (long const size : options.sizes) {
            int const runs = options.runs > 0 ? options.runs : size >= LARGE ? 1 : RUNS;
            std::vector<Cost> const costs = Point(kind, size, runs);
            Cost const &cost = costs.front();
            auto const n = static_cast<double>(size);
            std::printf("%-10s %8ld %9.3f %9.3f ", kind.name, size, cost.wall, cost.cpu);
            if (formerSize == 0) {
                std::printf("%6s  ", "");
            } else {
                double const growth = cost.cpu / former.cpu;
                bool const bends = growth > BEND * n / static_cast<double>(formerSize);
                std::printf("%6.1f%c ", growth, bends ? '!' : ' ');
            }
            std::printf("%9.0f", (cost.peak - empty) / n);
            if (costs.size() > 1)
                std::printf("  %6.2f %6.2f", cost.cpu / costs[1].cpu, cost.peak / costs[1].peak);
            std::printf("\n");
            std::fflush(stdout);
            former = cost;
            formerSize = size;
        }
    }

    /// What a design costs each tool. The tools take turns, so that both meet the same weather.
    std::vector<Cost> Point(Kind const &kind, long size, int runs) const {
        fs::path const design = scratch.GetPath() / "design.cmd";
        {
            std::ofstream lines(design);
            WriteDesign(lines, kind, size, options.output == "vhdl" ? "design.vhd" : "",
                        options.output == "verilog" ? "design.v" : "");
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
                least[i].Lower(RunTool(tools[i], scratch.GetPath(), design));
        return least;
    }

    Options const &options;
    ScratchFolder scratch;
};

} // namespace

int main(int argc, char **argv) {
    CLI::App app("Tells how the tool's time and memory grow with the design.", "vesk_hdl_scale");
    Options options;
    std::vector<std::string> kindNames;
    for (Kind const &kind : GetKinds())
        kindNames.emplace_back(kind.name);
    app.add_option("N", options.sizes, "Sizes, ascending")
        ->check(CLI::PositiveNumber)
        ->capture_default_str();
    app.add_option("--kind", options.kinds, "Only these kinds")->check(CLI::IsMember(kindNames));
    app.add_option("--output", options.output, "What is written; none only reads")
        ->check(CLI::IsMember({"none", "vhdl", "verilog"}))
        ->capture_default_str();
    app.add_option("--runs", options.runs, "Runs for each point, of which the least counts");
    app.add_option("--tool", options.tool, "The vesk-hdl to measure")
        ->required()
        ->check(CLI::ExistingFile);
    app.add_option("--against", options.otherTool, "Another vesk-hdl to compare it with")
        ->check(CLI::ExistingFile);
    CLI11_PARSE(app, argc, argv);
    try {
        Measurement(options).Run();
    } catch (std::exception const &error) {
        std::fprintf(stderr, "vesk_hdl_scale: %s\n", error.what());
        return 1;
    }
}
