#include "vesk_hdl/text/basis/StringBase.h"

#include <cstring>
#include <regex>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/RandomText.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/Regexp.h"

using Basis::NOT_FOUND;
using Text = Basis::StringBase<char>;

namespace {

constexpr Text::CompareType EXACT = Text::COMPARE_EXACT;
constexpr Text::CompareType NO_CASE = Text::COMPARE_IGNORING_CASE;

/// All tokens, a bar after each. `inTurn` has the separator of each call; later calls use the last
/// one.
std::string Walk(Text const &text, std::string const &inTurn, bool skipEmpty) {
    std::string tokens;
    Basis_Range range = {1, 0};
    for (std::size_t call = 0; call < 20; ++call) {
        std::string const set(1, inTurn[std::min(call, inTurn.size() - 1)]);
        if (!text.NextTokenRange(range, set.c_str(), static_cast<Text::ParseType>(skipEmpty)))
            return tokens;
        tokens += std::string(text.Extract(range)) + '|';
    }
    return "a walk without end";
}

TEST(StringBase, WalksFromTokenToToken) {
    using Row = std::tuple<char const *, char const *, bool, char const *>;
    for (auto const &[text, inTurn, skipEmpty, tokens] :
         {Row{"  ", " ", true, ""}, Row{"inst.pin", ".", true, "inst|pin|"},
          Row{"  a  b ", " ", true, "a|b|"}, Row{"A(3:0)", "(:)", true, "A|3|0|"},
          Row{"A(:3:0)", "(:)", true, "A|3|0|"}, Row{"x y.z", " :", true, "x|y.z|"},
          // The search goes on after the one separator that ended the token.
          Row{"a  b:c", " :", true, "a| b|c|"}, Row{"", ",", false, ""}, Row{",", ",", false, "|"},
          Row{",,", ",", false, "||"}, Row{",a", ",", false, "|a|"}, Row{"a,", ",", false, "a|"},
          Row{"a,,,b", ",", false, "a|||b|"}, Row{",a:b", ",:", false, "|a|b|"}})
        EXPECT_EQ(Walk(text, inTurn, skipEmpty), tokens) << text;
}

TEST(StringBase, ExtractsAndRemovesRanges) {
    using Row = std::tuple<Basis_Range, char const *, char const *>;
    for (auto const &[range, extracted, rest] :
         {Row{{0, 5}, "signal", ""}, Row{{6, 5}, "", "signal"}, Row{{1, 0}, "", "signal"},
          Row{{0, 0}, "s", "ignal"}, Row{{5, 5}, "l", "signa"}, Row{{2, 3}, "gn", "sial"},
          Row{{4, 0xFFFFFFFF}, "al", "sign"}, Row{{6, 9}, "", "signal"}}) {
        SCOPED_TRACE(testing::Message() << range.first << " to " << range.last);
        Text text("signal");
        EXPECT_STREQ(text.Extract(range), extracted);
        EXPECT_STREQ(Text(text, range), extracted);
        EXPECT_STREQ(text, "signal");
        text.Remove(range);
        EXPECT_STREQ(text, rest);
    }
}

TEST(StringBase, Searches) {
    Text const text("a.Bb.c");
    EXPECT_EQ(text.GetIndexOfFirstChar('.', 0), 1U);
    EXPECT_EQ(text.GetIndexOfLastChar('.', 0), 4U);
    EXPECT_EQ(text.GetIndexOfFirstChar('\0', 0), NOT_FOUND);
    EXPECT_EQ(text.GetIndexOfLastChar('x', 0), NOT_FOUND);
    EXPECT_EQ(text.GetIndexOfString("b.", EXACT), 3U);
    EXPECT_EQ(text.GetIndexOfString("B.C", NO_CASE), 3U);
    EXPECT_EQ(text.GetIndexOfString("c.", NO_CASE), NOT_FOUND);
    EXPECT_NE(text.Compare("A.BB.C", EXACT), 0);
    EXPECT_EQ(text.Compare(Text("A.BB.C"), NO_CASE), 0);
    EXPECT_NE(text.Compare("a.Bb.", NO_CASE), 0);
    for (auto const &[a, b] : {std::pair{"[", "{"}, {"@", "`"}, {"\xC4", "\xE4"}}) // 32 apart
        EXPECT_NE(Text(a).Compare(b, NO_CASE), 0) << b;
}

/// Each row changes the text `"Ab-b"`, quotes included, alone and beside a copy.
TEST(StringBase, ChangesNeverShowInACopy) {
    using Row = std::pair<void (*)(Text &), char const *>;
    for (auto const &[change, expected] :
         {Row{[](Text &t) { (t += 'x') += '\0'; }, "\"Ab-b\"x"},
          Row{[](Text &t) { t += t; }, "\"Ab-b\"\"Ab-b\""},
          Row{[](Text &t) { t.Append(t.GetText() + 1, 2); }, "\"Ab-b\"Ab"},
          Row{[](Text &t) { t.Append(std::vector<char>(3, 'x').data(), 3); }, "\"Ab-b\"xxx"},
          Row{[](Text &t) { t.Append(&t[3], 0xFFFFFFFF).Append("xy", 0); }, "\"Ab-b\"-b\""},
          Row{[](Text &t) { t = t.GetText() + 3; }, "-b\""}, Row{[](Text &t) { t.Empty(); }, ""},
          Row{[](Text &t) { t.ReplaceChars('b', 'c'); }, "\"Ac-c\""},
          Row{[](Text &t) { t.MakeUpper(); }, "\"AB-B\""},
          Row{[](Text &t) { t.MakeLower(); }, "\"ab-b\""},
          Row{[](Text &t) { t.Trim("\"", Text::TRIM_BOTH_ENDS); }, "Ab-b"},
          Row{[](Text &t) { t.Trim("-\"bA", Text::TRIM_BOTH_ENDS); }, ""},
          Row{[](Text &t) {
                  t.Remove(Basis_Range{1, 3});
              },
              "\"b\""},
          Row{[](Text &t) { t.Format("%s%*.*f", &t[4], 5, 1, -7.25); }, "b\" -7.2"},
          Row{[](Text &t) { t.Format("a%cb", 0); }, "a"}}) // a text never holds a NUL
        for (bool const shared : {false, true}) {
            Text text("\"Ab-b\"");
            Text const copy = shared ? text : Text();
            change(text);
            EXPECT_STREQ(text, expected) << shared;
            EXPECT_EQ(text.GetLength(), std::strlen(expected)) << expected;
            EXPECT_STREQ(copy, shared ? "\"Ab-b\"" : "") << expected;
        }
    std::string const longText(100000, 'n');
    EXPECT_EQ(Text::doFormat("<%s>", longText.c_str()).View(), "<" + longText + ">");
}

TEST(Regexp, FindsTheLeftmostLongestMatch) {
    std::mt19937 random(1);
    for (char const *const pattern :
         {"[A-Za-z'_][A-Za-z0-9_]*", "[+-]?[0-9]+", "a?ab?", "a*b", "[^a0]+", "a+a0?", "b.a*"}) {
        std::regex const naive(pattern);
        Basis_Regexp const expression(pattern);
        for (int round = 0; round < 150; ++round) {
            std::string const text = RandomText(random, "aab0+-_", 7);
            Basis_Range wanted = {1, 0};
            for (unsigned int first = 0; first < text.size() && wanted.last < wanted.first; ++first)
                for (unsigned int last = first; last < text.size(); ++last)
                    if (std::regex_match(text.substr(first, last + 1 - first), naive))
                        wanted = {first, last};
            Basis_Range const found = Text(text.c_str()).GetRangeOfMatch(expression);
            EXPECT_TRUE(found.first == wanted.first && found.last == wanted.last)
                << pattern << " in " << text;
        }
    }
}

bool NaiveGlob(char const *text, char const *pattern) {
    if (*pattern == '*')
        return NaiveGlob(text, pattern + 1) || (*text && NaiveGlob(text + 1, pattern));
    return *pattern == *text && (*text == '\0' || NaiveGlob(text + 1, pattern + 1));
}

TEST(Functions, GlobsMatchTheWholeText) {
    std::mt19937 random(2);
    for (int round = 0; round < 5000; ++round) {
        std::string const text = RandomText(random, "aab", 8);
        std::string const pattern = RandomText(random, "aab**", 6);
        bool const expected = NaiveGlob(text.c_str(), pattern.c_str());
        EXPECT_EQ(Basis::strmatch(text.c_str(), pattern.c_str()), expected) << text << pattern;
        EXPECT_EQ(Basis::strimatch(text.c_str(), pattern.c_str()), expected) << text << pattern;
    }
    EXPECT_TRUE(Basis::strimatch("-Type=in", "-TYPE=*"));
    EXPECT_FALSE(Basis::strmatch("-Type=in", "-TYPE=*"));
}

TEST(Functions, CompareAndReadNumbers) {
    EXPECT_EQ(Basis::stricmp("WireD", "wIRed"), 0);
    EXPECT_NE(Basis::stricmp("wire", "wired"), 0);
    EXPECT_EQ(Basis::strnicmp("WIRE_1", "wire_2", 5), 0);
    EXPECT_NE(Basis::strnicmp("WIRE_1", "wire_2", 6), 0);
    EXPECT_EQ(Basis::strnicmp("wi", "WI", 1000), 0);
    long value = 0;
    for (auto const &[text, number] : {std::pair{"0", 0}, {"-42", -42}, {"+7", 7}, {"007", 7}})
        EXPECT_TRUE(Basis::strtol(text, value) && value == number) << text;
    for (char const *const text : {"", "+", "-", "+-7", "7a", "7.0", "x", "99999999999999999999"})
        EXPECT_FALSE(Basis::strtol(text, value)) << text;
}

} // namespace
