#pragma once

#include <string_view>

namespace Checks {

/// A line as a written file folds it at 80 columns, just as far as to tell whether a quoted text is
/// broken in two. A piece that does not fit sends what follows the last blank, or else the
/// last comma, to the next line; a line with a comment mark does not fold.
class Fold {
public:
    /// `level` is the depth of the statement.
    explicit Fold(std::size_t level) : indentation(3 * level), length(indentation) {}

    Fold &Put(std::string_view piece, bool isQuoted = false) {
        constexpr std::size_t MOST = 80;
        constexpr std::size_t DEEPER = 6;
        if (!isComment && length + piece.size() > MOST) {
            folded = true;
            std::size_t const cut = hasBlank ? lastBlank + 1 : length;
            broken |= hasBlank && lastBlankIsQuoted;
            length = indentation + DEEPER + (length - cut);
            // Indentation is blanks, too.
            lastBlank = indentation + DEEPER - 1;
            hasBlank = true;
            lastBlankIsQuoted = false;
        }
        for (std::size_t i = 0; i < piece.size(); ++i) {
            if (piece[i] == ' ') {
                lastBlank = length + i;
                hasBlank = true;
                lastBlankIsQuoted = isQuoted;
            }
            isComment |= piece[i] == '/' || (piece[i] == '-' && last == '-');
            last = piece[i];
        }
        length += piece.size();
        return *this;
    }
    bool IsFolded() const { return folded; }
    /// Whether it is folded within the quoted text.
    bool IsBroken() const { return broken; }

private:
    std::size_t indentation;
    std::size_t length;
    std::size_t lastBlank = 0;
    char last = ' ';
    bool hasBlank = false;
    bool lastBlankIsQuoted = false;
    bool isComment = false;
    bool folded = false;
    bool broken = false;
};

} // namespace Checks
