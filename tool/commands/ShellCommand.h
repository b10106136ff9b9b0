#pragma once

#include "tool/commands/Common.h"

/// `shell`: an interactive session on one design.
void AddShellCommand(CLI::App &app, Action &action);
