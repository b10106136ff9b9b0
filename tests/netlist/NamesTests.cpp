#include "vesk_hdl/netlist/Names.h"

#include <cstdlib>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

std::string Members(char const *name, bool expandBuses) {
    StringArray members;
    CompoundBus::ParseCompoundBusName(name, members, expandBuses);
    return members.Concatenate(" ").GetText();
}

/// The form of a name and its parts, "" if it has none. A "walk" gives the parts of a bus name
/// although the name is not one.
std::string Parsed(char const *name) {
    Text a = "?", b = "?", c = "?";
    std::string form;
    if (Bus::ParseBusName(name, a, b, c))
        form = Text::doFormat("%s %s %s %s", Bus::IsBusName(name) ? "bus" : "walk", a.GetText(),
                              b.GetText(), c.GetText());
    else if (Bus::IsBusName(name))
        form = "a bus that cannot be parsed";
    if (BusIndex::ParseBusIndexName(name, a, b))
        form += Text::doFormat("index %s %s", a.GetText(), b.GetText());
    else if (form.empty() && !(a == "?" && b == "?" && c == "?"))
        form = "outputs of a refused name changed";
    EXPECT_EQ(form.find("index") == 0, BusIndex::IsBusIndexName(name)) << name;
    if (CompoundBus::IsCompoundBusName(name))
        form += "members ";
    return form + Members(name, false);
}

TEST(Names, ParsersAgreeWithTheGrammar) {
    for (auto const &[name, parsed] :
         Pairs("D(7:0)=bus D 7 0; D(0:7)=bus D 0 7; D(+3:-03)=bus D +3 -03; 'q_1(1:0)=bus 'q_1 1 0;"
               "D(3)=index D 3; D(-1)=index D -1; A,B=members A B; A\\B,C=members A B C;"
               "A,D(3:0),E(2)=members A D(3:0) E(2); A,,B=members A B; ,A,B=members A B;"
               "D(3:0)\\A=members D(3:0) A;"
               // A walk from token to token skips marks in front of a token.
               "D(:3:0)=walk D 3 0; (D(3:0)=walk D 3 0; D(3:)0)=walk D 3 0; D()3)=index D 3;"
               "(D(3)=index D 3; A,(D(3)=members A (D(3); A,D(:3:0)=;"
               // What has no form.
               "=;A=;D(7:0)x=;D(7:)=;D(:0)=;(7:0)=;9D(7:0)=;a'b(7:0)=;D(a:0)=;D(7:0=;D(3:0))=;"
               "D( 3:0)=;D:3(1:0)=;D[7:0]=;D<7-0>=;D(3::0)=;D((3:0)=;D((3)=;D(3)x=;D(1.5)=;D(3=;"
               "D)3(=;A,=;,A\\=;A,B c=;A,9=;A,D[1]=;D(@:0)=;@(1)=;[(1)=;`(1)=;{(1)="))
        EXPECT_EQ(parsed, Parsed(name.c_str())) << name;
    EXPECT_FALSE(Object::IsValidBaseName(nullptr));
}

TEST(Names, BaseNamesAndRewriting) {
    using Row = std::tuple<char const *, char const *, char const *>;
    for (auto const &[typed, stored, base] :
         {Row{"a[1]-b", "a(1):b", "a"}, Row{"D{7-0}", "D(7:0)", "D"}, Row{"D<3>", "D(3)", "D"},
          Row{"]}>[{<--", ")))(((::", ")))"}, Row{"CLK", "CLK", "CLK"}, Row{"(7:0)", "(7:0)", ""},
          Row{"A,D[1]", "A,D(1)", "A,D(1)"}, Row{"D(3", "D(3", "D(3"}, Row{"D)3(", "D)3(", "D)3"},
          Row{"D(3:0)\\A", "D(3:0)\\A", "D"}, Row{nullptr, "", ""}}) {
        EXPECT_STREQ(stored, ScalarSignal(typed).GetName());
        Text name(typed);
        Object::NormalizeName(name);
        EXPECT_STREQ(stored, name);
        EXPECT_STREQ(base, Object::GetBaseName(typed)) << stored;
    }
}

TEST(Names, BoundsAreReadAsAtoiDoes) {
    Text base = "?";
    int left = 5;
    int right = 6;
    EXPECT_FALSE(Bus::ParseBusName("D(7)", base, left, right));
    EXPECT_FALSE(BusIndex::ParseBusIndexName("D(7:0)", base, left));
    EXPECT_TRUE(base == "?" && left == 5 && right == 6);
    for (char const *const bound :
         {"7", "+3", "-3", "007", "2147483647", "-2147483648", "2147483648", "4294967299",
          "99999999999999999999", "-99999999999999999999"}) {
        EXPECT_TRUE(Bus::ParseBusName(Text::doFormat("D(%s:0)", bound), base, left, right));
        EXPECT_TRUE(base == "D" && left == std::atoi(bound) && right == 0) << bound;
        EXPECT_TRUE(BusIndex::ParseBusIndexName(Text::doFormat("E(%s)", bound), base, left));
        EXPECT_TRUE(base == "E" && left == std::atoi(bound)) << bound;
    }
}

TEST(Names, BusesExpandFromLeftToRight) {
    StringArray bits;
    bits.Add("kept");
    for (char const *const name : {"D(2:0)", "D(0:2)", "D(5:5)", "D(+1:-01)"})
        EXPECT_TRUE(Bus::ParseBusName(name, bits)) << name;
    for (char const *const name : {"D(3)", "D[1:0]", "D(:3:0)"})
        EXPECT_FALSE(Bus::ParseBusName(name, bits)) << name;
    EXPECT_STREQ("kept D(2) D(1) D(0) D(0) D(1) D(2) D(5) D(1) D(0) D(-1)", bits.Concatenate(" "));
    EXPECT_EQ("A D(1) D(0) E(2)", Members("A,D(1:0)\\E(2)", true));
    EXPECT_EQ("", Members("D(1:0)", true));
}

TEST(Names, SliceNamesCountFromTheLeftBound) {
    using Row = std::tuple<char const *, int, int, char const *>;
    for (auto const &[bus, start, count, slice] :
         {Row{"D(7:0)", 2, 1, "D(5)"}, Row{"D(7:0)", 2, 0, "D(5)"}, Row{"D(7:0)", 2, 3, "D(5:3)"},
          Row{"D(7:0)", 0, 8, "D(7:0)"}, Row{"D(7:0)", 6, 3, ""}, Row{"D(7:0)", 8, 0, ""},
          Row{"D(7:0)", 2147483647, 2147483647, ""}, Row{"D(0:7)", 2, 3, "D(2:4)"},
          Row{"D(07:+0)", 0, 2, "D(7:6)"}, Row{"D(5:5)", 0, 1, "D(5)"}, Row{"CLK", 0, 1, ""},
          Row{"D(3)", 0, 1, ""}, Row{"D(2147483647:-2147483648)", 2147483647, 2, "D(0:-1)"},
          Row{"D(-2147483648:2147483647)", 2147483647, 1, "D(-1)"}})
        EXPECT_STREQ(slice, Bus::GetBusSliceName(bus, start, count))
            << bus << ' ' << start << ' ' << count;
}

TEST(Names, WidthsAndDirections) {
    using Row = std::tuple<char const *, int, bool>;
    for (auto const &[name, width, isDownTo] :
         {Row{"D(3:0)", 4, true}, Row{"D(0:3)", 4, false}, Row{"D(2:2)", 1, false},
          Row{"D(3:-3)", 0, false}, // in an object a name loses its hyphens
          Row{"D", 0, false}, Row{"D(2147483646:0)", 2147483647, true},
          Row{"D(2147483647:0)", 2147483647, true}, // the largest int
          Row{"D(2147483648:2147483647)", 2147483647, false}}) {
        Bus const bus(name);
        BusPin const pin(name, Polarity::INPUT);
        EXPECT_TRUE(bus.GetWidth() == width && pin.GetWidth() == width) << name;
        EXPECT_TRUE(bus.IsDownTo() == isDownTo && pin.IsDownTo() == isDownTo) << name;
    }
}

} // namespace
