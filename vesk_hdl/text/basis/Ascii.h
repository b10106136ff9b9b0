#pragma once

#include <string_view>

/// Character tests and comparisons that do not depend on the locale: a design has to read the same
/// on every machine. Bytes above 127 are no letters and are compared as they are.
namespace Basis::Ascii {

constexpr char ToUpper(char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c; }
constexpr char ToLower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c; }
constexpr bool IsDigit(char c) { return c >= '0' && c <= '9'; }
constexpr bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }

/// Compares the bytes first: most characters of equal names are equal with their case.
constexpr bool EqualIgnoringCase(std::string_view a, std::string_view b) {
    if (a.size() != b.size())
        return false;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (a[i] != b[i] && ToUpper(a[i]) != ToUpper(b[i]))
            return false;
    return true;
}

/// Below, equal to or above 0 as `a` comes before, is equal to or comes after `b`. Both have the
/// same length.
constexpr int CompareIgnoringCase(std::string_view a, std::string_view b) {
    for (std::size_t i = 0; i < a.size(); ++i)
        if (int const order = ToUpper(a[i]) - ToUpper(b[i]); order != 0)
            return order;
    return 0;
}

constexpr bool EndsWithIgnoringCase(std::string_view text, std::string_view end) {
    return text.size() >= end.size() &&
           EqualIgnoringCase(text.substr(text.size() - end.size()), end);
}

} // namespace Basis::Ascii
