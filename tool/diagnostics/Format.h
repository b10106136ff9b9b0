#pragma once

#include <string>

// Numbers with their units.

/// "512 B", "3.2 MB": bytes in units of 1000.
std::string Bytes(double bytes);
/// "0.42 s", "3 min 05 s".
std::string Seconds(double seconds);
