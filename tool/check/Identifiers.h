#pragma once

#include <algorithm>
#include <string_view>

// What the two languages take for an identifier, reserved words aside.

namespace Checks {

inline bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }
inline bool IsDigit(char c) { return c >= '0' && c <= '9'; }

inline bool IsVhdlIdentifier(std::string_view name) {
    if (name.size() > 2 && name.front() == '\\' && name.back() == '\\')
        return name.substr(1, name.size() - 2).find('\\') == std::string_view::npos;
    if (name.empty() || !IsLetter(name.front()) || name.back() == '_' ||
        name.find("__") != std::string_view::npos)
        return false;
    return std::all_of(name.begin(), name.end(),
                       [](char c) { return IsLetter(c) || IsDigit(c) || c == '_'; });
}

inline bool IsVerilogIdentifier(std::string_view name) {
    if (name.size() > 2 && name.front() == '\\')
        return name.find(' ') == name.size() - 1;
    if (name.empty() || IsDigit(name.front()) || name.front() == '$')
        return false;
    return std::all_of(name.begin(), name.end(),
                       [](char c) { return IsLetter(c) || IsDigit(c) || c == '_' || c == '$'; });
}

} // namespace Checks
