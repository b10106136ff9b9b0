#include "vesk_hdl/text/FoldingLine.h"

namespace Vesk_Hdl {

namespace {

void WriteBlanks(Basis::Stream &file, std::size_t count) {
    static constexpr std::string_view BLANKS = "                                                ";
    for (; count > BLANKS.size(); count -= BLANKS.size())
        file.Write(BLANKS);
    file.Write(BLANKS.substr(0, count));
}

} // namespace

void FoldingLine::Append(std::string_view token) {
    std::size_t const base = text.size();
    char before = base > start ? text.back() : ' ';
    text.append(token);
    if (comment)
        return;
    for (std::size_t i = 0; i < token.size(); ++i) {
        char const c = token[i];
        if (c == ' ')
            lastBlank = base + i;
        else if (c == ',')
            lastComma = base + i;
        else if (c == '/' || (c == '-' && before == '-'))
            comment = true;
        before = c;
    }
}

void FoldingLine::Fold(Basis::Stream &file, std::size_t indentation) {
    WriteBlanks(file, blanks);
    std::size_t end = start; // unless the text holds a blank, the last one stands in front of it
    if (lastBlank != NONE)
        end = lastBlank + 1;
    else if (blanks == 0)
        end = lastComma != NONE ? lastComma + 1 : text.size();
    file.Write(std::string_view(text).substr(start, end - start)).Write("\n");
    start = end;
    blanks = indentation + FOLD_INDENT;
    lastBlank = lastComma = NONE; // blanks stand in front now, so that no comma will be asked for
    if (start == text.size()) {
        text.clear();
        start = 0;
    }
}

void FoldingLine::Write(Basis::Stream &file) {
    WriteBlanks(file, blanks);
    file.Write(std::string_view(text).substr(start));
    text.clear();
    blanks = start = 0;
    lastBlank = lastComma = NONE;
    comment = false;
}

void FoldingLine::Break(Basis::Stream &file, std::size_t indentation) {
    Write(file);
    file.Write("\n");
    blanks = indentation + FOLD_INDENT;
}

} // namespace Vesk_Hdl
