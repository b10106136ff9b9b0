#include "tool/session/Progress.h"

#include <algorithm>
#include <cstdio>
#include <sys/ioctl.h>
#include <unistd.h>

#include "tool/diagnostics/Format.h"
#include "tool/diagnostics/Terminal.h"

using namespace std::chrono_literals;

namespace {

constexpr auto PATIENCE = 700ms; ///< before the first bar
constexpr auto PAUSE = 100ms;    ///< between two bars
constexpr int BAR = 24;          ///< columns
constexpr int NARROWEST = 20;

int ColumnsOfTerminal() {
    winsize size = {};
    bool const known = ::ioctl(STDERR_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col >= NARROWEST;
    return known ? size.ws_col : 80;
}

} // namespace

Progress::Progress(When when, unsigned long long totalBytes)
    : shown(when == ALWAYS || (when == AUTO && ::isatty(STDERR_FILENO) == 1)), total(totalBytes),
      nextDraw(when == ALWAYS ? start : start + PATIENCE) {}

double Progress::GetSeconds() const {
    return std::chrono::duration<double>(Clock::now() - start).count();
}

void Progress::Look() {
    Clock::time_point const now = Clock::now();
    if (now < nextDraw)
        return;
    // Drawing costs a system call and, over a slow line, much more.
    nextDraw = now + PAUSE;
    Draw();
}

void Progress::Draw() {
    double const seconds = std::max(GetSeconds(), 1e-3);
    double const rate = static_cast<double>(doneBytes) / seconds;
    std::string text;
    if (total > 0) {
        // A file may grow while it is read, so that more than its size comes.
        double const part =
            std::min(static_cast<double>(doneBytes) / static_cast<double>(total), 1.0);
        auto const full = static_cast<std::size_t>(part * BAR);
        text = "[" + std::string(full, '#') + std::string(BAR - full, '.') + "] " +
               std::to_string(static_cast<int>(part * 100)) + " %  ";
    }
    text += Bytes(static_cast<double>(doneBytes)) + "  " + std::to_string(lines) + " lines  " +
            Bytes(rate) + "/s";
    // Lines cost about the same throughout a file: the bytes that are left are a fair measure of
    // the time.
    if (total > doneBytes && rate > 0)
        text += "  " + Seconds(static_cast<double>(total - doneBytes) / rate) + " left";
    Put(text);
}

void Progress::ShowWrite(char const *fileName) {
    if (shown && Clock::now() >= nextDraw)
        Put("writing " + SanitizeForTerminal(fileName));
}

void Progress::Put(std::string const &text) {
    // The last column stays free: some terminals go on to the next line after a letter in it, and
    // the eraser would then clear the wrong line.
    std::size_t const room = static_cast<std::size_t>(ColumnsOfTerminal()) - 1;
    std::fprintf(stderr, "%s%s", ERASER, text.substr(0, room).c_str());
    std::fflush(stderr);
    visible = true;
}

void Progress::Clear() {
    if (!visible)
        return;
    std::fputs(ERASER, stderr);
    std::fflush(stderr);
    visible = false;
}
