#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

// Words, and texts made of them.

bool SameIgnoringCase(std::string_view left, std::string_view right);
bool BeginsWith(std::string_view text, std::string_view begin); ///< case ignored
std::string Lowercase(std::string_view text);
std::string Quoted(std::string_view text);
/// The words between blanks.
std::vector<std::string> WordsOf(std::string_view text);
/// "A, B or C"
std::string Alternatives(std::span<std::string_view const> words);
