#pragma once

#include "tool/commands/Common.h"

/// `header`: a file with the vendor header alone.
void AddHeaderCommand(CLI::App &app, Action &action);
