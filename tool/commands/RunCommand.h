#pragma once

#include <string>
#include <vector>

#include "tool/diagnostics/Reporter.h"

/// What `vesk-hdl run` was asked for.
struct RunOptions {
    std::vector<std::string> files; ///< in order; "-" is standard input
    std::string modelName = "hdlNetlist";
    std::string outputDir; ///< empty for the current folder
    bool keepGoing = false;
    ReportStyle report;
};

/// Runs the lines of the files on one model. Tells each refused line, unreadable file and failed
/// write on standard error. The exit code: 0 if all went well, otherwise 1.
int Run(RunOptions const &options);
