// Engines on threads of their own share nothing: a program to run under the thread sanitizer.

#include <random>
#include <thread>

#include <gtest/gtest.h>

#include "tests/support/MemoryFile.h"
#include "tests/support/RandomLines.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

constexpr unsigned THREADS = 8;
constexpr int LINES = 300;

/// What a design writes, with the messages of refused lines.
std::string Outcome(unsigned seed) {
    std::mt19937 random(seed);
    RandomLines source(random);
    Engine engine;
    engine.CreateAndAddModel("top", nullptr);
    engine.UseModel("top");
    Capture capture;
    engine.GetCurrentModel()->SetWriteOpener(&capture);
    std::string lines = RandomLines::Preface();
    for (int i = 0; i < LINES; ++i)
        if (std::string const line = source.Next(); line.rfind("WRITE", 0) != 0)
            lines += line;
    lines += "WRITE VHDL -NOHEADER x\nWRITE VERILOG -NOHEADER x\n";
    std::string outcome;
    for (std::size_t at = 0; at < lines.size(); at = lines.find('\n', at) + 1) {
        try {
            engine.Execute(lines.substr(at, lines.find('\n', at) - at).c_str());
        } catch (Exception const &refusal) {
            outcome += refusal.getDescription();
        }
    }
    return outcome + capture.Take();
}

TEST(Threads, EachHasItsEngine) {
    std::vector<std::string> outcomes(THREADS);
    std::vector<std::thread> threads;
    for (unsigned i = 0; i < THREADS; ++i)
        threads.emplace_back([&outcomes, i] { outcomes[i] = Outcome(i / 2); });
    for (std::thread &thread : threads)
        thread.join();
    for (unsigned i = 0; i < THREADS; ++i)
        EXPECT_EQ(outcomes[i], Outcome(i / 2)) << "thread " << i;
}

} // namespace
