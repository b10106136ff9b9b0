#pragma once

#include <ctime>
#include <functional>
#include <optional>
#include <string>

#include "tool/diagnostics/Reporter.h"
#include "tool/session/Limits.h"

namespace CLI {
class App;
}

/// What the command of a command line does; its result is the exit code.
using Action = std::function<int()>;

constexpr int ALL_WELL = 0;
constexpr int SOMETHING_REFUSED = 1;
constexpr int USAGE_ERROR = 2;

/// Names standard input or output among files.
constexpr char STANDARD_STREAM[] = "-";

/// How messages are shown to the user.
struct ReportOptions {
    std::string format = "text";
    std::string colour = "auto";

    /// What they come to for standard error. Colour is for a terminal, unless NO_COLOR is set.
    ReportStyle GetStyle() const;
};

/// What a run may take, in bytes; 0 for as much as there is.
struct LimitOptions {
    unsigned long long memory = 0;
    unsigned long long output = 0;
};

/// --diagnostics and --color.
void AddReportOptions(CLI::App &command, ReportOptions &options);
/// --model, with its default.
void AddModelOption(CLI::App &command, std::string &modelName);
/// --output-dir; empty for the current folder.
void AddOutputDirOption(CLI::App &command, std::string &folder);

/// --max-memory and --max-output.
void AddLimitOptions(CLI::App &command, LimitOptions &options);

/// The time that SOURCE_DATE_EPOCH gives the headers of written files, if it is set. Throws
/// CLI::ValidationError if it is no such time.
std::optional<std::time_t> HeaderTime();

/// What SIGINT, SIGTERM or SIGHUP say when they end the program, as a message of that style.
/// `eraser` comes first, `consequence` says what became of the files.
std::function<std::string(char const *)> EndMessages(ReportStyle style, char const *eraser,
                                                     char const *consequence);

/// The memory did not do, at a place of a command file. The limit must be lifted by now.
Diagnostic OutOfMemory(SourceRange const &place, MemoryLimit const &limit);

/// Something about a file as a whole.
Diagnostic About(std::string const &file, std::string const &message);
