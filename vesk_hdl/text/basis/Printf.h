#pragma once

#include <cstdarg>
#include <cstdio>
#include <string>

namespace Basis {

/// Formats as printf does, into a string of any length. Names are arguments and never the format:
/// they may hold a "%".
inline std::string Printf(char const *format, va_list arguments) {
    // A list of arguments can be walked once, and two walks are needed: one measures, one writes.
    va_list again;
    va_copy(again, arguments);
    int const length = std::vsnprintf(nullptr, 0, format, again);
    va_end(again);
    if (length < 0)
        return format; // the text has more than INT_MAX characters; vsnprintf cannot make it
    std::string text(static_cast<std::size_t>(length), '\0');
    std::vsnprintf(text.data(), text.size() + 1, format, arguments);
    return text;
}

} // namespace Basis
