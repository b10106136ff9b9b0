// Runs the tool on hostile files of growing size and prints how fast its time and memory grow.

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <fstream>
#include <optional>
#include <stdexcept>
#include <vector>

#include <CLI/CLI.hpp>

#include "bench/hostile_kinds.h"
#include "bench/measure.h"

namespace {

namespace fs = std::filesystem;

constexpr int STEPS = 4;      ///< n, 2n, 4n and 8n
constexpr int MORE_STEPS = 2; ///< for kinds that are too fast to be measured
constexpr double ENOUGH_CPU = 0.15;
/// What is less than this above the cost of an empty file is noise.
constexpr double LEAST_CPU = 0.02;
constexpr double LEAST_MEMORY = 1e6;

struct Options {
    std::vector<std::string> kinds;
    std::vector<std::string> modes = {"run", "check"};
    double sizes = 1;
    int runs = 1;
    double timeout = 20;
    double memory = 8000;
    double limit = 1.1;
    bool list = false;
    std::string tool;
};

/// The command lines that are measured. A refused line does not end a run.
std::vector<std::string> CommandLine(std::string const &tool, std::string const &mode,
                                     std::string const &file) {
    if (mode == "run")
        return {tool, "run", "--keep-going", "--vhdl", "/dev/null", "--verilog", "/dev/null", file};
    if (mode == "json")
        return {tool, "check", "--diagnostics", "json", file};
    return {tool, "check", file};
}

/// What a kind costs at its sizes; the last sizes are missing if a limit was met.
struct Curve {
    std::vector<double> sizes;
    std::vector<Cost> costs;
    bool isCut = false;
};

/// The slope of the logarithms over the largest sizes whose cost is above the noise; nothing if
/// there are fewer than two such sizes.
std::optional<double> Exponent(Curve const &curve, double Cost::*what, Cost const &empty,
                               double least) {
    constexpr std::size_t MOST_POINTS = 3;
    std::vector<std::pair<double, double>> points;
    for (std::size_t i = curve.costs.size(); i-- > 0 && points.size() < MOST_POINTS;) {
        double const cost = curve.costs[i].*what - empty.*what;
        if (cost < least)
            break;
        points.emplace_back(std::log(curve.sizes[i]), std::log(cost));
    }
    if (points.size() < 2)
        return std::nullopt;
    auto const count = static_cast<double>(points.size());
    double x = 0;
    double y = 0;
    for (auto const &[size, cost] : points) {
        x += size / count;
        y += cost / count;
    }
    double above = 0;
    double below = 0;
    for (auto const &[size, cost] : points) {
        above += (size - x) * (cost - y);
        below += (size - x) * (size - x);
    }
    return above / below;
}

class Measurement {
public:
    explicit Measurement(Options const &asked) : options(asked) {}

    void Run() {
        std::printf("%-42s %8s %7s", "kind", "N", "kB");
        for (std::string const &mode : options.modes)
            std::printf(" | %5s s %6s %6s %6s", mode.c_str(), "exp", "MB", "exp");
        std::printf(" | ratios\n");
        for (HostileKind const &kind : GetHostileKinds())
            if (IsWanted(kind))
                RunKind(kind);
        std::printf("%d kinds grow faster than N to the %.2f (!), %d because they ask for it (i)\n",
                    fast, options.limit, inherent);
    }

private:
    /// By its whole name, or by the beginning of it in front of a `*`.
    bool IsWanted(HostileKind const &kind) const {
        return options.kinds.empty() ||
               std::any_of(
                   options.kinds.begin(), options.kinds.end(), [&](std::string const &name) {
                       return name.back() == '*' ? kind.name.compare(0, name.size() - 1, name, 0,
                                                                     name.size() - 1) == 0
                                                 : kind.name == name;
                   });
    }

    void RunKind(HostileKind const &kind) {
        fs::path const file = scratch.GetPath() / "hostile.cmd";
        std::vector<Curve> curves(options.modes.size());
        double size = std::max(1.0, std::floor(options.sizes * static_cast<double>(kind.size)));
        for (int step = 1; step < STEPS; ++step)
            size = std::max(1.0, std::floor(size / 2));
        for (int step = 0; step < STEPS + MORE_STEPS && GoOn(curves, step); ++step) {
            size *= step > 0 ? 2 : 1;
            Write(kind, size, file);
            for (std::size_t mode = 0; mode < curves.size(); ++mode)
                AddPoint(curves[mode], options.modes[mode], size, file);
        }
        std::printf("%-42s %8.0f %7.0f", kind.name.c_str(), size,
                    static_cast<double>(fs::file_size(file)) / 1000);
        bool isFast = false;
        for (std::size_t mode = 0; mode < curves.size(); ++mode) {
            Confirm(kind, curves[mode], options.modes[mode], file);
            isFast |= Print(curves[mode], options.modes[mode], kind.inherent != nullptr);
        }
        (kind.inherent ? inherent : fast) += isFast ? 1 : 0;
        PrintRatios(curves);
        std::printf("\n");
        std::fflush(stdout);
    }

    /// Whether another size is worth measuring.
    static bool GoOn(std::vector<Curve> const &curves, int step) {
        bool const isAnyLeft = std::any_of(curves.begin(), curves.end(),
                                           [](Curve const &curve) { return !curve.isCut; });
        return step < STEPS ? isAnyLeft
                            : std::all_of(curves.begin(), curves.end(), [](Curve const &curve) {
                                  return !curve.isCut && curve.costs.back().cpu < ENOUGH_CPU;
                              });
    }

    static void Write(HostileKind const &kind, double size, fs::path const &file) {
        std::ofstream lines(file);
        WriteHostile(lines, kind, static_cast<long>(size));
        lines.close();
        if (!lines)
            throw std::runtime_error(file.string() + ": cannot be written");
    }

    std::optional<Cost> Measure(std::string const &mode, fs::path const &file, int runs) const {
        Cost least;
        for (int run = 0; run < runs; ++run) {
            std::optional<Cost> const cost =
                TryProgram(CommandLine(options.tool, mode, file.string()), scratch.GetPath(),
                           {options.timeout, options.memory * 1e6});
            if (!cost)
                return std::nullopt;
            least.Lower(*cost);
        }
        return least;
    }

    void AddPoint(Curve &curve, std::string const &mode, double size, fs::path const &file) const {
        if (curve.isCut)
            return;
        if (std::optional<Cost> const cost = Measure(mode, file, options.runs)) {
            curve.sizes.push_back(size);
            curve.costs.push_back(*cost);
        } else {
            curve.isCut = true;
        }
    }

    /// What seems to grow too fast is measured again: other work on the machine can only make a run
    /// slower.
    void Confirm(HostileKind const &kind, Curve &curve, std::string const &mode,
                 fs::path const &file) {
        constexpr int MORE = 3;
        if (curve.isCut || curve.costs.back().cpu > options.timeout / 10)
            return;
        std::optional<double> const exponent = Exponent(curve, &Cost::cpu, Empty(mode), LEAST_CPU);
        if (!exponent || *exponent <= options.limit)
            return;
        for (std::size_t i = 0; i < curve.sizes.size(); ++i) {
            Write(kind, curve.sizes[i], file);
            if (std::optional<Cost> const cost = Measure(mode, file, MORE))
                curve.costs[i].Lower(*cost);
        }
    }

    /// Whether it grows too fast.
    bool Print(Curve const &curve, std::string const &mode, bool isInherent) {
        bool isFast = curve.isCut;
        auto const exponent = [&](double Cost::*what, double least) {
            std::optional<double> const found = Exponent(curve, what, Empty(mode), least);
            bool const bends = found && *found > options.limit;
            isFast |= bends;
            if (found)
                std::printf(" %5.2f%c", *found, !bends ? ' ' : isInherent ? 'i' : '!');
            else
                std::printf(" %5s ", "-");
        };
        if (curve.isCut)
            std::printf(" | %7s", "stopped");
        else
            std::printf(" | %7.3f", curve.costs.back().cpu);
        exponent(&Cost::cpu, LEAST_CPU);
        if (curve.costs.empty())
            std::printf(" %6s", "-");
        else
            std::printf(" %6.0f", curve.costs.back().peak / 1e6);
        exponent(&Cost::peak, LEAST_MEMORY);
        return isFast;
    }

    /// The time and memory of each further mode for each of the first one, at the largest size that
    /// both came to.
    static void PrintRatios(std::vector<Curve> const &curves) {
        std::printf(" |");
        for (std::size_t mode = 1; mode < curves.size(); ++mode) {
            std::size_t const common = std::min(curves[0].costs.size(), curves[mode].costs.size());
            if (common == 0)
                continue;
            Cost const &first = curves[0].costs[common - 1];
            Cost const &other = curves[mode].costs[common - 1];
            std::printf(" %5.2f %5.2f", other.cpu / first.cpu, other.peak / first.peak);
        }
    }

    Cost const &Empty(std::string const &mode) {
        auto const found = empty.find(mode);
        if (found != empty.end())
            return found->second;
        fs::path const file = scratch.GetPath() / "empty.cmd";
        std::ofstream(file).close();
        return empty.emplace(mode, Measure(mode, file, 5).value()).first->second;
    }

    Options const &options;
    ScratchFolder scratch;
    std::map<std::string, Cost> empty;
    int fast = 0;
    int inherent = 0;
};

void List() {
    for (HostileKind const &kind : GetHostileKinds()) {
        std::printf("%s: %s\n", kind.name.c_str(), kind.shape.c_str());
        if (kind.inherent)
            std::printf("    may grow: %s\n", kind.inherent);
    }
}

} // namespace

int main(int argc, char **argv) {
    CLI::App app("Prints how fast the tool's time and memory grow with hostile files.",
                 "vesk_hdl_hostile");
    Options options;
    app.add_flag("--list", options.list, "List the kinds and do nothing else");
    app.add_option("--kind", options.kinds, "Only these kinds; a name may end in '*'")
        ->allow_extra_args(false);
    app.add_option("--mode", options.modes,
                   "What the tool does: run, check or json, which is check")
        ->check(CLI::IsMember({"run", "check", "json"}))
        ->allow_extra_args(false);
    app.add_option("--sizes", options.sizes, "Factor for the sizes of all kinds")
        ->check(CLI::PositiveNumber)
        ->capture_default_str();
    app.add_option("--runs", options.runs, "Runs for each point, of which the least counts")
        ->check(CLI::PositiveNumber)
        ->capture_default_str();
    app.add_option("--timeout", options.timeout, "CPU seconds after which a run is stopped")
        ->check(CLI::PositiveNumber)
        ->capture_default_str();
    app.add_option("--memory", options.memory, "Megabytes of addresses at which a run is stopped")
        ->check(CLI::PositiveNumber)
        ->capture_default_str();
    app.add_option("--limit", options.limit, "The exponent beyond which a kind is marked")
        ->capture_default_str();
    app.add_option("--tool", options.tool, "The vesk-hdl to measure, the last one that is given")
        ->check(CLI::ExistingFile)
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeLast);
    CLI11_PARSE(app, argc, argv);
    if (options.list) {
        List();
        return 0;
    }
    try {
        if (options.tool.empty())
            throw std::runtime_error("--tool is missing");
        options.tool = fs::absolute(options.tool).string();
        Measurement(options).Run();
    } catch (std::exception const &error) {
        std::fprintf(stderr, "vesk_hdl_hostile: %s\n", error.what());
        return 1;
    }
}
