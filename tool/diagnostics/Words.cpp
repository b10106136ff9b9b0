#include "tool/diagnostics/Words.h"

#include <algorithm>

namespace {

/// ASCII only, as the library compares names; the functions of <cctype> depend on the locale.
char Lower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

} // namespace

bool SameIgnoringCase(std::string_view left, std::string_view right) {
    return left.size() == right.size() &&
           std::equal(left.begin(), left.end(), right.begin(),
                      [](char a, char b) { return Lower(a) == Lower(b); });
}

bool BeginsWith(std::string_view text, std::string_view begin) {
    return SameIgnoringCase(text.substr(0, begin.size()), begin);
}

std::string Lowercase(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), Lower);
    return lower;
}

std::string Alternatives(std::span<std::string_view const> words) {
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i)
        text.append(i == 0 ? "" : i + 1 < words.size() ? ", " : " or ").append(words[i]);
    return text;
}

std::string Quoted(std::string_view text) { return '"' + Shortened(text) + '"'; }

std::string Shortened(std::string_view text) {
    constexpr std::size_t MAX_SHOWN = 160;
    constexpr std::size_t PART = 78; // before and after the dots
    if (text.size() <= MAX_SHOWN)
        return std::string(text);
    // The cuts are not in the middle of a UTF-8 character.
    auto const continues = [](char c) { return (static_cast<unsigned char>(c) & 0xC0) == 0x80; };
    std::size_t front = PART;
    std::size_t back = text.size() - PART;
    while (front > 0 && continues(text[front]))
        --front;
    while (back < text.size() && continues(text[back]))
        ++back;
    return std::string(text.substr(0, front)).append("...").append(text.substr(back));
}

std::vector<std::string> WordsOf(std::string_view text) {
    std::vector<std::string> words;
    for (std::size_t at = 0; at < text.size();) {
        std::size_t const end = std::min(text.find(' ', at), text.size());
        if (end > at)
            words.emplace_back(text.substr(at, end - at));
        at = end + 1;
    }
    return words;
}
