#pragma once

#include "tool/commands/Common.h"

/// `run`: the lines of command files, on one design.
void AddRunCommand(CLI::App &app, Action &action);

/// What `run -` does.
int RunStandardInput(std::string const &modelName, std::string const &outputDir);
