// Folds the lines of text files. Where a line may break, and that a fold is decided for each piece,
// is part of the required text: see docs/architecture.md, "The road of a write".

#include "vesk_hdl/text/FoldingLine.h"

#include <algorithm>

namespace Vesk_Hdl {

namespace {

void WriteBlanks(Basis::Stream &file, std::size_t count) {
    static constexpr std::string_view BLANKS = "                                                ";
    for (; count > BLANKS.size(); count -= BLANKS.size())
        file.Write(BLANKS);
    if (count > 0)
        file.Write(BLANKS.substr(0, count));
}

} // namespace

/// The short way of Append may fill the line up to 80 columns, as far as its memory reaches.
void FoldingLine::FindLimit() {
    limit = std::min(capacity, start + MAX_LENGTH - std::min(blanks, MAX_LENGTH));
}

void FoldingLine::Grow() {
    std::size_t const grown = std::max<std::size_t>(2 * capacity, 256);
    auto larger = std::make_unique<char[]>(grown);
    if (text)
        std::copy_n(text.get(), size, larger.get());
    else
        std::fill_n(larger.get(), MARGIN, ' ');
    text = std::move(larger);
    capacity = grown;
    FindLimit();
}

/// Whether the text before the last piece holds a comment mark. A line break in a comment would
/// turn the rest of the comment into text, so that such a line is never folded. Required: a single
/// "/" counts, not only "//" and "/*".
bool FoldingLine::IsComment() {
    for (; !comment && searched < pieceBegin; ++searched) {
        char const c = text[searched];
        comment = c == '/' || (c == '-' && searched > start && text[searched - 1] == '-');
    }
    return comment;
}

/// The last place of a character before the last piece and not before `from`.
std::size_t FoldingLine::FindLast(char c, std::size_t from) const {
    for (std::size_t at = pieceBegin; at > from; --at)
        if (text[at - 1] == c)
            return at - 1;
    return NONE;
}

void FoldingLine::Fold(Basis::Stream &file, std::size_t indentation) {
    WriteBlanks(file, blanks);
    std::size_t const lastBlank = FindLast(' ', std::max(start, withoutBlank));
    // Without a blank in the text, the last blank of the line is the last one of its indentation,
    // and the line breaks there. Only a line without indentation is searched for a comma.
    std::size_t end = start;
    if (lastBlank != NONE) {
        end = lastBlank + 1;
    } else if (blanks == 0) {
        std::size_t const lastComma = FindLast(',', start);
        end = lastComma != NONE ? lastComma + 1 : pieceBegin;
    }
    file.Write(std::string_view(text.get() + start, end - start)).Write("\n");
    start = end;
    blanks = indentation + FOLD_INDENT; // the next fold of this line finds these blanks, no comma
    withoutBlank = pieceBegin;
    searched = std::max(searched, start);
    if (start - MARGIN >= size - start)
        DropWritten();
    FindLimit();
}

/// Moves what is not written yet to the front. Without it a line that is folded a million times
/// would keep all of its text in memory. It is called when the written part is the larger one, so
/// that each character is moved at most once on average.
void FoldingLine::DropWritten() {
    std::copy(text.get() + start, text.get() + size, text.get() + MARGIN);
    for (std::size_t *const place : {&size, &pieceBegin, &searched, &withoutBlank})
        *place -= start - MARGIN;
    start = MARGIN;
}

void FoldingLine::End(Basis::Stream &file) {
    if (size >= capacity)
        Grow();
    text[size++] = '\n';
    std::size_t begin = start;
    if (start == MARGIN && blanks <= MARGIN) // the margin before the text serves as indentation
        begin -= blanks;
    else
        WriteBlanks(file, blanks);
    file.Write(std::string_view(text.get() + begin, size - begin));
    size = start = pieceBegin = searched = withoutBlank = MARGIN;
    blanks = limit = 0;
    comment = false;
}

void FoldingLine::Break(Basis::Stream &file, std::size_t indentation) {
    End(file);
    Indent(indentation + FOLD_INDENT);
}

} // namespace Vesk_Hdl
