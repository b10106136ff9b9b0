// Whole command files, with both languages written into memory. After each line the netlist is
// consistent. The same lines as arrays of tokens write the same text, and so does a file of them,
// up to the first refused line, which ends it.

#include <vector>

#include "fuzz/CommandLines.h"
#include "fuzz/Fuzz.h"
#include "tests/support/Consistency.h"
#include "tests/support/Dummies.h"
#include "tests/support/MemoryFile.h"

using namespace Vesk_Hdl;

namespace {

/// Runs lines and returns all that they gave: messages of refusals and written texts.
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
    struct Descriptor {
        int const number = MemoryFile().Open();
        ~Descriptor() { ::close(number); }
    } const file;
    std::string text;
    for (std::string const &line : lines)
        text += line + "\n";
    text += "WRITE VHDL -NOHEADER x\nWRITE VERILOG -NOHEADER x\n";
    FUZZ_EXPECT(::write(file.number, text.data(), text.size()) >= 0, "no file");
    Engine engine;
    Capture capture;
    std::string const name = "/proc/self/fd/" + std::to_string(file.number);
    engine.CreateAndAddModel("hdlNetlist", name.c_str());
    engine.GetModel("hdlNetlist")->SetWriteOpener(&capture);
    FUZZ_EXPECT(engine.ReadCommandFile("HDLNETLIST", name.c_str()), "not read");
    return capture.Take();
}

/// The plan of the dummy signals foresees what a write makes.
void ComparePlan(std::vector<std::string> const &lines) {
    CommandFactory factory;
    Model model(&factory);
    Capture capture;
    model.SetWriteOpener(&capture);
    Netlist &netlist = *model.GetNetlist();
    for (std::string const &line : lines) {
        try {
            model.Execute(line.c_str());
        } catch (Exception const &) {
        }
    }
    netlist.SortNetlist();
    Dummies const planned(netlist, DummyPlan(netlist));
    int const before = netlist.GetSignals().GetSize();
    netlist.CreateVhdlDummySignals();
    std::string const made = SignalsFrom(netlist, before);
    FUZZ_EXPECT(planned.MeetOthers() || planned.GetNames() == made, "\n%s\nis not\n%s",
                planned.GetNames().c_str(), made.c_str());
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::vector<std::string> const lines = CommandLines(data, size);
    std::string const byLine = Outcome(lines, [](Model &model, std::string const &line) {
        std::string fault;
        try {
            model.Execute(line.c_str());
        } catch (...) {
            fault = Inconsistency(*model.GetNetlist());
            FUZZ_EXPECT(fault.empty(), "%s, after %s", fault.c_str(), line.c_str());
            throw;
        }
        fault = Inconsistency(*model.GetNetlist());
        FUZZ_EXPECT(fault.empty(), "%s, after %s", fault.c_str(), line.c_str());
    });
    std::string const byTokens = Outcome(lines, [](Model &model, std::string const &line) {
        model.Execute(StringArray(line.c_str(), " ", true, "\"\"''"));
    });
    ComparePlan(lines);
    bool const timed = byLine.find("Copyright") != std::string::npos; // a header holds the time
    FUZZ_EXPECT(timed || byLine == byTokens, "\n%s\nis not\n%s", byLine.c_str(), byTokens.c_str());
    std::string byFile = byLine;
    try {
        byFile = OutcomeOfFile(lines);
    } catch (Exception const &) {
    }
    FUZZ_EXPECT(timed || byLine == byFile, "\n%s\nis not\n%s", byLine.c_str(), byFile.c_str());
    return 0;
}
