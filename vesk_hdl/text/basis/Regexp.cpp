// A small matcher of regular expressions. That of the standard library depends on the locale and
// can overflow the stack with a long text.

#include "vesk_hdl/text/basis/Regexp.h"

#include <algorithm>
#include <bitset>
#include <vector>

namespace {

using CharSet = std::bitset<256>;

/// One item of the pattern: which characters it accepts, and whether none or many of them.
struct Item {
    CharSet accepted;
    bool optional = false;
    bool repeated = false;
};

std::size_t Code(char c) { return static_cast<unsigned char>(c); }

/// Reads a bracket class whose "[" is read already, and its "]". A "]" at its beginning and a "-"
/// at its end are ordinary characters.
CharSet ReadClass(char const *&p) {
    CharSet set;
    bool const inverted = *p == '^';
    if (inverted)
        ++p;
    for (char const *const begin = p; *p && (*p != ']' || p == begin); ++p) {
        if (p[1] == '-' && p[2] && p[2] != ']') {
            for (std::size_t c = Code(p[0]); c <= Code(p[2]); ++c)
                set.set(c);
            p += 2;
        } else {
            set.set(Code(*p));
        }
    }
    if (*p)
        ++p;
    return inverted ? ~set : set;
}

/// Reads one item without what may follow it ("?", "*", "+").
CharSet ReadOne(char const *&p) {
    char const c = *p++;
    if (c == '[')
        return ReadClass(p);
    if (c == '.')
        return CharSet().set();
    return CharSet().set(Code(c == '\\' && *p ? *p++ : c));
}

} // namespace

struct Basis_Regexp::Record {
    std::vector<Item> items;
};

Basis_Regexp::Basis_Regexp(char const *pattern) : record(new Record) {
    for (char const *p = pattern ? pattern : ""; *p;) {
        Item item{ReadOne(p)};
        if (*p == '+')
            record->items.push_back(item); // x+ is xx*
        item.optional = *p == '?' || *p == '*' || *p == '+';
        item.repeated = *p == '*' || *p == '+';
        if (item.optional)
            ++p;
        record->items.push_back(item);
    }
}

Basis_Regexp::~Basis_Regexp() { delete record; }

/// Walks over all possible matches at once, one character at a time, so that no pattern makes the
/// time grow faster than the text.
Basis_Range Basis_Regexp::Match(std::string_view text) const {
    // State i means: items before i have matched. It holds the earliest start that leads there.
    std::vector<Item> const &items = record->items;
    std::vector<std::size_t> starts(items.size() + 1, std::string_view::npos);
    std::vector<std::size_t> next(starts.size());
    Basis_Range best = {1, 0};
    bool found = false;

    for (std::size_t at = 0; at < text.size(); ++at) {
        if (!found)
            starts[0] = std::min(starts[0], at);
        for (std::size_t i = 0; i < items.size(); ++i) // an optional item may match nothing
            if (items[i].optional)
                starts[i + 1] = std::min(starts[i + 1], starts[i]);
        next.assign(next.size(), std::string_view::npos);
        for (std::size_t i = 0; i < items.size(); ++i)
            if (starts[i] != std::string_view::npos && items[i].accepted.test(Code(text[at]))) {
                std::size_t &to = next[items[i].repeated ? i : i + 1];
                to = std::min(to, starts[i]);
            }
        for (std::size_t i = 0; i < items.size(); ++i)
            if (items[i].optional)
                next[i + 1] = std::min(next[i + 1], next[i]);
        if (std::size_t const start = next.back();
            start != std::string_view::npos && (!found || start <= best.first)) {
            best = {static_cast<unsigned int>(start), static_cast<unsigned int>(at)};
            found = true;
        }
        starts.swap(next);
    }
    return best;
}
