#pragma once

#include <functional>
#include <string>

// What SIGINT, SIGTERM and SIGHUP do to the tool. A signal that was ignored when the tool started,
// as under nohup, stays ignored.

namespace Signals {

/// From now on each of them ends the program at once: the unfinished file is undone, a message goes
/// to standard error, and the exit code is 128 plus the number of the signal. `messageOf` makes the
/// messages now; it is given the name of each signal.
void EndProgram(std::function<std::string(char const *signal)> const &messageOf);

/// As EndProgram, but SIGINT only sets a mark, which a long operation looks at.
void MarkInterrupts(std::function<std::string(char const *signal)> const &messageOf);
bool IsInterrupted();
void ClearInterrupt();

/// Signals wait while one of these lives. For short steps alone.
class Held {
public:
    Held();
    ~Held();
    Held(Held const &) = delete;
    Held &operator=(Held const &) = delete;
};

} // namespace Signals
