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

/// The hash of every table whose order is not visible. Its key is random and drawn once in a
/// process, so that a file of names that all collide cannot be made.
///
/// Texts that differ only in the low four bits of their last character get hashes that differ only
/// in the low four bits: numbered names, such as N10 to N19, are neighbours in a table and so in
/// the cache.
std::uint32_t SeededHash(std::string_view text);
/// The same for texts whose case does not count: equal but for the case of ASCII letters means an
/// equal hash.
std::uint32_t SeededHashIgnoringCase(std::string_view text);

// For unordered containers of the standard library whose keys are texts of a design. They look up a
// std::string_view without a copy of it.

/// Hashes exact texts.
struct TextHash {
    using is_transparent = void;
    std::size_t operator()(std::string_view text) const { return SeededHash(text); }
};
/// Hashes texts whose case does not count.
struct FoldedTextHash {
    using is_transparent = void;
    std::size_t operator()(std::string_view text) const { return SeededHashIgnoringCase(text); }
};
/// Compares texts whose case does not count.
struct FoldedTextEqual {
    using is_transparent = void;
    bool operator()(std::string_view a, std::string_view b) const {
        return Basis::Ascii::EqualIgnoringCase(a, b);
    }
};

/// A map whose keys are exact texts.
template <class Value>
using TextMap = std::unordered_map<std::string, Value, TextHash, std::equal_to<>>;
/// A set of exact texts.
using TextSet = std::unordered_set<std::string, TextHash, std::equal_to<>>;
/// A map in which keys that differ only in case are the same key.
template <class Value>
using FoldedTextMap = std::unordered_map<std::string, Value, FoldedTextHash, FoldedTextEqual>;

} // namespace Vesk_Hdl
