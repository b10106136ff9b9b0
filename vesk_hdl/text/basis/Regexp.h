#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

/// A compiled regular expression. It knows single characters, "." for any character, bracket
/// classes such as "[A-Za-z_]" and "[^,]", and a backslash that makes the next character ordinary.
/// Each of these may be followed by "?", "*" or "+". There are no groups and no alternatives.
///
/// Matching takes one pass over the text, with time in proportion to its length, whatever the
/// pattern. An object that is not changed may be used by several threads.
class VESK_HDL_API Basis_Regexp {
public:
    /// Compiles a pattern. Null counts as the empty pattern, which matches nothing. Every text is a
    /// legal pattern: a bracket that is not closed ends at the end of the text.
    Basis_Regexp(char const *pattern);
    /// Frees the compiled pattern.
    ~Basis_Regexp();
    Basis_Regexp(Basis_Regexp const &) = delete;
    Basis_Regexp &operator=(Basis_Regexp const &) = delete;

    /// The leftmost match of at least one character, and of these the longest, as a range of
    /// indices; (1, 0) if there is none. A match of the whole text has `first` 0 and `last` equal
    /// to the length less one.
    Basis_Range Match(std::string_view text) const;

private:
    struct Record;
    Record *record;
};
