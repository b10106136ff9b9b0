#pragma once

#include <string_view>

namespace Basis {

// Null counts as the empty text in all interfaces of the library. These two functions say so at the
// border, so that nothing inside has to test for null.

/// The text, or an empty one in place of null.
constexpr char const *OrEmpty(char const *text) { return text ? text : ""; }
/// The same as a view of the characters before the NUL.
constexpr std::string_view ViewOf(char const *text) { return OrEmpty(text); }

} // namespace Basis
