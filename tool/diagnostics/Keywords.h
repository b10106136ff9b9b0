#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

// Keywords that a line has only in part, or misspelled.

/// What a line begins with: as many words as a keyword may have, none longer than any of theirs.
std::string KeywordPart(Vesk_Hdl::StringArray const &tokens);
/// The words with which keywords continue after these words, each once; with no words the first
/// words of all keywords.
std::vector<std::string_view> NextKeywordWords(std::string_view words);
/// The command whose keyword is the fewest edits away from the beginning of a line; null if each
/// takes more edits than a third of its letters.
Vesk_Hdl::CommandHelp const *NearestKeyword(std::string_view keywordPart);
