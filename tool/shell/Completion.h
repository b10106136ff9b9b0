#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

/// The words that the last word of a line may become.
struct Completions {
    std::size_t begin = 0;               ///< index of that word in the line; words end at blanks
    std::vector<std::string> candidates; ///< sorted, each the whole word
    bool wordEnds = true;                ///< a blank follows it; none follows a folder or an owner
};

/// For the line up to the cursor: words of keywords in the user's case, words of the shell, and
/// where the grammar names them, names in the design, files and fixed words.
Completions Complete(std::string_view line, Vesk_Hdl::Model const &model);

/// What all candidates begin with, ignoring case.
std::string CommonBeginning(std::vector<std::string> const &candidates);

/// The words that the shell itself knows, and what `show` shows.
std::vector<std::string_view> const &ShellWords();
std::vector<std::string_view> const &ShownThings();
