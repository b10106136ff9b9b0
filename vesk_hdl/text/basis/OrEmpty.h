#pragma once

#include <string_view>

namespace Basis {

/// Null counts as the empty text.
constexpr char const *OrEmpty(char const *text) { return text ? text : ""; }
constexpr std::string_view ViewOf(char const *text) { return OrEmpty(text); }

} // namespace Basis
