#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

/// A compiled regular expression of plain characters, ".", bracket classes such as "[A-Za-z_]" and
/// "[^,]", a backslash in front of a character that stands for itself, each with "?", "*" or "+"
/// behind it. Matching takes one pass over the text, however long. Not copyable.
class VESK_HDL_API Basis_Regexp {
public:
    Basis_Regexp(char const *pattern);
    ~Basis_Regexp();
    Basis_Regexp(Basis_Regexp const &) = delete;
    Basis_Regexp &operator=(Basis_Regexp const &) = delete;

    /// The leftmost longest match of at least one character; (1, 0) if there is none.
    Basis_Range Match(std::string_view text) const;

private:
    struct Record;
    Record *record;
};
