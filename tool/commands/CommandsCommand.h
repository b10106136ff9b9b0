#pragma once

#include <iosfwd>
#include <string>
#include <vector>

#include "tool/commands/Common.h"

/// `commands`: the reference of the command language.
void AddCommandsCommand(CLI::App &app, Action &action);

/// Prints the commands whose keyword holds all the words, in any case; a line each without words.
/// False if there are none.
bool PrintCommands(std::ostream &stream, std::vector<std::string> const &words);
