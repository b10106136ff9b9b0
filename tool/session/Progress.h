#pragma once

#include <chrono>
#include <string>

/// A bar on standard error that shows how far the reading of lines is. It appears only when the
/// work lasts, and asks for the time only once in many lines.
class Progress {
public:
    enum When { AUTO, ALWAYS, NEVER };

    /// `AUTO` shows a bar on a terminal alone. The total is in bytes, 0 if it is not known.
    Progress(When when, unsigned long long totalBytes);
    ~Progress() { Clear(); }
    Progress(Progress const &) = delete;
    Progress &operator=(Progress const &) = delete;

    /// A line of that many bytes was read.
    void CountLine(std::size_t bytes) {
        ++lines;
        doneBytes += bytes;
        if (shown && (lines % LINES_A_LOOK) == 0)
            Look();
    }
    /// A file is being written.
    void ShowWrite(char const *fileName);
    /// Takes the bar off the screen, so that a message can be printed.
    void Clear();

    /// What a message begins with that takes the bar off by itself.
    char const *GetEraser() const { return shown ? ERASER : ""; }

    unsigned long long GetLines() const { return lines; }
    double GetSeconds() const;

private:
    using Clock = std::chrono::steady_clock;
    static constexpr unsigned LINES_A_LOOK = 1024;
    static constexpr char ERASER[] = "\r\033[K";

    void Look();
    void Draw();
    void Put(std::string const &text);

    bool shown;
    bool visible = false;
    unsigned long long total;
    unsigned long long doneBytes = 0;
    unsigned long long lines = 0;
    Clock::time_point const start = Clock::now();
    Clock::time_point nextDraw;
};
