#pragma once

#include "tool/commands/Common.h"

/// `check`: reports what of the written text will be illegal, wrong or suspicious, without a write.
void AddCheckCommand(CLI::App &app, Action &action);
