#pragma once

#include <functional>
#include <string>

#include "tool/diagnostics/Reporter.h"

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

/// How the user wants to be told what is wrong.
struct ReportOptions {
    std::string format = "text";
    std::string colour = "auto";

    /// What they come to for standard error. Colour is for a terminal, unless NO_COLOR is set.
    ReportStyle GetStyle() const;
};

/// --diagnostics and --color.
void AddReportOptions(CLI::App &command, ReportOptions &options);
/// --model, with its default.
void AddModelOption(CLI::App &command, std::string &modelName);
/// --output-dir; empty for the current folder.
void AddOutputDirOption(CLI::App &command, std::string &folder);

/// Something about a file as a whole.
Diagnostic About(std::string const &file, std::string const &message);
