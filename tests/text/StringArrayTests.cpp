#include "vesk_hdl/text/StringArray.h"

#include <cstring>
#include <string>

#include <gtest/gtest.h>

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// All strings, a bar after each.
std::string Bars(StringArray const &array) {
    std::string text;
    for (int i = 0; i < array.GetSize(); ++i)
        text += std::string(array[i]) + '|';
    return text;
}

StringArray FromBars(char const *text) {
    StringArray array;
    for (char const *bar; (bar = std::strchr(text, '|')); text = bar + 1)
        array.Add(std::string(text, bar).c_str());
    return array;
}

TEST(StringArray, ParsesCommandLines) {
    using Row = std::pair<char const *, char const *>;
    for (auto const &[text, tokens] :
         {Row{"   ", ""}, Row{"a\tb  c ", "a\tb|c|"}, Row{R"("")", ""}, Row{R"(")", ""},
          Row{R"(A "")", "A|"}, Row{R"("" )", "|"}, Row{R"("" "")", "|"},
          Row{R"(A "" '' B)", "A|||B|"}, Row{R"(a"b c"d)", R"(a"b|c"d|)"},
          Row{R"('a "b" c' d)", R"(a "b" c|d|)"}, Row{R"(  "a"  'b'  )", "a|b|"},
          Row{R"("ab"cd ef)", "abcd ef|"}, Row{R"(x "a"b" c)", "x|ab|c|"},
          Row{R"("x\"y" z)", R"(x"y|z|)"}, Row{R"("x\'y" z)", R"(x\'y|z|)"},
          Row{R"("x\\" z)", R"(x\" z|)"}, Row{R"("a\)", R"(a\|)"}, Row{R"(x "a b  )", "x|a b  |"},
          Row{R"(a\ "b" c\"d)", R"(a\|b|c\"d|)"}}) { // outside a quote a backslash is ordinary
        StringArray array = FromBars("kept|");
        int const count = array.Parse(text, " ", true, "\"\"''");
        EXPECT_EQ(Bars(array), std::string("kept|") + tokens) << text;
        EXPECT_EQ(count, array.GetSize() - 1) << text;
    }
}

TEST(StringArray, ReportsThePlacesOfTokens) {
    for (auto const &[text, skipEmpty, expected] :
         {std::tuple{"  a bc  d", true, "2-2 4-5 8-8 "},
          {R"(a "b c" ''  'd)", true, "0-0 2-6 8-9 12-13 "},
          {"a  b", false, "0-0 3-2 3-3 "},
          {R"("a"  b)", false, "0-2 5-4 5-5 "}}) {
        std::vector<Basis_Range> places;
        StringArray().Parse(text, " ", skipEmpty, "\"\"''", &places);
        std::string found;
        for (Basis_Range const &place : places)
            found += std::to_string(place.first) + "-" + std::to_string(place.last) + " ";
        EXPECT_EQ(found, expected) << text;
    }
}

TEST(StringArray, ParsesWithOtherSeparatorsAndPairs) {
    using Row = std::tuple<char const *, char const *, bool, char const *, char const *>;
    for (auto const &[text, separators, skipEmpty, pairs, tokens] :
         {Row{R"("a b")", " ", true, nullptr, R"("a|b"|)"},
          Row{R"("a b")", " ", true, "\"", R"("a|b"|)"}, // one character is no pair
          Row{"(a (b\\) c) )d(", " ", true, "()", "a (b) c|)d(|"},
          Row{"[a) b] (c] d)", " ", true, "()[]", "a) b|c] d|"},
          Row{"a:'b.c'.d", ":.", true, "''", "a|b.c|d|"}, Row{":a::b:", ":", false, "''", "|a||b|"},
          Row{":a::'b':", ":", false, "''", "|a||b|"}})
        EXPECT_EQ(Bars({text, separators, skipEmpty, pairs}), tokens) << text;
}

TEST(StringArray, IndexesOutsideAreHarmless) {
    StringArray array = FromBars("a|b|");
    for (int const index : {-1, 2, 1000000})
        EXPECT_STREQ(array.GetAt(index), "") << index;
    array.SetAt(-1, "x");
    array.SetAt(1, "c");
    StringArray const copy(array);
    array.SetAt(4, array.At(0)); // the array moves under its own string
    array = *&array;
    EXPECT_EQ(array.Add(array.At(1)), 5);
    array.Add(copy);
    EXPECT_STREQ(array.Concatenate(", "), "a, c, , , a, c, a, c");
    EXPECT_STREQ(copy.Concatenate(""), "ac");
}

TEST(StringArray, Contains) {
    using Row = std::tuple<char const *, char const *, bool, bool>;
    for (auto const &[array, wanted, exactly, ignoringCase] :
         {Row{"", "", true, true}, Row{"a|b|c|", "c|a|", true, true},
          Row{"a|b|", "B|a|", false, true}, Row{"a|b|", "a|ab|", false, false},
          Row{"a|b|", "a|a|", true, true}, Row{"a|", "a|a|", false, false}}) {
        EXPECT_EQ(FromBars(array).Contains(FromBars(wanted)), exactly) << wanted;
        EXPECT_EQ(FromBars(array).IContains(FromBars(wanted)), ignoringCase) << wanted;
    }
}

TEST(StringArray, ReadsIntegers) {
    StringArray const array = FromBars("12||-3|4x|99999999999999999999|4294967303|");
    int value = 99;
    EXPECT_TRUE(array.GetIntAt(0, value, 5) && value == 12);
    EXPECT_TRUE(array.GetIntAt(2, value, 5) && value == -3);
    for (int const index : {1, 3, 4, 6, -1})
        EXPECT_TRUE(!array.GetIntAt(index, value, 5) && value == -3) << index;
    EXPECT_TRUE(array.GetIntAt(5, value, 5) && value == 7); // more than an int holds: converted
}

TEST(StringArray, Sorts) {
    StringArray array = FromBars("b|\xE4|ab|B|a||a\x7F|a\x80|");
    array.Sort();
    EXPECT_EQ(Bars(array), "|B|a|ab|a\x7F|a\x80|b|\xE4|");
    array = FromBars("a|ccc|bb||dddd|");
    array.Sort([](Text const &a, Text const &b, void *) { return a.GetLength() > b.GetLength(); },
               nullptr);
    EXPECT_EQ(Bars(array), "dddd|ccc|bb|a||");
}

} // namespace
