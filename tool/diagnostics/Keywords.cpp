// Finds keywords for a line that begins with none.

#include "tool/diagnostics/Keywords.h"

#include <algorithm>
#include <cstring>
#include <numeric>

#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;

namespace {

constexpr int MAX_KEYWORD_WORDS = 5;
constexpr std::size_t MAX_WORD = 40; ///< no word of a keyword comes near it

/// The number of edits (a letter more, less, other, or two exchanged) between two texts, case
/// ignored.
int Distance(std::string_view left, std::string_view right) {
    // The table of edit distances (optimal string alignment), of which three rows are enough: an
    // exchange of two letters looks two rows back.
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
    for (int i = 0; i < tokens.GetSize() && i < MAX_KEYWORD_WORDS; ++i)
        (part += i > 0 ? " " : "") += tokens.At(i).View().substr(0, MAX_WORD);
    return part;
}

std::vector<std::string_view> NextKeywordWords(std::string_view words) {
    // With a blank at the end only whole words match: "ADD C" does not go on with "OMPONENT".
    std::string const begin = std::string(words) + (words.empty() ? "" : " ");
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
    int least = 0;
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &candidate = *CommandReference::GetAt(i);
        std::string begin; // as many words as the keyword has
        for (int word = 0; word < candidate.words && word < static_cast<int>(given.size()); ++word)
            (begin += word > 0 ? " " : "") += given[static_cast<std::size_t>(word)];
        // More edits than a third of the letters make another word. A later keyword has to be
        // nearer than the one that was found before, so that the first of two equally near ones is
        // shown.
        int const length = static_cast<int>(std::strlen(candidate.keyword));
        int const farthest = nearest ? std::min(length / 3, least - 1) : length / 3;
        if (std::abs(static_cast<int>(begin.size()) - length) > farthest)
            continue; // it takes an edit for each letter more or less
        int const distance = Distance(begin, candidate.keyword);
        if (distance <= farthest) {
            nearest = &candidate;
            least = distance;
        }
    }
    return nearest;
}
