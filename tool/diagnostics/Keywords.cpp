#include "tool/diagnostics/Keywords.h"

#include <algorithm>
#include <string>
#include <vector>

#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;

namespace {

/// All keywords, sorted in lower case: `check` asks for one at each line.
class Keywords {
public:
    struct Entry {
        std::string text;
        CommandHelp const *command;
    };

    Keywords() {
        for (int i = 0; i < CommandReference::GetCount(); ++i) {
            CommandHelp const *const command = CommandReference::GetAt(i);
            entries.push_back({Lowercase(command->keyword), command});
            longest = std::max(longest, entries.back().text.size());
        }
        std::sort(entries.begin(), entries.end(),
                  [](Entry const &a, Entry const &b) { return a.text < b.text; });
    }

    std::size_t GetLongest() const { return longest; }
    /// The first one at or behind a text, the end for none.
    std::vector<Entry>::const_iterator From(std::string const &text) const {
        return std::lower_bound(
            entries.begin(), entries.end(), text,
            [](Entry const &entry, std::string const &wanted) { return entry.text < wanted; });
    }
    std::vector<Entry>::const_iterator End() const { return entries.end(); }

private:
    std::vector<Entry> entries;
    std::size_t longest = 0;
};

} // namespace

CommandHelp const *KeywordOf(StringArray const &tokens, int &words) {
    static Keywords const keywords;
    CommandHelp const *found = nullptr;
    std::string begin; // the first tokens, joined: a token may hold blanks, too
    for (int i = 0; i < std::min(tokens.GetSize(), MOST_KEYWORD_WORDS); ++i) {
        std::string_view const token = tokens.At(i).View();
        if (begin.size() + token.size() > keywords.GetLongest())
            break;
        begin += i > 0 ? " " : "";
        begin += Lowercase(token);
        auto const at = keywords.From(begin);
        if (at == keywords.End() || at->text.compare(0, begin.size(), begin) != 0)
            break;
        if (at->text.size() == begin.size()) {
            found = at->command;
            words = i + 1;
        }
    }
    return found;
}
