#include "tool/diagnostics/Format.h"

#include <array>
#include <cstdio>

namespace {

/// The decimal point is that of the C locale: the tool sets no other one for numbers.
template <class... Numbers> std::string Print(char const *format, Numbers... numbers) {
    std::array<char, 64> text = {};
    std::snprintf(text.data(), text.size(), format, numbers...);
    return text.data();
}

} // namespace

std::string Bytes(double bytes) {
    constexpr std::array<char const *, 5> UNITS = {"B", "kB", "MB", "GB", "TB"};
    std::size_t unit = 0;
    for (; bytes >= 1000 && unit + 1 < UNITS.size(); ++unit)
        bytes /= 1000;
    return Print(unit == 0 ? "%.0f %s" : "%.1f %s", bytes, UNITS[unit]);
}

std::string Seconds(double seconds) {
    if (seconds < 60)
        return Print(seconds < 10 ? "%.2f s" : "%.0f s", seconds);
    auto const whole = static_cast<long long>(seconds);
    return Print("%lld min %02lld s", whole / 60, whole % 60);
}
