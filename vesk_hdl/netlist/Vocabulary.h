#pragma once

#include <span>

#include "vesk_hdl/text/basis/Functions.h"

/// The fixed words of the command language and of attributes, each list once. All of them match in
/// any case. Where a list belongs to an enumeration, a word's index is its value.
namespace Vesk_Hdl::Vocabulary {

using Words = std::span<char const *const>;

/// By Attribute::ValueType; the first is the default.
inline constexpr char const *ATTRIBUTE_TYPES[] = {"String", "Integer",   "Float", "Boolean",
                                                  "Bit",    "BitVector", "User"};
/// Whether an attribute is written as a generic: not, for simulation only, for synthesis too.
inline constexpr char const *GENERIC_WORDS[] = {"NONE", "NOSYN", "SYN"};
/// Whether an attribute is written as an attribute: not, with its declaration, without it.
inline constexpr char const *SYNTHESIS_WORDS[] = {"NONE", "ASSIGN", "ASSIGNNODEC"};
/// By Polarity::Value. Any beginning of one is as good as the whole word.
inline constexpr char const *POLARITIES[] = {"Input", "Output", "BiDirectional"};
/// By the bool that they stand for.
inline constexpr char const *BOOLEANS[] = {"false", "true"};
/// By HdlOptions::VerilogOption::SynthesisType.
inline constexpr char const *SYNTHESIS_TOOLS[] = {"QRT",      "EXEMPLAR",    "SYNPLICITY",
                                                  "SYNOPSYS", "VERILOG2001", "PRECISION"};
/// By HdlOptions::VerilogOption::CaseType, counted from CASE_DEFAULT. "DEFSULT" is required.
inline constexpr char const *NAME_CASES[] = {"DEFSULT", "UPPERCASE", "LOWERCASE"};
/// Whose names UPPERCASE and LOWERCASE change. "siganl" is required of UPPERCASE, which refuses the
/// word of LOWERCASE, and the other way round.
inline constexpr char const *UPPERCASE_NAMES[] = {"instance", "siganl", "component"};
inline constexpr char const *LOWERCASE_NAMES[] = {"instance", "signal", "component"};

/// What a write command takes in front of its file. "-OVERWRITE" changes nothing.
enum WriteOption { WRITE_NOHEADER, WRITE_APPEND, WRITE_OVERWRITE };
inline constexpr char const *WRITE_OPTIONS[] = {"-NOHEADER", "-APPEND", "-OVERWRITE"};

/// Words behind a fixed beginning, which may be empty: "-TYPE=Integer", "QRT".
struct Choice {
    char const *prefix;
    Words words;
};
inline constexpr Choice TYPE = {"-TYPE=", ATTRIBUTE_TYPES};
inline constexpr Choice GENERIC = {"-GENERIC=", GENERIC_WORDS};
inline constexpr Choice SYNATTR = {"-SYNATTR=", SYNTHESIS_WORDS};

/// The index of a word, -1 if it is none of them. Null counts as the empty word.
inline int IndexOf(Words words, char const *word) {
    for (std::size_t i = 0; i < words.size(); ++i)
        if (Basis::stricmp(words[i], word) == 0)
            return static_cast<int>(i);
    return -1;
}

} // namespace Vesk_Hdl::Vocabulary
