#pragma once

#include <cstdarg>
#include <cstdio>
#include <string>

namespace Basis {

/// printf into a string of whatever length it takes. Names come in as arguments, never as format.
inline std::string Printf(char const *format, va_list arguments) {
    va_list again;
    va_copy(again, arguments);
    int const length = std::vsnprintf(nullptr, 0, format, again);
    va_end(again);
    if (length < 0)
        return format; // longer than an int can say: the bare format is better than nothing
    std::string text(static_cast<std::size_t>(length), '\0');
    std::vsnprintf(text.data(), text.size() + 1, format, arguments);
    return text;
}

} // namespace Basis
