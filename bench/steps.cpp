// What single steps cost. Compare figures of one run with each other, not with those of another
// machine or another hour.

#include <memory>
#include <optional>
#include <sstream>
#include <vector>

#include <benchmark/benchmark.h>

#include "bench/kinds.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace {

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;
using Lines = std::vector<std::string>;

char const NOWHERE[] = "/dev/null";

/// A model of its own engine.
class Design {
public:
    explicit Design(Lines const &lines = {}) {
        engine.CreateAndAddModel("bench", nullptr);
        engine.UseModel("bench");
        Run(lines);
    }
    void Run(Lines const &lines) {
        for (std::string const &line : lines)
            engine.Execute(line.c_str());
    }
    Netlist *GetNetlist() { return engine.GetCurrentModel()->GetNetlist(); }
    HdlOptions *GetOptions() { return engine.GetCurrentModel()->GetOptions(); }

private:
    Engine engine;
};

Lines LinesOf(char const *kind, long n) {
    std::stringstream text;
    WriteDesign(text, *FindKind(kind), n, "", "");
    Lines lines;
    for (std::string line; std::getline(text, line);)
        lines.push_back(line);
    return lines;
}

/// A design's lines of one keyword, and what has to run before them.
struct Timed {
    Lines before;
    Lines lines;
};

Timed TimedLines(Lines const &all, std::string_view keyword) {
    Timed timed;
    for (std::string_view const step : {"SET NETLIST", "ADD COMPONENT", "ADD PIN", "ADD PORT",
                                        "ADD SIGNAL", "ADD INSTANCE", "CONNECT SIGNAL"}) {
        Lines &target = step == keyword ? timed.lines : timed.before;
        for (std::string const &line : all)
            if (line.starts_with(step))
                target.push_back(line);
        if (step == keyword)
            break;
    }
    return timed;
}

/// Times one act on a fresh design in every round; `items` is what the act works through.
template <class Act>
void OnFreshDesign(benchmark::State &state, Lines const &lines, std::size_t items, Act act) {
    for (auto _ : state) {
        state.PauseTiming();
        std::optional<Design> design(lines);
        state.ResumeTiming();
        act(*design);
        state.PauseTiming();
        design.reset();
        state.ResumeTiming();
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(items));
}

// Lines

void Tokenize(benchmark::State &state, char const *line) {
    for (auto _ : state)
        benchmark::DoNotOptimize(StringArray(line, " ", true, "\"\"''"));
}
BENCHMARK_CAPTURE(Tokenize, plain, "CONNECT SIGNAL n123456 u123456.I0");
BENCHMARK_CAPTURE(Tokenize, quoted, "CONNECT SIGNAL 'n123456' \"u123456.I0\"");

void FindKeyword(benchmark::State &state, char const *line) {
    CommandFactory const factory;
    StringArray const tokens(line, " ", true, "\"\"''");
    for (auto _ : state)
        benchmark::DoNotOptimize(factory.GetCommandCreator(tokens));
}
BENCHMARK_CAPTURE(FindKeyword, short, "ADD PIN u1 p1 in");
BENCHMARK_CAPTURE(FindKeyword, long, "ADD INSTANCE PIN ATTRIBUTE u1.p1 INIT 1 String");
BENCHMARK_CAPTURE(FindKeyword, unknown, "NO SUCH COMMAND");

void RunLines(benchmark::State &state, char const *kind, char const *keyword) {
    Timed const timed = TimedLines(LinesOf(kind, 10000), keyword);
    OnFreshDesign(state, timed.before, timed.lines.size(),
                  [&timed](Design &design) { design.Run(timed.lines); });
}
BENCHMARK_CAPTURE(RunLines, chain_signals, "chain", "ADD SIGNAL");
BENCHMARK_CAPTURE(RunLines, chain_instances, "chain", "ADD INSTANCE");
BENCHMARK_CAPTURE(RunLines, chain_connect, "chain", "CONNECT SIGNAL");
BENCHMARK_CAPTURE(RunLines, net_connect, "net", "CONNECT SIGNAL");
BENCHMARK_CAPTURE(RunLines, bus_connect, "bus", "CONNECT SIGNAL");
BENCHMARK_CAPTURE(RunLines, compound_connect, "compound", "CONNECT SIGNAL");
BENCHMARK_CAPTURE(RunLines, pins_add, "pins", "ADD PIN");

// Names

void ParseBusName(benchmark::State &state, char const *text) {
    Text const name(text);
    Text base;
    int left = 0;
    int right = 0;
    for (auto _ : state)
        benchmark::DoNotOptimize(Bus::ParseBusName(name, base, left, right));
}
BENCHMARK_CAPTURE(ParseBusName, bus, "data_bus(31:0)");
BENCHMARK_CAPTURE(ParseBusName, scalar, "data_bus");

void Width(benchmark::State &state, char const *name) {
    Bus const bus(name);
    for (auto _ : state)
        benchmark::DoNotOptimize(bus.GetWidth());
}
BENCHMARK_CAPTURE(Width, two_bits, "D(1:0)");
BENCHMARK_CAPTURE(Width, two_billion_bits, "D(2147483646:0)");

// The netlist

void SortSignals(benchmark::State &state) {
    constexpr long COUNT = 100000;
    constexpr long STRIDE = 38197; // no common factor: each number once, in no order
    Lines lines;
    for (long i = 0; i < COUNT; ++i)
        lines.push_back("ADD SIGNAL net" + std::to_string(i * STRIDE % COUNT));
    OnFreshDesign(state, lines, COUNT, [](Design &design) { design.GetNetlist()->SortNetlist(); });
}
BENCHMARK(SortSignals)->Unit(benchmark::kMillisecond);

void Prepare(benchmark::State &state, char const *kind, void (Netlist::*pass)()) {
    constexpr long COUNT = 10000;
    OnFreshDesign(state, LinesOf(kind, COUNT), COUNT,
                  [pass](Design &design) { (design.GetNetlist()->*pass)(); });
}
BENCHMARK_CAPTURE(Prepare, sort_instances, "chain", &Netlist::SortNetlist);
BENCHMARK_CAPTURE(Prepare, dummies_none, "chain", &Netlist::CreateVhdlDummySignals);
BENCHMARK_CAPTURE(Prepare, dummies_all, "ports", &Netlist::CreateVhdlDummySignals);

// Writing

/// A netlist that was written before: sorting it again is a small part.
template <class MakeStream>
void WriteVhdl(benchmark::State &state, char const *kind, MakeStream makeStream) {
    constexpr long COUNT = 10000;
    Design design(LinesOf(kind, COUNT));
    for (auto _ : state) {
        auto const stream = makeStream();
        VhdlNetlister(*stream).WriteNetlist(design.GetNetlist(), design.GetOptions());
    }
    state.SetItemsProcessed(state.iterations() * COUNT);
}
auto const toMemory = [] { return std::make_unique<TextMemOutStream>(); };
auto const toFile = [] { return std::make_unique<TextFileOutStream>(NOWHERE, false); };
BENCHMARK_CAPTURE(WriteVhdl, chain_to_memory, "chain", toMemory);
BENCHMARK_CAPTURE(WriteVhdl, chain_to_file, "chain", toFile);
BENCHMARK_CAPTURE(WriteVhdl, bus_to_file, "bus", toFile);
BENCHMARK_CAPTURE(WriteVhdl, compound_to_file, "compound", toFile);

/// The folding stream alone: a line of a thousand pieces, again and again.
void Fold(benchmark::State &state, char const *lineBegin, char const *piece) {
    constexpr int PIECES = 1000;
    TextFileOutStream stream(NOWHERE, false);
    for (auto _ : state) {
        stream << lineBegin;
        for (int i = 0; i < PIECES; ++i)
            stream << piece;
        stream << OutStream::NEW_LINE;
    }
    state.SetItemsProcessed(state.iterations() * PIECES);
}
BENCHMARK_CAPTURE(Fold, at_blanks, "port map (", "I0=>n123456, ");
BENCHMARK_CAPTURE(Fold, nowhere, "", "I0=>n123456");
BENCHMARK_CAPTURE(Fold, comment, "-- ", "I0=>n123456, ");

} // namespace
