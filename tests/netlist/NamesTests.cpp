#include "vesk_hdl/netlist/Names.h"

#include <cstdlib>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

std::string Join(StringArray const &strings) { return strings.Concatenate(" ").GetText(); }

std::string BusParts(char const *name) {
    Text base = "?";
    Text left = "?";
    Text right = "?";
    bool const parsed = Bus::ParseBusName(name, base, left, right);
    std::string const parts = std::string(base) + "|" + left.GetText() + "|" + right.GetText();
    return parsed ? parts : parts == "?|?|?" ? "" : "outputs of a refused name changed";
}

std::string IndexParts(char const *name) {
    Text base = "?";
    Text index = "?";
    bool const parsed = BusIndex::ParseBusIndexName(name, base, index);
    std::string const parts = std::string(base) + "|" + index.GetText();
    return parsed ? parts : parts == "?|?" ? "" : "outputs of a refused name changed";
}

std::string CompoundParts(char const *name, bool expandBuses) {
    StringArray members;
    CompoundBus::ParseCompoundBusName(name, members, expandBuses);
    return Join(members);
}

TEST(Names, ParsersAgreeWithTheGrammar) {
    struct Row {
        char const *name;
        bool isBus;
        char const *busParts; ///< of the walk from token to token, "" for no bus name
        char const *indexParts;
        char const *compound; ///< the members, "" for no compound name
        char const *baseName;
    };
    for (Row const &row : std::vector<Row>{
             {"D(7:0)", true, "D|7|0", "", "", "D"},
             {"D(0:7)", true, "D|0|7", "", "", "D"},
             {"D(5:5)", true, "D|5|5", "", "", "D"},
             {"D(+3:-3)", true, "D|+3|-3", "", "", "D"},
             {"D(07:00)", true, "D|07|00", "", "", "D"},
             {"'q_1(1:0)", true, "'q_1|1|0", "", "", "'q_1"},
             {"D(7:0)x", false, "", "", "", "D"},
             {"D(7:)", false, "", "", "", "D"},
             {"D(:0)", false, "", "", "", "D"},
             {"(7:0)", false, "", "", "", ""},
             {"9D(7:0)", false, "", "", "", "9D"},
             {"a'b(7:0)", false, "", "", "", "a'b"},
             {"D(a:0)", false, "", "", "", "D"},
             {"D(7:0", false, "", "", "", "D(7:0"},
             {"D(3:0))", false, "", "", "", "D"},
             {"D( 3:0)", false, "", "", "", "D"},
             {"D:3(1:0)", false, "", "", "", "D:3"},
             {"D[7:0]", false, "", "", "", "D"}, // rewriting is the caller's, but for base names
             {"D<7-0>", false, "", "", "", "D"},
             // A walk from token to token skips marks in front of a token.
             {"D(:3:0)", false, "D|3|0", "", "", "D"},
             {"(D(3:0)", false, "D|3|0", "", "", ""},
             {"D(3:)0)", false, "D|3|0", "", "", "D"},
             {"D(3::0)", false, "", "", "", "D"},
             {"D((3:0)", false, "", "", "", "D"},
             {"D(3)", false, "", "D|3", "", "D"},
             {"D(-1)", false, "", "D|-1", "", "D"},
             {"D()3)", false, "", "D|3", "", "D"},
             {"(D(3)", false, "", "D|3", "", ""},
             {"D((3)", false, "", "", "", "D"},
             {"D(3)x", false, "", "", "", "D"},
             {"D(1.5)", false, "", "", "", "D"},
             {"D(3", false, "", "", "", "D(3"},
             {"D)3(", false, "", "", "", "D)3"}, // the order of the brackets plays no part
             {"A", false, "", "", "", "A"},
             {"", false, "", "", "", ""},
             {"A,B", false, "", "", "A B", "A,B"},
             {"A\\B,C", false, "", "", "A B C", "A\\B,C"},
             {"A,D(3:0),E(2)", false, "", "", "A D(3:0) E(2)", "A,D(3:0),E(2)"},
             {"A,", false, "", "", "", "A,"},
             {"A,,B", false, "", "", "A B", "A,,B"},
             {",A\\", false, "", "", "", ",A\\"},
             {",A,B", false, "", "", "A B", ",A,B"},
             {"A,B c", false, "", "", "", "A,B c"},
             {"A,9", false, "", "", "", "A,9"},
             {"A,D[1]", false, "", "", "", "A,D(1)"},
             {"A,(D(3)", false, "", "", "A (D(3)", "A,(D(3)"}, // members: the walk for an index,
             {"A,D(:3:0)", false, "", "", "", "A,D(:3:0)"},    // the first marks for a bus
             {"D(3:0)\\A", false, "", "", "D(3:0) A", "D"}}) {
        EXPECT_EQ(row.isBus, Bus::IsBusName(row.name)) << row.name;
        EXPECT_EQ(row.busParts, BusParts(row.name)) << row.name;
        EXPECT_EQ(row.indexParts, IndexParts(row.name)) << row.name;
        EXPECT_EQ(row.indexParts[0] != '\0', BusIndex::IsBusIndexName(row.name)) << row.name;
        EXPECT_EQ(row.compound[0] != '\0', CompoundBus::IsCompoundBusName(row.name)) << row.name;
        EXPECT_EQ(row.compound, CompoundParts(row.name, false)) << row.name;
        EXPECT_STREQ(row.baseName, Object::GetBaseName(row.name)) << row.name;
    }
}

TEST(Names, BoundsAreReadAsAtoiDoes) {
    for (char const *const bound :
         {"7", "+3", "-3", "007", "2147483647", "-2147483648", "2147483648", "4294967299",
          "99999999999999999999", "-99999999999999999999"}) {
        Text base;
        int left = 1;
        int right = 1;
        Text const range = Text::doFormat("D(%s:0)", bound);
        ASSERT_TRUE(Bus::ParseBusName(range, base, left, right)) << bound;
        EXPECT_EQ(std::atoi(bound), left) << bound;
        EXPECT_EQ(0, right) << bound;
        ASSERT_TRUE(BusIndex::ParseBusIndexName(Text::doFormat("D(%s)", bound), base, left));
        EXPECT_EQ(std::atoi(bound), left) << bound;
    }
    Text base = "?";
    int left = 5;
    int right = 6;
    EXPECT_FALSE(Bus::ParseBusName("D(7)", base, left, right));
    EXPECT_FALSE(BusIndex::ParseBusIndexName("D(7:0)", base, left));
    EXPECT_TRUE(base == "?" && left == 5 && right == 6);
}

/// All texts of up to four characters that stand for the kinds that matter.
template <class Act> void ForEachShortText(Act act) {
    std::string const characters = "azAZ09_'+-(@[`{ \x80";
    std::vector<std::string> texts = {""};
    for (std::size_t i = 0; i < texts.size(); ++i) {
        act(texts[i]);
        if (texts[i].size() < 4)
            for (char const c : characters)
                texts.push_back(texts[i] + c);
    }
}

TEST(Names, ScannersMatchWhatTheExpressionsMatch) {
    Basis_Regexp const baseName("[A-Za-z'_][A-Za-z0-9_]*");
    Basis_Regexp const integer("[+-]?[0-9]+");
    auto const isWhole = [](Text const &text, Basis_Regexp const &expression) {
        Basis_Range const range = text.GetRangeOfMatch(expression);
        return range.first == 0 && range.last + 1 == text.GetLength();
    };
    int matches = 0;
    ForEachShortText([&](std::string const &text) {
        Text const string(text.c_str());
        matches += isWhole(string, baseName) + isWhole(string, integer);
        ASSERT_EQ(isWhole(string, baseName), Object::IsValidBaseName(text.c_str())) << text;
        ASSERT_EQ(isWhole(string, integer), Object::IsValidIntegerString(string)) << text;
    });
    // Of 17 characters 6 may begin a base name and 7 go on; 2 are digits, 2 signs.
    EXPECT_EQ(6 * (1 + 7 + 49 + 343) + (2 + 4 + 8 + 16) + 2 * (2 + 4 + 8), matches);
    EXPECT_FALSE(Object::IsValidBaseName(nullptr));
}

TEST(Names, RewritingTurnsBracketsAndHyphens) {
    struct Row {
        char const *typed;
        char const *stored;
    };
    for (Row const &row : std::vector<Row>{{"a[1]-b", "a(1):b"},
                                           {"D{7-0}", "D(7:0)"},
                                           {"D<7-0>", "D(7:0)"},
                                           {"]}>[{<--", ")))(((::"},
                                           {"CLK", "CLK"},
                                           {nullptr, ""}}) {
        ScalarSignal const signal(row.typed);
        EXPECT_STREQ(row.stored, signal.GetName());
        Text name(row.typed);
        Object::NormalizeName(name);
        EXPECT_STREQ(row.stored, name);
    }
    EXPECT_STREQ("", Object::GetBaseName(nullptr));
}

TEST(Names, BusesExpandFromLeftToRight) {
    StringArray bits;
    bits.Add("kept");
    for (char const *const name : {"D(2:0)", "D(0:2)", "D(5:5)", "D(+1:-01)"})
        EXPECT_TRUE(Bus::ParseBusName(name, bits)) << name;
    for (char const *const name : {"D(3)", "D[1:0]", "D(:3:0)"})
        EXPECT_FALSE(Bus::ParseBusName(name, bits)) << name;
    EXPECT_EQ("kept D(2) D(1) D(0) D(0) D(1) D(2) D(5) D(1) D(0) D(-1)", Join(bits));
    EXPECT_EQ("A D(1) D(0) E(2)", CompoundParts("A,D(1:0)\\E(2)", true));
    EXPECT_EQ("", CompoundParts("D(1:0)", true));
}

TEST(Names, SliceNamesCountFromTheLeftBound) {
    struct Row {
        char const *bus;
        int start;
        int count;
        char const *slice;
    };
    for (Row const &row : std::vector<Row>{{"D(7:0)", 2, 1, "D(5)"},
                                           {"D(7:0)", 2, 0, "D(5)"},
                                           {"D(7:0)", 2, 3, "D(5:3)"},
                                           {"D(7:0)", 0, 8, "D(7:0)"},
                                           {"D(7:0)", 6, 3, ""},
                                           {"D(7:0)", 8, 0, ""},
                                           {"D(7:0)", 2147483647, 2147483647, ""},
                                           {"D(0:7)", 2, 3, "D(2:4)"},
                                           {"D(07:+0)", 0, 2, "D(7:6)"},
                                           {"D(5:5)", 0, 1, "D(5)"},
                                           {"CLK", 0, 1, ""},
                                           {"D(3)", 0, 1, ""},
                                           {"D(2147483647:-2147483648)", 2147483647, 2, "D(0:-1)"},
                                           {"D(-2147483648:2147483647)", 2147483647, 1, "D(-1)"}})
        EXPECT_STREQ(row.slice, Bus::GetBusSliceName(row.bus, row.start, row.count))
            << row.bus << ' ' << row.start << ' ' << row.count;
}

TEST(Names, WidthsAndDirections) {
    struct Row {
        char const *name;
        int width;
        bool isDownTo;
    };
    for (Row const &row :
         std::vector<Row>{{"D(3:0)", 4, true},
                          {"D(0:3)", 4, false},
                          {"D(2:2)", 1, false},
                          {"D(3:-3)", 0, false}, // a name that enters an object loses its hyphens
                          {"D", 0, false},
                          {"D(3)", 0, false},
                          {"D(2147483646:0)", 2147483647, true},
                          {"D(2147483647:0)", 2147483647, true}, // all an int can tell
                          {"D(2147483648:2147483647)", 2147483647, false}}) {
        Bus bus(row.name);
        EXPECT_EQ(row.width, bus.GetWidth()) << row.name;
        EXPECT_EQ(row.isDownTo, bus.IsDownTo()) << row.name;
        BusSlice const slice(row.name, &bus);
        EXPECT_EQ(row.width, slice.GetWidth()) << row.name;
        EXPECT_EQ(row.isDownTo, slice.IsDownTo()) << row.name;
        BusPin const pin(row.name, Polarity::INPUT);
        EXPECT_EQ(row.width, pin.GetWidth()) << row.name;
        EXPECT_EQ(row.isDownTo, pin.IsDownTo()) << row.name;
    }
}

} // namespace
