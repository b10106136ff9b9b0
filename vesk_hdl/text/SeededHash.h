#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>

#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

/// The hash of every table whose order nobody sees. Its key is random and drawn once per process,
/// so that no file can hold names that were made to collide.
///
/// Texts that differ in the low four bits of their last character alone get hashes that differ in
/// the low four bits alone: names that are counted through lie side by side in a table.
std::uint32_t SeededHash(std::string_view text);
/// The same for texts that are equal if they differ only in the case of ASCII letters.
std::uint32_t SeededHashIgnoringCase(std::string_view text);

/// For unordered containers of the standard library that are keyed by texts of a design. They take
/// a std::string_view to look a text up.
struct TextHash {
    using is_transparent = void;
    std::size_t operator()(std::string_view text) const { return SeededHash(text); }
};
struct FoldedTextHash {
    using is_transparent = void;
    std::size_t operator()(std::string_view text) const { return SeededHashIgnoringCase(text); }
};
struct FoldedTextEqual {
    using is_transparent = void;
    bool operator()(std::string_view a, std::string_view b) const {
        return Basis::Ascii::EqualIgnoringCase(a, b);
    }
};

template <class Value>
using TextMap = std::unordered_map<std::string, Value, TextHash, std::equal_to<>>;
using TextSet = std::unordered_set<std::string, TextHash, std::equal_to<>>;
/// Keys that differ only in case are the same key.
template <class Value>
using FoldedTextMap = std::unordered_map<std::string, Value, FoldedTextHash, FoldedTextEqual>;

} // namespace Vesk_Hdl
