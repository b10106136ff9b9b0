// Functions on plain character strings.

#include "vesk_hdl/text/basis/Functions.h"

#include <charconv>
#include <cstring>

#include "vesk_hdl/text/basis/Ascii.h"
#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/Printf.h"

namespace Basis {

namespace {

/// Matches from left to right. On a mismatch the latest star takes one character more; earlier
/// stars need no second try, since the latest one can take whatever they could leave. So the time
/// is at most the product of both lengths.
template <class Fold> bool Matches(char const *text, char const *pattern, Fold fold) {
    char const *star = nullptr;
    char const *retry = nullptr;
    while (*text) {
        if (*pattern == '*') {
            star = pattern++;
            retry = text;
        } else if (fold(*text) == fold(*pattern)) {
            ++text;
            ++pattern;
        } else if (star) {
            pattern = star + 1;
            text = ++retry;
        } else {
            return false;
        }
    }
    while (*pattern == '*')
        ++pattern;
    return *pattern == '\0';
}

} // namespace

bool strmatch(char const *text, char const *pattern) {
    return Matches(OrEmpty(text), OrEmpty(pattern), [](char c) { return c; });
}

bool strimatch(char const *text, char const *pattern) {
    return Matches(OrEmpty(text), OrEmpty(pattern), Ascii::ToUpper);
}

int stricmp(char const *a, char const *b) {
    return Ascii::EqualIgnoringCase(OrEmpty(a), OrEmpty(b)) ? 0 : 1;
}

/// Ends at the NUL of either text: beyond it there is nothing to compare.
int strnicmp(char const *a, char const *b, std::uint64_t count) {
    a = OrEmpty(a);
    b = OrEmpty(b);
    for (std::uint64_t i = 0; i < count; ++i) {
        if (Ascii::ToUpper(a[i]) != Ascii::ToUpper(b[i]))
            return 1;
        if (a[i] == '\0')
            break;
    }
    return 0;
}

bool strtol(char const *text, long &value) {
    text = OrEmpty(text);
    if (*text == '+' && Ascii::IsDigit(text[1])) // from_chars takes "-" but not "+"
        ++text;
    char const *const end = text + std::strlen(text);
    long number = 0;
    std::from_chars_result const result = std::from_chars(text, end, number);
    if (result.ec != std::errc() || result.ptr != end)
        return false;
    value = number;
    return true;
}

} // namespace Basis

char *orvform(char const *format, ...) {
    thread_local std::string buffer; // of the thread's own: several engines may run at once
    va_list arguments;
    va_start(arguments, format);
    buffer = Basis::Printf(format ? format : "", arguments);
    va_end(arguments);
    return buffer.data();
}
