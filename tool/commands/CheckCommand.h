#pragma once

#include "tool/commands/Common.h"

/// `check`: what of the written text will be illegal, wrong or suspicious, told without a write.
void AddCheckCommand(CLI::App &app, Action &action);
