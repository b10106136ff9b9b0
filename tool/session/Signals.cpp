// Ends the program on a signal without losing a file. The handlers call only what POSIX allows in a
// handler (signal-safety(7)), so that messages are made beforehand.

#include "tool/session/Signals.h"

#include <array>
#include <atomic>
#include <csignal>
#include <unistd.h>

#include "tool/session/UnfinishedFile.h"

namespace {

struct Ending {
    int number;
    char const *name;
    std::string message = {}; ///< complete before the handler is in place
};
std::array<Ending, 3> endings = {{{SIGINT, "SIGINT"}, {SIGTERM, "SIGTERM"}, {SIGHUP, "SIGHUP"}}};

// While there are holders a signal waits; the last holder ends the program for it.
std::atomic<int> holders = 0;
std::atomic<int> waiting = 0; ///< the signal that came while signals were held
std::atomic<bool> interrupted = false;
static_assert(std::atomic<int>::is_always_lock_free && std::atomic<bool>::is_always_lock_free);

/// Calls nothing but what a handler may call.
[[noreturn]] void End(int number) {
    UnfinishedFile::UndoInHandler();
    for (Ending const &ending : endings)
        if (ending.number == number) {
            [[maybe_unused]] ssize_t const written =
                ::write(STDERR_FILENO, ending.message.data(), ending.message.size());
        }
    ::_exit(128 + number);
}

void EndOrWait(int number) {
    if (holders == 0)
        End(number);
    waiting = number;
}

void Mark(int) { interrupted = true; }

void Install(std::function<std::string(char const *)> const &messageOf, bool marking) {
    for (Ending &ending : endings) {
        struct sigaction action = {};
        // nohup ignores SIGHUP, and a shell ignores SIGINT for what runs in the background.
        if (::sigaction(ending.number, nullptr, &action) != 0 || action.sa_handler == SIG_IGN)
            continue;
        ending.message = messageOf(ending.name);
        bool const marks = marking && ending.number == SIGINT;
        action = {};
        action.sa_handler = marks ? Mark : EndOrWait;
        action.sa_flags =
            marks ? 0 : SA_RESTART; // a call that waits ends, so that the mark is seen
        for (Ending const &other : endings)
            // One signal at a time: the handler must not undo a file twice.
            ::sigaddset(&action.sa_mask, other.number);
        ::sigaction(ending.number, &action, nullptr);
    }
}

} // namespace

namespace Signals {

void EndProgram(std::function<std::string(char const *)> const &messageOf) {
    Install(messageOf, false);
}
void MarkInterrupts(std::function<std::string(char const *)> const &messageOf) {
    Install(messageOf, true);
}
bool IsInterrupted() { return interrupted; }
void ClearInterrupt() { interrupted = false; }

Held::Held() { ++holders; }
Held::~Held() {
    --holders;
    // A signal that came meanwhile takes effect now.
    if (int const number = waiting.exchange(0))
        End(number);
}

} // namespace Signals
