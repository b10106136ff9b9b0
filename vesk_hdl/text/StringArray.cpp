// Arrays of strings and the tokenizer, where the grammar of a command line begins.

#include "vesk_hdl/text/StringArray.h"

#include <algorithm>
#include <cassert>
#include <string>
#include <vector>

#include "vesk_hdl/text/IntroSort.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/StringEdit.h"
#include "vesk_hdl/text/basis/Tokens.h"

namespace Vesk_Hdl {

using Basis::OrEmpty;
using Basis::StringBase;
using Basis::ViewOf;

namespace {

/// The range of the characters from `begin` on and before `end`, in the form of Basis_Range.
Basis_Range PlaceOf(std::size_t begin, std::size_t end) {
    if (begin == end)
        return {static_cast<unsigned int>(begin) + 1, static_cast<unsigned int>(begin)};
    return {static_cast<unsigned int>(begin), static_cast<unsigned int>(end - 1)};
}

/// StringArray::Parse for a text with quotes: one walk over the text, a character at a time. What
/// looks like an oversight here is required: the language of command files depends on it.
class QuotedParser {
public:
    /// `placesOut` may be null.
    QuotedParser(std::string_view separatorSet, bool skip, std::string_view pairs, StringArray &out,
                 std::vector<Basis_Range> *placesOut)
        : separators(separatorSet), skipEmpty(skip), quotePairs(pairs), tokens(out),
          places(placesOut) {}

    int Parse(std::string_view text) {
        std::size_t i = OpensAt(text, 0) ? 1 : 0;
        while (i < text.size())
            i = inQuote ? StepInside(text, i) : StepOutside(text, i);
        // Required: at the end of the text a quoted part does not count, so that an empty last
        // token is lost. Everywhere else `hadQuote` keeps it.
        if (!token.empty())
            AddToken(text.size());
        return count;
    }

private:
    bool IsSeparator(char c) const { return separators.find(c) != std::string_view::npos; }

    /// Enters a quote if the character at the place opens one. A last character of the pairs that
    /// has no partner opens nothing.
    bool OpensAt(std::string_view text, std::size_t at) {
        for (std::size_t pair = 0; at < text.size() && pair + 1 < quotePairs.size(); pair += 2)
            if (quotePairs[pair] == text[at]) {
                inQuote = true;
                close = quotePairs[pair + 1];
                return true;
            }
        return false;
    }

    /// One step inside a quote; returns where the next one begins. Required: a closing character in
    /// the middle of a word is dropped, and the quote continues.
    std::size_t StepInside(std::string_view text, std::size_t i) {
        bool const last = i + 1 == text.size();
        if (text[i] == close) {
            if (last || IsSeparator(text[i + 1])) {
                inQuote = false;
                hadQuote = true;
            }
            return i + 1;
        }
        if (text[i] == '\\' && !last && text[i + 1] == close) {
            token += close;
            return i + 2;
        }
        token += text[i];
        return i + 1;
    }

    /// One step outside a quote. A quote begins only after a separator: in `a"b` it is a character.
    std::size_t StepOutside(std::string_view text, std::size_t i) {
        if (!IsSeparator(text[i])) {
            token += text[i];
            return i + 1;
        }
        if (!token.empty() || !skipEmpty || hadQuote)
            AddToken(i);
        begin = i + 1;
        return OpensAt(text, i + 1) ? i + 2 : i + 1;
    }

    void AddToken(std::size_t end) {
        tokens.Add(StringBase<char>(std::string_view(token)));
        if (places)
            places->push_back(PlaceOf(begin, end));
        token.clear();
        hadQuote = false;
        ++count;
    }

    std::string_view separators;
    bool skipEmpty;
    std::string_view quotePairs;
    StringArray &tokens;
    std::vector<Basis_Range> *places;
    std::string token;
    std::size_t begin = 0; ///< where the token begins, with its quote
    char close = '\0';
    bool inQuote = false;
    bool hadQuote = false; ///< a quoted part has ended: the token counts even if it is empty
    int count = 0;
};

/// StringArray::Parse for a text without quotes, where empty tokens do not count: the tokens are
/// the runs of characters that are no separators. Nearly all command lines are such texts. One
/// look-up for each character takes the place of a search for quotes and another for separators.
class PlainParser {
public:
    constexpr PlainParser(std::string_view separators, std::string_view quotes) {
        for (char const c : separators)
            KindOf(c) = SEPARATOR;
        for (char const c : quotes)
            KindOf(c) = QUOTE;
        KindOf('\0') = END;
    }

    /// Calls `act` with each token up to the first quote. False if it met a quote: then the tokens
    /// so far may be wrong.
    template <class Act> bool ForEachToken(char const *at, Act act) const {
        for (;;) {
            while (KindOf(*at) == SEPARATOR)
                ++at;
            char const *const begin = at;
            while (KindOf(*at) == PLAIN)
                ++at;
            if (KindOf(*at) == QUOTE)
                return false;
            if (at == begin)
                return true;
            act(std::string_view(begin, static_cast<std::size_t>(at - begin)));
        }
    }

private:
    enum Kind : unsigned char { PLAIN, SEPARATOR, QUOTE, END };

    constexpr Kind &KindOf(char c) { return kinds[static_cast<unsigned char>(c)]; }
    constexpr Kind KindOf(char c) const { return kinds[static_cast<unsigned char>(c)]; }

    Kind kinds[256] = {};
};

constexpr char BLANK[] = " ";
constexpr char QUOTES[] = "\"\"''";

} // namespace

/// A slot that was never assigned reads as the empty string, so that it need not be null.
struct StringArray::Record {
    bool Contains(StringBase<char> const &wanted, StringBase<char>::CompareType type) const;
    bool ContainsAll(Record const &others, StringBase<char>::CompareType type) const;

    std::vector<StringBase<char>> strings;
};

StringArray::StringArray() : record(new Record) {}

StringArray::StringArray(char const *text, char const *separators, bool skipEmpty,
                         char const *quotePairs)
    : StringArray() {
    Parse(text, separators, skipEmpty, quotePairs);
}

StringArray::StringArray(StringArray const &other) : record(new Record(*other.record)) {}

StringArray::~StringArray() { delete record; }

StringArray &StringArray::operator=(StringArray const &other) {
    if (this != &other)
        record->strings = other.record->strings;
    return *this;
}

int StringArray::GetSize() const { return static_cast<int>(record->strings.size()); }

bool StringArray::IsEmpty() const { return record->strings.empty(); }

StringBase<char> StringArray::operator[](int index) const { return At(index); }

StringBase<char> StringArray::GetAt(int index) const { return At(index); }

StringBase<char> const &StringArray::At(int index) const {
    static StringBase<char> const outside; // a reference to it stays valid
    return index >= 0 && index < GetSize() ? record->strings[static_cast<std::size_t>(index)]
                                           : outside;
}

int StringArray::Add(StringBase<char> const &string) {
    record->strings.push_back(string);
    return GetSize() - 1;
}

void StringArray::Add(StringArray const &strings) {
    for (int i = 0; i < strings.GetSize(); ++i)
        Add(strings.GetAt(i));
}

void StringArray::SetAt(int index, StringBase<char> const &string) {
    if (index < 0)
        return;
    StringBase<char> const held(string); // it may lie in this array
    if (index >= GetSize())
        record->strings.resize(static_cast<std::size_t>(index) + 1);
    record->strings[static_cast<std::size_t>(index)] = held;
}

void StringArray::Empty() { record->strings.clear(); }

int StringArray::Parse(char const *text, char const *separators, bool skipEmpty,
                       char const *quotePairs) {
    return Parse(text, separators, skipEmpty, quotePairs, nullptr);
}

int StringArray::Parse(char const *text, char const *separators, bool skipEmpty,
                       char const *quotePairs, std::vector<Basis_Range> *places) {
    std::string_view const set = ViewOf(separators);
    std::string_view const quotes = ViewOf(quotePairs);
    std::string_view const whole = ViewOf(text);
    int const before = GetSize();
    std::size_t const placesBefore = places ? places->size() : 0;
    auto const add = [&](std::string_view token) {
        record->strings.emplace_back(token);
        if (places) {
            auto const begin = static_cast<std::size_t>(token.data() - whole.data());
            places->push_back(PlaceOf(begin, begin + token.size()));
        }
    };
    bool isPlain = false;
    if (skipEmpty) {
        isPlain = PlainParser(set, quotes).ForEachToken(whole.data(), add);
    } else if (whole.find_first_of(quotes) == whole.npos) {
        isPlain = true;
        for (Basis_Range range = {1, 0}; Basis::NextToken(whole, range, set, false);)
            add(range.first > range.last ? whole.substr(range.last, 0)
                                         : Basis::TokenIn(whole, range));
    }
    if (isPlain)
        return GetSize() - before;
    // There is a quote: what was added before it is dropped, and the text is read again.
    record->strings.resize(static_cast<std::size_t>(before));
    if (places)
        places->resize(placesBefore);
    return QuotedParser(set, skipEmpty, quotes, *this, places).Parse(whole);
}

/// A line is parsed for each command, so that this one differs from Parse in two ways: the table of
/// characters is made when the library is compiled, and strings that exist are assigned to.
void StringArray::ParseLine(char const *line, std::vector<Basis_Range> *places) {
    static constexpr PlainParser PARSER(BLANK, QUOTES);
    std::vector<StringBase<char>> &strings = record->strings;
    std::size_t count = 0;
    char const *const begin = OrEmpty(line);
    if (places)
        places->clear();
    bool const isPlain = PARSER.ForEachToken(begin, [&](std::string_view token) {
        if (places) {
            auto const at = static_cast<std::size_t>(token.data() - begin);
            places->push_back(PlaceOf(at, at + token.size()));
        }
        if (count == strings.size())
            strings.emplace_back(token);
        else
            Basis::StringEdit::Assign(strings[count], token);
        ++count;
    });
    if (!isPlain) {
        Empty();
        if (places)
            places->clear();
        Parse(line, BLANK, true, QUOTES, places);
        return;
    }
    assert(strings.size() >= count && "a token was neither assigned nor added");
    while (strings.size() > count)
        strings.pop_back();
}

bool StringArray::Record::Contains(StringBase<char> const &wanted,
                                   StringBase<char>::CompareType type) const {
    return std::any_of(strings.begin(), strings.end(),
                       [&](StringBase<char> const &own) { return own.Compare(wanted, type) == 0; });
}

/// Required: an array that is longer is not looked into, even if its strings repeat.
bool StringArray::Record::ContainsAll(Record const &others,
                                      StringBase<char>::CompareType type) const {
    return strings.size() >= others.strings.size() &&
           std::all_of(others.strings.begin(), others.strings.end(),
                       [&](StringBase<char> const &wanted) { return Contains(wanted, type); });
}

bool StringArray::Contains(StringBase<char> const &string) const {
    return record->Contains(string, StringBase<char>::COMPARE_EXACT);
}
bool StringArray::IContains(StringBase<char> const &string) const {
    return record->Contains(string, StringBase<char>::COMPARE_IGNORING_CASE);
}
bool StringArray::Contains(StringArray const &strings) const {
    return record->ContainsAll(*strings.record, StringBase<char>::COMPARE_EXACT);
}
bool StringArray::IContains(StringArray const &strings) const {
    return record->ContainsAll(*strings.record, StringBase<char>::COMPARE_IGNORING_CASE);
}

StringBase<char> StringArray::Concatenate(StringBase<char> const &separator) const {
    StringBase<char> joined;
    for (int i = 0; i < GetSize(); ++i) {
        if (i > 0)
            joined += separator;
        joined += At(i);
    }
    return joined;
}

bool StringArray::GetIntAt(int index, int &value, int seed) const {
    long number = seed;
    if (!Basis::strtol(At(index), number))
        return false;
    value = static_cast<int>(number); // required: a number beyond int is converted, not refused
    return true;
}

void StringArray::Sort() {
    Sort([](StringBase<char> const &a, StringBase<char> const &b,
            void *) { return a.View() < b.View(); },
         nullptr);
}

void StringArray::Sort(bool (*less)(StringBase<char> const &, StringBase<char> const &, void *),
                       void *context) {
    auto before = [less, context](StringBase<char> const &a, StringBase<char> const &b) {
        return less(a, b, context);
    };
    StringBase<char> *const strings = record->strings.data();
    IntroSort<StringBase<char>, decltype(before)>::Sort(strings, strings + GetSize(), before);
}

} // namespace Vesk_Hdl
