#pragma once

#include <memory>

#include "vesk_hdl/text/basis/File.h"

namespace Vesk_Hdl {

/// The current line of a text file, which folds where it would pass 80 columns.
///
/// A line is some blanks and the text behind them. Most lines end before that column, so that
/// nothing is known of a text until it matters: only then is it searched for comment marks, for its
/// last blank, else its last comma, and no part of it twice. Neither a comment of a megabyte nor a
/// name of that size is ever read again.
class FoldingLine {
public:
    static constexpr std::size_t MAX_LENGTH = 80;
    static constexpr std::size_t FOLD_INDENT = 6;

    bool IsEmpty() const { return GetLength() == 0; }
    std::size_t GetLength() const { return blanks + size - start; }

    /// Begins an empty line with blanks.
    void Indent(std::size_t count) {
        blanks = count;
        FindLimit();
    }

    /// The short way of Append and FoldIfTooLong, for a text without an end of line that neither
    /// begins nor folds the line. Does nothing and gives false with any other.
    bool AppendShort(char const *token) {
        std::size_t const end = CopyUpTo(limit, token);
        if (*token != '\0')
            return false;
        size = end;
        return true;
    }

    /// Appends a text up to its first end of line, if it has one, and tells where it stopped.
    char const *Append(char const *token) {
        pieceBegin = size;
        for (;;) {
            size = CopyUpTo(capacity, token);
            if (size < capacity)
                return token;
            Grow();
        }
    }
    /// Folds in front of what was appended last if that leads too far, unless the line is inside a
    /// comment there: holds "/" or "--" anywhere.
    void FoldIfTooLong(Basis::Stream &file, std::size_t indentation) {
        if (GetLength() > MAX_LENGTH && size > pieceBegin && !IsComment())
            Fold(file, indentation);
    }
    /// Writes the line whole, with an end of line, and leaves it empty.
    void End(Basis::Stream &file);
    /// Writes it with an end of line; the line then begins with `indentation` and six blanks.
    void Break(Basis::Stream &file, std::size_t indentation);

private:
    static bool IsEnd(char c) {
        return static_cast<unsigned char>(c) <= '\n' && (c == '\n' || c == '\0');
    }
    /// Copies behind the text what is no end of line, and tells up to where.
    std::size_t CopyUpTo(std::size_t most, char const *&token) const {
        if (most <= size)
            return size;
        char *const to = text.get() + size;
        std::size_t const room = most - size;
        std::size_t count = 0;
        for (; count < room && !IsEnd(token[count]); ++count)
            to[count] = token[count];
        token += count;
        return size + count;
    }
    void FindLimit();
    void Grow();
    bool IsComment();
    void Fold(Basis::Stream &file, std::size_t indentation);
    void DropWritten();
    std::size_t FindLast(char c, std::size_t from) const;

    static constexpr std::size_t NONE = static_cast<std::size_t>(-1);
    static constexpr std::size_t MARGIN = 32; ///< blanks in front of every text

    std::size_t blanks = 0;
    std::unique_ptr<char[]> text; ///< from `start` to `size`; what stands before has been written
    std::size_t capacity = 0;
    std::size_t size = MARGIN;
    std::size_t limit = 0; ///< up to where AppendShort can go; 0 while the line has not begun
    std::size_t start = MARGIN;
    std::size_t pieceBegin = MARGIN;   ///< where the piece that Append was told last begins
    std::size_t searched = MARGIN;     ///< no comment mark ends in front of it, unless `comment`
    std::size_t withoutBlank = MARGIN; ///< no blank stands between `start` and here
    bool comment = false;
};

} // namespace Vesk_Hdl
