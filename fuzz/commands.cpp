// Whole command files, with both languages written into memory. After each line the netlist hangs
// together; the same lines, read token array by token array, write the same text, and so does a
// file of them, unless a line is refused, which ends it. The fuzzer's inputs are mutated line by
// line, with lines made from the grammar of the commands.

#include <algorithm>
#include <random>
#include <vector>

#include "fuzz/Fuzz.h"
#include "tests/support/Consistency.h"
#include "tests/support/MemoryFile.h"
#include "tests/support/RandomLines.h"

using namespace Vesk_Hdl;

extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t *data, std::size_t size, std::size_t most);

namespace {

constexpr std::size_t MOST_LINES = 400;

std::vector<std::string> LinesOf(std::string const &text) {
    std::vector<std::string> lines;
    for (std::size_t at = 0; at < text.size();) {
        std::size_t const end = std::min(text.find('\n', at), text.size());
        lines.push_back(text.substr(at, end - at));
        at = end + 1;
    }
    return lines;
}

/// Runs lines and tells all that came out of it: refusals and texts.
template <class Run> std::string Outcome(std::vector<std::string> lines, Run run) {
    CommandFactory factory;
    Model model(&factory);
    Capture capture;
    model.SetWriteOpener(&capture);
    lines.insert(lines.end(), {"WRITE VHDL -NOHEADER x", "WRITE VERILOG -NOHEADER x"});
    std::string outcome;
    for (std::string const &line : lines) {
        try {
            run(model, line);
        } catch (Exception const &refusal) {
            outcome += refusal.getDescription();
        }
        outcome += capture.Take();
    }
    return outcome;
}

/// The texts that one file of all these lines writes.
std::string OutcomeOfFile(std::vector<std::string> const &lines) {
    MemoryFile file;
    int const descriptor = file.Open();
    std::string text;
    for (std::string const &line : lines)
        text += line + "\n";
    text += "WRITE VHDL -NOHEADER x\nWRITE VERILOG -NOHEADER x\n";
    FUZZ_EXPECT(::write(descriptor, text.data(), text.size()) >= 0, "no file");
    Engine engine;
    Capture capture;
    std::string const name = "/proc/self/fd/" + std::to_string(descriptor);
    engine.CreateAndAddModel("hdlNetlist", name.c_str());
    engine.GetModel("hdlNetlist")->SetWriteOpener(&capture);
    FUZZ_EXPECT(engine.ReadCommandFile("HDLNETLIST", name.c_str()), "not read");
    ::close(descriptor);
    return capture.Take();
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::vector<std::string> lines = LinesOf(RandomLines::Preface());
    for (std::string const &line : LinesOf(std::string(reinterpret_cast<char const *>(data), size)))
        if (lines.size() < MOST_LINES)
            lines.push_back(line.substr(0, line.find('\0')));
    std::string const byLine = Outcome(lines, [](Model &model, std::string const &line) {
        std::string fault;
        try {
            model.Execute(line.c_str());
        } catch (...) {
            fault = Inconsistency(*model.GetNetlist());
            FUZZ_EXPECT(fault.empty(), "%s, behind %s", fault.c_str(), line.c_str());
            throw;
        }
        fault = Inconsistency(*model.GetNetlist());
        FUZZ_EXPECT(fault.empty(), "%s, behind %s", fault.c_str(), line.c_str());
    });
    std::string const byTokens = Outcome(lines, [](Model &model, std::string const &line) {
        model.Execute(StringArray(line.c_str(), " ", true, "\"\"''"));
    });
    bool const timed = byLine.find("Copyright") != std::string::npos; // a header tells the time
    FUZZ_EXPECT(timed || byLine == byTokens, "\n%s\nis not\n%s", byLine.c_str(), byTokens.c_str());
    std::string byFile = byLine;
    try {
        byFile = OutcomeOfFile(lines);
    } catch (Exception const &) {
    }
    FUZZ_EXPECT(timed || byLine == byFile, "\n%s\nis not\n%s", byLine.c_str(), byFile.c_str());
    return 0;
}

#ifdef VESK_HDL_FUZZER
extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t *data, std::size_t size,
                                               std::size_t most, unsigned int seed) {
    std::mt19937 random(seed);
    if (random() % 8 == 0)
        return LLVMFuzzerMutate(data, size, most);
    std::vector<std::string> lines =
        LinesOf(std::string(reinterpret_cast<char const *>(data), size));
    RandomLines source(random);
    for (unsigned change = 1 + random() % 4; change > 0; --change) {
        std::size_t const at = random() % (lines.size() + 1);
        auto const place = lines.begin() + static_cast<std::ptrdiff_t>(at);
        unsigned const kind = random() % 4;
        if (kind == 0 && at < lines.size())
            lines.erase(place);
        else if (kind == 1 && at < lines.size())
            std::swap(lines[at], lines[random() % lines.size()]);
        else
            lines.insert(place, source.Next());
    }
    std::string text;
    for (std::string const &line : lines)
        text += line + (line.ends_with('\n') ? "" : "\n");
    size = std::min(text.size(), most);
    std::copy_n(text.begin(), size, data);
    return size;
}
#endif
