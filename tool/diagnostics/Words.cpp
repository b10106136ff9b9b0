#include "tool/diagnostics/Words.h"

#include <algorithm>
#include <climits>
#include <cstring>
#include <numeric>

using namespace Vesk_Hdl;

namespace {

char Lower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

} // namespace

bool SameIgnoringCase(std::string_view left, std::string_view right) {
    return left.size() == right.size() &&
           std::equal(left.begin(), left.end(), right.begin(),
                      [](char a, char b) { return Lower(a) == Lower(b); });
}

std::string Lowercase(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), Lower);
    return lower;
}

/// "A, B or C"
std::string Alternatives(std::vector<std::string_view> const &words) {
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i)
        text.append(i == 0 ? "" : i + 1 < words.size() ? ", " : " or ").append(words[i]);
    return text;
}

std::string Quoted(std::string_view text) { return '"' + Shortened(text) + '"'; }

std::string Shortened(std::string_view text) {
    constexpr std::size_t MOST = 160;
    constexpr std::size_t PART = 78; // in front of the dots and behind them
    if (text.size() <= MOST)
        return std::string(text);
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

namespace {

constexpr std::size_t LONGEST_WORD = 40; // no word of a keyword comes near it

/// The number of edits (a letter more, less, other, or two exchanged) between two texts, case
/// ignored.
int Distance(std::string_view left, std::string_view right) {
    std::size_t const width = right.size() + 1;
    std::vector<int> before(width);
    std::vector<int> row(width);
    std::vector<int> beforeThat(width);
    std::iota(row.begin(), row.end(), 0);
    for (std::size_t i = 1; i <= left.size(); ++i) {
        beforeThat.swap(before);
        before.swap(row);
        row[0] = static_cast<int>(i);
        for (std::size_t j = 1; j < width; ++j) {
            auto const same = [&](std::size_t a, std::size_t b) {
                return SameIgnoringCase(left.substr(a, 1), right.substr(b, 1));
            };
            row[j] = std::min(
                {before[j] + 1, row[j - 1] + 1, before[j - 1] + (same(i - 1, j - 1) ? 0 : 1)});
            if (i > 1 && j > 1 && same(i - 1, j - 2) && same(i - 2, j - 1))
                row[j] = std::min(row[j], beforeThat[j - 2] + 1);
        }
    }
    return row[width - 1];
}

} // namespace

std::string KeywordPart(StringArray const &tokens) {
    std::string part;
    for (int i = 0; i < tokens.GetSize() && i < MOST_KEYWORD_WORDS; ++i)
        (part += i > 0 ? " " : "") += tokens.At(i).View().substr(0, LONGEST_WORD);
    return part;
}

std::vector<std::string_view> KeywordWordsBehind(std::string_view words) {
    std::string const begin = std::string(words) + " ";
    std::vector<std::string_view> found;
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        std::string_view rest = CommandReference::GetAt(i)->keyword;
        if (!SameIgnoringCase(rest.substr(0, begin.size()), begin))
            continue;
        rest.remove_prefix(begin.size());
        rest = rest.substr(0, rest.find(' '));
        if (std::find(found.begin(), found.end(), rest) == found.end())
            found.push_back(rest);
    }
    return found;
}

CommandHelp const *NearestKeyword(std::string_view keywordPart) {
    std::vector<std::string> const given = WordsOf(keywordPart);
    CommandHelp const *nearest = nullptr;
    int least = INT_MAX;
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &candidate = *CommandReference::GetAt(i);
        std::string begin; // as many words as the keyword has
        for (std::size_t word = 0; word < WordsOf(candidate.keyword).size() && word < given.size();
             ++word)
            (begin += word > 0 ? " " : "") += given[word];
        int const distance = Distance(begin, candidate.keyword);
        if (distance < least && distance <= static_cast<int>(std::strlen(candidate.keyword)) / 3) {
            nearest = &candidate;
            least = distance;
        }
    }
    return nearest;
}
