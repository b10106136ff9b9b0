// Headers that golden/header-fields does not cover, and small functions on texts.

#include <string>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"

using namespace Vesk_Hdl;

namespace {

std::string Header(char const *purpose, char const *reference) {
    TextMemOutStream stream;
    NetlistHeader("app", "x/head.v", "cmd  x", "top", "dev", purpose, reference, false, stream)
        .Write();
    return std::string(stream.GetValue());
}

TEST(NetlistHeader, WrapsTextsThatHoldLineEnds) {
    auto const x = [](std::size_t count) { return std::string(count, 'x'); };
    for (auto const &[text, wrapped] : std::vector<std::pair<std::string, std::string>>{
             {" ", "//    \n"},
             {"a  b", "//    a b \n"},
             {x(73) + " a", "//    \n//    " + x(73) + " \n//    a \n"},
             {"a\n\nb\nc d", "//    a\n//    b \n//    c d \n"},
             {"a b\n", "//    a b\n//    \n"},
             {"\n", "//    \n//    \n"},
             // A word is measured with the line end in it.
             {x(40) + "\n" + x(32), "//    \n//    " + x(40) + "\n//    " + x(32) + " \n"},
             {"a\n" + x(70) + " b c", "//    a\n//    " + x(70) + " b \n//    c \n"}}) {
        std::string const header = Header(text.c_str(), "");
        EXPECT_EQ("//Device: dev\n//Purpose:\n" + wrapped + "//\n",
                  header.substr(header.find("//Device")))
            << text;
    }
}

TEST(NetlistHeader, StandsAloneInAFile) {
    TempDir const folder;
    std::string const path = folder.Path("head.v");
    WriteFile(path, "replaced");
    Engine::WriteOrvaneHeader("app", "cmd  x", "top", "dev", nullptr, "r", false, path.c_str());
    std::string const written = ReadFile(path);
    std::string const expected = Header("", "r");
    std::size_t const time = expected.find("Timestamp : ") + 12;
    EXPECT_EQ(expected.substr(0, time), written.substr(0, time));
    EXPECT_EQ(expected.substr(time + 19), written.substr(time + 19));
}

TEST(NetlistHeader, ShowsTheTimeOfTheOptions) {
    for (auto const &[moment, shown] :
         {std::pair<std::time_t, char const *>{0, "01/01/1970 00:00:00"},
          {1700000000, "11/14/2023 22:13:20"},
          {253402300799, "12/31/9999 23:59:59"}}) {
        Design design;
        design.model.GetOptions()->headerTime = moment;
        TextMemOutStream stream;
        HdlUtilities::WriteHeader("top", true, *design.model.GetOptions(), stream);
        EXPECT_NE(std::string(stream.GetValue()).find(std::string("Timestamp : ") + shown + "\n"),
                  std::string::npos);
    }
}

TEST(HdlUtilities, Texts) {
    for (auto const &[quoted, bare] :
         Pairs(R"(=; a'b=a'b; "a b"=a b; 'a'=a; "a="a; 'a"='a"; "'a'"='a'; '"a"'="a"; ''a''=a;)"
               R"("""a"=a; "=)"))
        EXPECT_EQ(bare, HdlUtilities::RemoveQuotes(quoted.c_str()).GetText()) << quoted;
    EXPECT_STREQ("", HdlUtilities::RemoveQuotes(nullptr));
    for (auto const &[name, dummy] :
         Pairs("A=A_DUMMY; A(3:0)=A_DUMMY(3:0); A(3)x=A_DUMMY(3); A(3=A(3_DUMMY; =_DUMMY"))
        EXPECT_EQ(dummy, HdlUtilities::AddDummySuffix(name.c_str()).GetText()) << name;
    Design design(CellsAnd("ADD INSTANCE ATTRIBUTE u1 Z 1; ADD INSTANCE ATTRIBUTE u1 A 2;"
                           "ADD COMPONENT ATTRIBUTE CELL C 3"));
    StringArray const names = HdlUtilities::GetAttrNames(design.netlist.GetInstance("u1"));
    EXPECT_STREQ("Z A", names.Concatenate(" "));
    EXPECT_EQ(0, HdlUtilities::GetAttrNames(nullptr).GetSize());
}

} // namespace
