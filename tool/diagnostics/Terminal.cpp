#include "tool/diagnostics/Terminal.h"

/// A command file or a file name may hold escape sequences that rewrite the screen or, in some
/// terminals, type commands.
std::string SanitizeForTerminal(std::string_view text) {
    std::string shown(text);
    bool afterC2 = false; // where U+0080 to U+009F, controls too, begin in UTF-8
    for (char &c : shown) {
        auto const byte = static_cast<unsigned char>(c);
        if (byte < ' ' || byte == 0x7F || (afterC2 && byte >= 0x80 && byte < 0xA0))
            c = c == '\t' ? ' ' : '?';
        afterC2 = byte == 0xC2;
    }
    return shown;
}
