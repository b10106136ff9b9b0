#include "vesk_hdl/text/StringArray.h"

#include <cstring>
#include <string>

#include <gtest/gtest.h>

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

/// All strings, a bar behind each.
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
    for (auto const &[text, tokens] :
         {std::pair{"", ""},
          {"   ", ""},
          {"a\tb  c ", "a\tb|c|"},
          {R"("")", ""},
          {R"(")", ""},
          {R"(A "")", "A|"},
          {R"("" )", "|"},
          {R"("" "")", "|"},
          {R"(" ")", " |"},
          {R"(A "" '' B)", "A|||B|"},
          {R"(ADD COMPONENT  "a b" c)", "ADD|COMPONENT|a b|c|"},
          {R"(a"b c"d)", R"(a"b|c"d|)"},
          {R"('a "b" c' d)", R"(a "b" c|d|)"},
          {R"(  "a"  'b'  )", "a|b|"},
          {R"("ab"cd ef)", "abcd ef|"},
          {R"(x "a"b" c)", "x|ab|c|"},
          {R"("x\"y" z)", R"(x"y|z|)"},
          {R"("x\'y" z)", R"(x\'y|z|)"},
          {R"("a\b" c)", R"(a\b|c|)"},
          {R"("x\\" z)", R"(x\" z|)"},
          {R"("a\)", R"(a\|)"},
          {R"(x "a b  )", "x|a b  |"},
          {R"(a\ "b" c\"d)", R"(a\|b|c\"d|)"}}) { // outside a quote a backslash is ordinary
        StringArray array = FromBars("kept|");
        int const count = array.Parse(text, " ", true, "\"\"''");
        EXPECT_EQ(Bars(array), std::string("kept|") + tokens) << text;
        EXPECT_EQ(count, array.GetSize() - 1) << text;
    }
}

TEST(StringArray, ParsesWithOtherSeparatorsAndPairs) {
    struct Row {
        char const *text, *separators, *pairs, *tokens;
        bool skipEmpty = true;
    };
    for (Row const &row :
         {Row{R"("a b")", " ", nullptr, R"("a|b"|)"}, Row{R"("a b")", " ", "", R"("a|b"|)"},
          Row{R"("a b")", " ", "\"", R"("a|b"|)"}, // one character is no pair
          Row{R"('a b' "c d")", " ", "\"\"'", "'a|b'|c d|"},
          Row{"(a (b\\) c) )d(", " ", "()", "a (b) c|)d(|"},
          Row{"[a) b] (c] d)", " ", "()[]", "a) b|c] d|"}, Row{"a:'b.c'.d", ":.", "''", "a|b.c|d|"},
          Row{":a::b:", ":", "''", "|a||b|", false}, Row{":a::'b':", ":", "''", "|a||b|", false}})
        EXPECT_EQ(Bars({row.text, row.separators, row.skipEmpty, row.pairs}), row.tokens)
            << row.text << " with pairs " << (row.pairs ? row.pairs : "null");
}

TEST(StringArray, IndexesOutsideAreHarmless) {
    StringArray array = FromBars("a|b|");
    for (int const index : {-1, 2, 1000000})
        EXPECT_STREQ(array.GetAt(index), "") << index;
    array.SetAt(-1, "x");
    array.SetAt(1, "c");
    StringArray const copy(array);
    array.SetAt(4, array.At(0)); // the array moves under its own string
    EXPECT_EQ(Bars(array), "a|c|||a|");
    EXPECT_EQ(Bars(copy), "a|c|");
    StringArray &same = array;
    array = same;
    EXPECT_EQ(array.Add(array.At(1)), 5);
    array.Add(copy);
    EXPECT_STREQ(array.Concatenate(", "), "a, c, , , a, c, a, c");
    EXPECT_STREQ(copy.Concatenate(""), "ac");
    array.Empty();
    EXPECT_TRUE(array.IsEmpty());
    EXPECT_STREQ(array.Concatenate(", "), "");
}

TEST(StringArray, Contains) {
    struct Row {
        char const *array, *wanted;
        bool exactly, ignoringCase;
    };
    for (Row const &row : {Row{"a|", "", true, true}, Row{"", "", true, true},
                           Row{"", "a|", false, false}, Row{"a|b|c|", "c|a|", true, true},
                           Row{"a|b|", "B|a|", false, true}, Row{"a|b|", "a|ab|", false, false},
                           Row{"a|b|", "a|a|", true, true}, Row{"a|", "a|a|", false, false}}) {
        SCOPED_TRACE(testing::Message() << row.wanted << " in " << row.array);
        EXPECT_EQ(FromBars(row.array).Contains(FromBars(row.wanted)), row.exactly);
        EXPECT_EQ(FromBars(row.array).IContains(FromBars(row.wanted)), row.ignoringCase);
    }
}

TEST(StringArray, ReadsIntegers) {
    StringArray const array = FromBars("12||-3|4x|");
    int value = 99;
    EXPECT_TRUE(array.GetIntAt(0, value, 5) && value == 12);
    EXPECT_TRUE(array.GetIntAt(2, value, 5) && value == -3);
    for (int const index : {1, 3, 4, -1})
        EXPECT_TRUE(!array.GetIntAt(index, value, 5) && value == -3) << index;
}

TEST(StringArray, Sorts) {
    StringArray array = FromBars("b|\xE4|ab|B|a||a\x7F|a\x80|");
    array.Sort();
    EXPECT_EQ(Bars(array), "|B|a|ab|a\x7F|a\x80|b|\xE4|");
    auto longerFirst = [](Text const &a, Text const &b, void *calls) {
        ++*static_cast<int *>(calls);
        return a.GetLength() > b.GetLength();
    };
    int calls = 0;
    StringArray().Sort(longerFirst, &calls);
    EXPECT_EQ(calls, 0);
    array = FromBars("a|ccc|bb||dddd|");
    array.Sort(longerFirst, &calls);
    EXPECT_EQ(Bars(array), "dddd|ccc|bb|a||");
}

} // namespace
