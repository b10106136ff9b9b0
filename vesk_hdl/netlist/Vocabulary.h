#pragma once

#include <span>

#include "vesk_hdl/text/basis/Functions.h"

/// The fixed words of the command language and of attributes. Each list is here once: commands,
/// help, completion and diagnostics read it. All words match in any case. Where a list belongs to
/// an enumeration, the index of a word is the value of the enumerator. Odd spellings are part of
/// the interface.
namespace Vesk_Hdl::Vocabulary {

/// A list of words. It refers to an array of this header and is always valid.
using Words = std::span<char const *const>;

/// The types of attributes, by Attribute::ValueType; the first is the default.
inline constexpr char const *ATTRIBUTE_TYPES[] = {"String", "Integer",   "Float", "Boolean",
                                                  "Bit",    "BitVector", "User"};
/// The generic option of an attribute: it is no generic (a parameter in Verilog), one for
/// simulation only, or one for synthesis as well.
inline constexpr char const *GENERIC_WORDS[] = {"NONE", "NOSYN", "SYN"};
/// The synthesis option of an attribute: it is not written as an attribute statement, it is
/// declared and assigned, or it is assigned and the declaration comes from elsewhere.
inline constexpr char const *SYNTHESIS_WORDS[] = {"NONE", "ASSIGN", "ASSIGNNODEC"};
/// The directions, by Polarity::Value. Any beginning of a word matches.
inline constexpr char const *POLARITIES[] = {"Input", "Output", "BiDirectional"};
/// The flags, by the bool that they mean. Commands take any other word as true.
inline constexpr char const *BOOLEANS[] = {"false", "true"};
/// The tools in whose syntax Verilog attributes are written, by
/// HdlOptions::VerilogOption::SynthesisType.
inline constexpr char const *SYNTHESIS_TOOLS[] = {"QRT",      "EXEMPLAR",    "SYNPLICITY",
                                                  "SYNOPSYS", "VERILOG2001", "PRECISION"};
/// The cases of names, by HdlOptions::VerilogOption::CaseType counted from CASE_DEFAULT. The
/// spelling "DEFSULT" is required.
inline constexpr char const *NAME_CASES[] = {"DEFSULT", "UPPERCASE", "LOWERCASE"};
/// The kinds of names that UPPERCASE changes. The spelling "siganl" is required; UPPERCASE refuses
/// "signal".
inline constexpr char const *UPPERCASE_NAMES[] = {"instance", "siganl", "component"};
/// The kinds of names that LOWERCASE changes. It refuses "siganl".
inline constexpr char const *LOWERCASE_NAMES[] = {"instance", "signal", "component"};

/// The options of a write command, which come before its file.
enum WriteOption {
    WRITE_NOHEADER, ///< the file gets no header
    WRITE_APPEND,   ///< the text goes to the end of the file
    WRITE_OVERWRITE ///< changes nothing
};
/// The words of these options, by WriteOption.
inline constexpr char const *WRITE_OPTIONS[] = {"-NOHEADER", "-APPEND", "-OVERWRITE"};

/// Words that follow a fixed beginning, as in "-TYPE=Integer" or, with an empty one, "QRT".
struct Choice {
    char const *prefix; ///< never null
    Words words;        ///< what may follow the prefix
};
/// The type of a new attribute.
inline constexpr Choice TYPE = {"-TYPE=", ATTRIBUTE_TYPES};
/// The generic option of an attribute.
inline constexpr Choice GENERIC = {"-GENERIC=", GENERIC_WORDS};
/// The synthesis option of an attribute.
inline constexpr Choice SYNATTR = {"-SYNATTR=", SYNTHESIS_WORDS};

/// The index of a word in a list, in any case; -1 if it is none of them. Null counts as the empty
/// word.
inline int IndexOf(Words words, char const *word) {
    for (std::size_t i = 0; i < words.size(); ++i)
        if (Basis::stricmp(words[i], word) == 0)
            return static_cast<int>(i);
    return -1;
}

} // namespace Vesk_Hdl::Vocabulary
