#include <string>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"

using namespace Vesk_Hdl;

namespace {

Lines LinesOf(std::string const &text) {
    Lines lines(1);
    for (char const c : text)
        if (c == '\n')
            lines.emplace_back();
        else
            lines.back() += c;
    EXPECT_EQ("", lines.back()) << "no line end behind the last line";
    lines.pop_back();
    return lines;
}

Lines Header(bool isVhdl, char const *fileName, char const *device, char const *purpose,
             char const *reference) {
    TextMemOutStream stream;
    NetlistHeader("app", fileName, "cmd  x", "top", device, purpose, reference, isVhdl, stream)
        .Write();
    return LinesOf(std::string(stream.GetValue()));
}

TEST(NetlistHeader, KeepsToItsGeometry) {
    for (bool const isVhdl : {true, false}) {
        std::string const mark = isVhdl ? "--" : "//";
        Lines const lines = Header(isVhdl, "C:/x/y.vhd", "", "", "");
        ASSERT_EQ(16U, lines.size());
        for (std::string const &line : lines)
            EXPECT_EQ(mark, line.substr(0, 2));
        EXPECT_EQ(std::string(80, mark[0]), lines[0]);
        EXPECT_EQ(mark + " ", lines[1].substr(0, 3));
        EXPECT_EQ(lines[0], lines[2]);
        for (auto const &[row, length] : {std::pair(3, 14), {4, 14}, {10, 13}, {11, 14}})
            EXPECT_EQ(2U + length, lines[row].size()) << row;
        EXPECT_EQ("Vendor: Orvane ", lines[5].substr(18));
        EXPECT_EQ("Version : ", lines[6].substr(18, 10));
        EXPECT_STREQ(HdlUtilities::GetVersion(), lines[6].c_str() + 28);
        EXPECT_EQ("Application : app", lines[7].substr(18));
        EXPECT_EQ("Filename : y.vhd", lines[8].substr(18));
        EXPECT_EQ("Timestamp : ", lines[9].substr(18, 12));
        EXPECT_EQ(Lines({mark, mark + "Command: cmd  x", mark + "Design Name: top", mark}),
                  Lines(lines.begin() + 12, lines.end()));
    }
}

TEST(NetlistHeader, WritesOptionalFields) {
    Lines const lines = Header(false, "", "dev", "p", "r");
    EXPECT_EQ("Filename : ", lines[8].substr(18));
    EXPECT_EQ(Lines({"//Device: dev", "//Purpose:", "//    p ", "//Reference", "//    r ", "//"}),
              Lines(lines.begin() + 15, lines.end()));
}

TEST(NetlistHeader, Wraps) {
    auto const x = [](std::size_t count) { return std::string(count, 'x'); };
    /// Texts and their lines behind mark and four blanks.
    for (auto const &[text, wrapped] : std::vector<std::pair<std::string, Lines>>{
             {" ", {""}},
             {"a  b", {"a b "}},
             {x(63) + " 12345678 c", {x(63) + " 12345678 ", "c "}},
             {x(63) + " 123456789 c", {x(63) + " ", "123456789 c "}},
             {x(72) + " a", {x(72) + " ", "a "}},
             {x(73) + " a", {"", x(73) + " ", "a "}},
             {"a " + x(200), {"a ", x(200) + " "}},
             {"a\n\nb\nc d", {"a", "b ", "c d "}},
             {"a b\n", {"a b", ""}},
             {"\n", {"", ""}},
             {x(40) + "\n" + x(32), {"", x(40), x(32) + " "}}, // the word is measured whole
             {"a\n" + x(70) + " b c", {"a", x(70) + " b ", "c "}},
         }) {
        Lines expected = {"--Purpose:"};
        for (std::string const &line : wrapped)
            expected.push_back("--    " + line);
        expected.emplace_back("--");
        Lines const lines = Header(true, "", "", text.c_str(), "");
        EXPECT_EQ(expected, Lines(lines.begin() + 15, lines.end())) << text;
    }
}

TEST(NetlistHeader, StandsAloneInAFile) {
    TempDir const folder;
    std::string const path = folder.Path("head.v");
    WriteFile(path, "replaced");
    Engine::WriteOrvaneHeader("app", "cmd  x", "top", "dev", nullptr, "r", false, path.c_str());
    Lines lines = LinesOf(ReadFile(path));
    Lines expected = Header(false, "head.v", "dev", "", "r");
    ASSERT_EQ(expected.size(), lines.size());
    lines[9] = expected[9] = ""; // the time
    EXPECT_EQ(expected, lines);
}

TEST(HdlUtilities, Texts) {
    using Pairs = std::vector<std::pair<char const *, char const *>>;
    for (auto const &[quoted, bare] : Pairs{{"", ""},
                                            {"a'b", "a'b"},
                                            {"\"a b\"", "a b"},
                                            {"'a'", "a"},
                                            {"\"a", "\"a"},
                                            {"'a\"", "'a\""},
                                            {"\"'a'\"", "'a'"},
                                            {"'\"a\"'", "\"a\""},
                                            {"''a''", "a"},
                                            {"\"\"\"a\"", "a"},
                                            {"\"", ""},
                                            {"'", ""},
                                            {nullptr, ""}})
        EXPECT_STREQ(bare, HdlUtilities::RemoveQuotes(quoted)) << (quoted ? quoted : "null");
    for (auto const &[name, dummy] : Pairs{{"A", "A_DUMMY"},
                                           {"A(3:0)", "A_DUMMY(3:0)"},
                                           {"A(3)x", "A_DUMMY(3)"},
                                           {"A(3", "A(3_DUMMY"},
                                           {"", "_DUMMY"}})
        EXPECT_STREQ(dummy, HdlUtilities::AddDummySuffix(name));
    for (int const base : {2, 8, 10, 16, -1}) {
        char const *const letter = base == 2 ? "b" : base == 8 ? "o" : nullptr;
        EXPECT_STREQ(letter ? letter : "x", HdlUtilities::ConvertVhdlBase(base));
        EXPECT_STREQ(letter ? letter : "h", HdlUtilities::ConvertVerilogBase(base));
    }
    EXPECT_EQ(19U, HdlUtilities::CurrentTimeString().GetLength());

    Design design(CellsAnd({"ADD INSTANCE ATTRIBUTE u1 Z 1", "ADD INSTANCE ATTRIBUTE u1 A 2",
                            "ADD COMPONENT ATTRIBUTE CELL C 3"}));
    StringArray const names = HdlUtilities::GetAttrNames(design.netlist.GetInstance("u1"));
    EXPECT_STREQ("Z A", names.Concatenate(" "));
    EXPECT_EQ(0, HdlUtilities::GetAttrNames(nullptr).GetSize());
}

} // namespace
