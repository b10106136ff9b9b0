#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

// Words, and texts made of them.

bool SameIgnoringCase(std::string_view left, std::string_view right);
bool BeginsWith(std::string_view text, std::string_view begin); ///< case ignored
std::string Lowercase(std::string_view text);
/// In quotes; of a very long text the beginning and the end, so that a message stays one to read
/// and many messages about one long name do not grow beyond all bounds.
std::string Quoted(std::string_view text);
/// What `Quoted` puts between the quotes.
std::string Shortened(std::string_view text);
/// The words between blanks.
std::vector<std::string> WordsOf(std::string_view text);
/// "A, B or C"
std::string Alternatives(std::span<std::string_view const> words);
