#pragma once

#include "tool/commands/Common.h"

/// `run`: the lines of command files, on one design.
void AddRunCommand(CLI::App &app, Action &action);

/// What `run` and `shell` take alike.
struct SessionOptions {
    std::string modelName;
    std::string outputDir; ///< empty for the current folder
    LimitOptions limits;
    std::optional<std::time_t> headerTime; ///< in place of the present one
};

/// What `run -` does.
int RunStandardInput(SessionOptions const &given);
