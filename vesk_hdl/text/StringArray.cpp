#include "vesk_hdl/text/StringArray.h"

#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/text/IntroSort.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/Tokens.h"

namespace Vesk_Hdl {

using Basis::StringBase;
using Basis::ViewOf;

namespace {

constexpr std::size_t NPOS = std::string_view::npos;

/// The quoted way of StringArray::Parse: one walk over the text, a character at a time.
class QuotedParser {
public:
    QuotedParser(std::string_view separatorSet, bool skip, std::string_view pairs, StringArray &out)
        : separators(separatorSet), skipEmpty(skip), quotePairs(pairs), tokens(out) {}

    int Parse(std::string_view text) {
        std::size_t i = OpensAt(text, 0) ? 1 : 0;
        while (i < text.size())
            i = inQuote ? StepInside(text, i) : StepOutside(text, i);
        // Only here a quoted part that ended does not count: an empty last token is lost.
        if (!token.empty())
            AddToken();
        return count;
    }

private:
    bool IsSeparator(char c) const { return separators.find(c) != std::string_view::npos; }

    /// Enters a quote if a character that opens one stands at the place.
    bool OpensAt(std::string_view text, std::size_t at) {
        for (std::size_t pair = 0; at < text.size() && pair + 1 < quotePairs.size(); pair += 2)
            if (quotePairs[pair] == text[at]) {
                inQuote = true;
                close = quotePairs[pair + 1];
                return true;
            }
        return false;
    }

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

    std::size_t StepOutside(std::string_view text, std::size_t i) {
        if (!IsSeparator(text[i])) {
            token += text[i];
            return i + 1;
        }
        if (!token.empty() || !skipEmpty || hadQuote)
            AddToken();
        return OpensAt(text, i + 1) ? i + 2 : i + 1;
    }

    void AddToken() {
        tokens.Add(StringBase<char>(std::string_view(token)));
        token.clear();
        hadQuote = false;
        ++count;
    }

    std::string_view separators;
    bool skipEmpty;
    std::string_view quotePairs;
    StringArray &tokens;
    std::string token;
    char close = '\0';
    bool inQuote = false;
    bool hadQuote = false; ///< a quoted part has ended: the token counts even if it is empty
    int count = 0;
};

/// Whether the text holds one of a few characters.
bool HoldsOneOf(std::string_view text, std::string_view characters) {
    for (std::size_t i = 0; i < characters.size(); ++i)
        if (characters.find(characters[i]) == i && text.find(characters[i]) != NPOS)
            return true;
    return false;
}

/// The plain way of StringArray::Parse.
template <class Act>
void ForEachToken(std::string_view text, std::string_view separators, bool skipEmpty, Act act) {
    for (Basis_Range range = {1, 0}; Basis::NextToken(text, range, separators, skipEmpty);)
        act(Basis::TokenIn(text, range));
}

} // namespace

/// A slot that nobody assigned reads as the empty string, and that is what it holds.
struct StringArray::Record {
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
    static StringBase<char> const outside;
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
    std::string_view const whole = ViewOf(text);
    std::string_view const set = ViewOf(separators);
    std::string_view const quotes = ViewOf(quotePairs);
    if (HoldsOneOf(whole, quotes))
        return QuotedParser(set, skipEmpty, quotes, *this).Parse(whole);

    int const before = GetSize();
    ForEachToken(whole, set, skipEmpty,
                 [this](std::string_view token) { record->strings.emplace_back(token); });
    return GetSize() - before;
}

void StringArray::ParseAnew(char const *text, char const *separators, bool skipEmpty,
                            char const *quotePairs) {
    std::string_view const whole = ViewOf(text);
    if (HoldsOneOf(whole, ViewOf(quotePairs))) {
        Empty();
        Parse(text, separators, skipEmpty, quotePairs);
        return;
    }
    std::vector<StringBase<char>> &strings = record->strings;
    std::size_t count = 0;
    ForEachToken(whole, ViewOf(separators), skipEmpty, [&](std::string_view token) {
        if (count == strings.size())
            strings.emplace_back(token);
        else if (strings[count].View() != token)
            strings[count].Assign(token);
        ++count;
    });
    strings.resize(count);
}

bool StringArray::Contains(StringBase<char> const &string) const {
    for (StringBase<char> const &own : record->strings)
        if (own.Compare(string, StringBase<char>::COMPARE_EXACT) == 0)
            return true;
    return false;
}

bool StringArray::IContains(StringBase<char> const &string) const {
    for (StringBase<char> const &own : record->strings)
        if (own.Compare(string, StringBase<char>::COMPARE_IGNORING_CASE) == 0)
            return true;
    return false;
}

bool StringArray::Contains(StringArray const &strings) const {
    if (GetSize() < strings.GetSize())
        return false;
    for (StringBase<char> const &wanted : strings.record->strings)
        if (!Contains(wanted))
            return false;
    return true;
}

bool StringArray::IContains(StringArray const &strings) const {
    if (GetSize() < strings.GetSize())
        return false;
    for (StringBase<char> const &wanted : strings.record->strings)
        if (!IContains(wanted))
            return false;
    return true;
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
    if (!Basis::strtol(At(index), number) || !std::in_range<int>(number))
        return false;
    value = static_cast<int>(number);
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
