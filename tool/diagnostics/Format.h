#pragma once

#include <string>
#include <string_view>

// Numbers and names for people.

/// "512 B", "3.2 MB": bytes in units of 1000.
std::string Bytes(double bytes);
/// "0.42 s", "3 min 05 s".
std::string Seconds(double seconds);
/// Text of a file as a terminal may see it: nothing in it moves the cursor.
std::string Harmless(std::string_view text);
