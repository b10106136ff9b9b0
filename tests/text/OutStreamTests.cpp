#include "vesk_hdl/text/OutStream.h"

#include <cerrno>
#include <random>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/NaiveFile.h"
#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"
#include "vesk_hdl/text/StringArray.h"

using namespace Vesk_Hdl;
using Strings = std::vector<std::string>;

namespace {

std::string const SIX(6, ' ');
std::string const A60(60, 'a');
std::string const A99(99, 'a');

struct Fixture {
    TempDir folder;
    std::string path = folder.Path("out");
    TextFileOutStream stream{path.c_str(), false};

    void Put(std::string const &piece) {
        piece == ">"   ? stream.Indent()
        : piece == "<" ? stream.Unindent()
        : piece == "!" ? void(stream << OutStream::FLUSH)
        : piece == "7" ? void(stream << 7)
                       : void(stream << piece.c_str());
    }
    std::string Close() {
        stream.Close();
        return ReadFile(path);
    }
};

TEST(TextFileOutStream, FoldsLikeTheNaiveFile) {
    std::string const all = " | |,|, |name|b-|-c|7|  two words, |x,y,z|\n|a\nb c|\n\n|>|<|<|!|" +
                            A60 + "12345678901234567890|" + A99 + "|" + A60 + "|--| -- c|/|/*";
    StringArray const pieces(all.c_str(), "|", true, nullptr);
    for (unsigned int seed = 0; seed < 300; ++seed) {
        std::mt19937 random(seed);
        NaiveFile naive;
        Fixture file;
        for (int step = 0; step < 300; ++step) {
            int const comments = random() % 4 ? 0 : 4;
            std::string const piece(pieces[static_cast<int>(random() % 20) + comments]);
            file.Put(piece);
            piece == ">"   ? naive.Indent()
            : piece == "<" ? naive.Unindent()
            : piece == "!" ? naive.Flush()
                           : naive.Write(piece);
            if (step % 100 == 50) { // what closing leaves of the line would be seen in the next one
                file.stream.Close();
                naive.Flush();
                file.stream << "dropped\n" << 1 << OutStream::NEW_LINE;
                file.stream.Open(file.path.c_str(), true);
            }
        }
        naive.Flush();
        ASSERT_EQ(file.Close(), naive.file) << "seed " << seed;
    }
}

TEST(TextFileOutStream, OpensAnotherFileUnderItsFirstName) {
    Fixture file;
    std::string const other = file.folder.Path("other");
    WriteFile(other, "old\n");
    file.stream << "first";
    EXPECT_TRUE(file.stream.Open(other.c_str(), true));
    EXPECT_EQ(ReadFile(file.path), "first\n");
    file.stream << static_cast<OutStream::Operand>(9) << "\nsecond\n";
    EXPECT_EQ(file.stream.GetFileName().View(), file.path);
    EXPECT_TRUE(file.stream.Open(file.path.c_str(), false));
    EXPECT_EQ(ReadFile(other), "old\n" + SIX + "\nsecond\n");
    EXPECT_EQ(file.Close(), "");
    EXPECT_FALSE(file.stream.Open(file.folder.Path("missing/out").c_str(), true));
    EXPECT_EQ(file.stream.GetError(), ENOENT);
    TextFileOutStream nameless(nullptr, false);
    nameless << "dropped\n" << 5 << OutStream::NEW_LINE;
    EXPECT_FALSE(nameless.IsOpen() || nameless.GetError());
}

} // namespace
