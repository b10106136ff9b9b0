// The checks of whole command files: they refuse the lines that a run refuses, with the same words,
// and after a line that would write the design is as after a write, so that later lines run alike
// and the written text is the same. Each finding has a place on a line.

#include <vector>

#include "fuzz/CommandLines.h"
#include "fuzz/Fuzz.h"
#include "tests/support/MemoryFile.h"
#include "tool/check/Checker.h"

using namespace Vesk_Hdl;

namespace {

/// What the design writes in both languages.
std::string TextsOf(Model &model) {
    Capture capture;
    model.SetWriteOpener(&capture);
    std::string texts;
    for (char const *const line : {"WRITE VHDL -NOHEADER x", "WRITE VERILOG -NOHEADER x"}) {
        try {
            model.Execute(line);
        } catch (Exception const &refusal) {
            texts += refusal.getDescription();
        }
        texts += capture.Take();
    }
    return texts;
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::vector<std::string> lines = CommandLines(data, size);
    lines.emplace_back("ADD SIGNAL afterTheLastWrite");
    Session run("hdlNetlist");
    Capture capture;
    run.GetModel().SetWriteOpener(&capture);
    Checks::Checker checker("hdlNetlist", Checks::NO_LANGUAGE);
    checker.BeginFile("/dev/null", "x");
    SourceRange place{"x"};
    for (std::string const &line : lines) {
        ++place.line;
        auto const ran = run.RunLine(line, place);
        auto const checked = checker.RunLine(line, place);
        std::string const expected = ran ? ran->message : "";
        std::string const found = checked ? checked->message : "";
        FUZZ_EXPECT(expected == found, "%s: %s, not %s", line.c_str(), found.c_str(),
                    expected.c_str());
        capture.Take();
    }
    checker.Finish([&](Diagnostic const &finding) {
        FUZZ_EXPECT(finding.place.line <= lines.size(), "%lu", finding.place.line);
        unsigned const column = finding.place.column;
        FUZZ_EXPECT(column == 0 || column <= lines[finding.place.line - 1].size(), "%u", column);
    });
    std::string const expected = TextsOf(run.GetModel());
    std::string const found = TextsOf(checker.GetModel());
    FUZZ_EXPECT(expected == found, "\n%s\nis not\n%s", found.c_str(), expected.c_str());
    return 0;
}
