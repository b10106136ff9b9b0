// The diagnostics of refused lines: the place of each lies in its line, and both forms can be
// shown.

#include <cerrno>
#include <sstream>

#include "fuzz/Fuzz.h"
#include "tool/diagnostics/Reporter.h"
#include "tool/session/Session.h"

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::istringstream lines(std::string(reinterpret_cast<char const *>(data), size));
    Session session("fuzz");
    struct NoFile : Vesk_Hdl::WriteOpener {
        int Open(char const *, bool) override {
            errno = ENOENT;
            return -1;
        }
    } noFile;
    session.GetModel().SetWriteOpener(&noFile);
    SourceRange place{"x"};
    for (std::string line; std::getline(lines, line);) {
        ++place.line;
        auto const diagnostic = session.RunLine(line, place);
        if (!diagnostic)
            continue;
        // A missing word is marked one column after the end, or after a blank there.
        FUZZ_EXPECT(diagnostic->place.column <= line.size() + 2, "%u", diagnostic->place.column);
        FUZZ_EXPECT(diagnostic->place.column > 0 || line.empty(), "no column");
        for (ReportStyle::Format const format : {ReportStyle::TEXT, ReportStyle::JSON}) {
            std::ostringstream shown;
            Reporter(shown, {format, false, false}).Report(*diagnostic);
            std::string const text = shown.str();
            FUZZ_EXPECT(text.ends_with('\n'), "no end of line");
            bool const oneLine = text.find('\n') + 1 == text.size();
            FUZZ_EXPECT(format == ReportStyle::TEXT || oneLine, "%s", text.c_str());
        }
    }
    return 0;
}
