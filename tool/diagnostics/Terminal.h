#pragma once

#include <string>
#include <string_view>

/// Text of a file as a terminal may show it: nothing in it moves the cursor. A tab becomes a blank,
/// any other control character a question mark.
std::string SanitizeForTerminal(std::string_view text);
