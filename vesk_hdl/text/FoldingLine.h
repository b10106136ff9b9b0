#pragma once

#include <memory>

#include "vesk_hdl/text/basis/File.h"

namespace Vesk_Hdl {

/// The current line of a text file, which is folded where it would become longer than 80 columns.
///
/// A line is some blanks and a text after them. Most lines end before that column. So the text is
/// searched only when the line becomes too long: for comment marks, for its last blank, else for
/// its last comma. No part of it is searched twice for the same thing, so that a comment or a name
/// of a megabyte costs one pass.
class FoldingLine {
public:
    static constexpr std::size_t MAX_LENGTH = 80;
    static constexpr std::size_t FOLD_INDENT = 6;

    bool IsEmpty() const { return GetLength() == 0; }
    std::size_t GetLength() const { return blanks + size - start; }

    /// Gives an empty line its blanks.
    void Indent(std::size_t count) {
        blanks = count;
        FindLimit();
    }

    /// Append and FoldIfTooLong for the common case: a text without an end of line that neither
    /// begins the line nor folds it. With any other text it does nothing and returns false.
    bool AppendShort(char const *token) {
        std::size_t const end = CopyUpTo(limit, token);
        if (*token != '\0')
            return false; // what was copied is after `size` and is overwritten
        size = end;
        return true;
    }

    /// Appends a text up to its first end of line, if it has one, and returns where it stopped.
    char const *Append(char const *token) {
        pieceBegin = size;
        for (;;) {
            size = CopyUpTo(capacity, token);
            if (size < capacity)
                return token;
            Grow();
        }
    }
    /// Folds before what was appended last if that makes the line too long, unless the line may be
    /// a comment: it holds "/" or "--" anywhere before that.
    void FoldIfTooLong(Basis::Stream &file, std::size_t indentation) {
        if (GetLength() > MAX_LENGTH && size > pieceBegin && !IsComment())
            Fold(file, indentation);
    }
    /// Writes the whole line with an end of line and leaves it empty.
    void End(Basis::Stream &file);
    /// Writes the line with an end of line. The next one begins with `indentation` and six blanks.
    void Break(Basis::Stream &file, std::size_t indentation);

private:
    static bool IsEnd(char c) {
        return static_cast<unsigned char>(c) <= '\n' && (c == '\n' || c == '\0');
    }
    /// Copies characters up to the end of the token, to its first end of line or to the place
    /// `most`, and returns the place after the last copied one. The size of the text does not
    /// change.
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
    /// Blanks before every text in its memory: a line with that many or fewer is written in one
    /// piece.
    static constexpr std::size_t MARGIN = 32;

    std::size_t blanks = 0;
    std::unique_ptr<char[]> text; ///< from `start` to `size`; what is before has been written
    std::size_t capacity = 0;
    std::size_t size = MARGIN;
    std::size_t limit = 0; ///< the end of what AppendShort may fill; 0 while the line has not begun
    std::size_t start = MARGIN;
    std::size_t pieceBegin = MARGIN;   ///< where the piece of the last Append begins
    std::size_t searched = MARGIN;     ///< no comment mark ends before this place, unless `comment`
    std::size_t withoutBlank = MARGIN; ///< there is no blank between `start` and this place
    bool comment = false;
};

} // namespace Vesk_Hdl
