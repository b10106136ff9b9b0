#pragma once

#include <string>

#include "vesk_hdl/text/basis/File.h"

namespace Vesk_Hdl {

/// The current line of a text file, which folds where it would pass 80 columns.
///
/// A line is some blanks and the text behind them. Each character is looked at once, when it comes:
/// the line remembers its last blank, its last comma and whether it holds a comment mark, so that
/// neither a comment of a megabyte nor a name of that size is ever read again.
class FoldingLine {
public:
    static constexpr std::size_t MAX_LENGTH = 80;
    static constexpr std::size_t FOLD_INDENT = 6;

    bool IsEmpty() const { return GetLength() == 0; }
    std::size_t GetLength() const { return blanks + text.size() - start; }

    /// Begins an empty line with blanks.
    void Indent(std::size_t count) { blanks = count; }

    void Append(std::string_view token);
    /// Whether the line is inside a comment and so does not fold: it holds "/" or "--" anywhere.
    bool IsComment() const { return comment; }
    /// Writes the line up to its last blank, else its last comma, else whole, and an end of line.
    /// The rest goes on behind `indentation` and six more blanks.
    void Fold(Basis::Stream &file, std::size_t indentation);
    /// Writes the line whole and leaves it empty.
    void Write(Basis::Stream &file);
    /// The same with an end of line; the line then begins with `indentation` and six blanks.
    void Break(Basis::Stream &file, std::size_t indentation);

private:
    static constexpr std::size_t NONE = static_cast<std::size_t>(-1);

    std::size_t blanks = 0;
    std::string text; ///< from `start` on; what stands before it has been written
    std::size_t start = 0;
    std::size_t lastBlank = NONE; ///< index in `text`, not before `start`
    std::size_t lastComma = NONE;
    bool comment = false;
};

} // namespace Vesk_Hdl
