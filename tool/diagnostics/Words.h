#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

// Words of people and of the command language.

bool SameIgnoringCase(std::string_view left, std::string_view right);
std::string Lowercase(std::string_view text);
/// In quotes; of a very long text the beginning and the end, so that a message stays one to read
/// and many messages about one long name do not grow beyond all bounds.
std::string Quoted(std::string_view text);
/// What `Quoted` puts between the quotes.
std::string Shortened(std::string_view text);
/// The words between blanks.
std::vector<std::string> WordsOf(std::string_view text);
/// "A, B or C"
std::string Alternatives(std::vector<std::string_view> const &words);

// Keywords.

constexpr int MOST_KEYWORD_WORDS = 5;

/// What a line begins with: as many words as a keyword may have, none longer than any of theirs.
std::string KeywordPart(Vesk_Hdl::StringArray const &tokens);
/// The words with which keywords go on behind these; none if no keyword begins so.
std::vector<std::string_view> KeywordWordsBehind(std::string_view words);
/// The command whose keyword is the fewest edits away from what a line begins with; null if none is
/// near enough to be meant.
Vesk_Hdl::CommandHelp const *NearestKeyword(std::string_view keywordPart);
