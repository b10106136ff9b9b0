#include "vesk_hdl/text/OutStream.h"

#include <cerrno>
#include <random>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"
#include "vesk_hdl/text/StringArray.h"

using namespace Vesk_Hdl;
using Strings = std::vector<std::string>;

namespace {

std::string const SIX(6, ' ');
std::string const A60(60, 'a');
std::string const A99(99, 'a');

/// A text file in memory that treats each line as a plain string, read anew for every piece.
struct NaiveFile {
    std::string file, line;
    std::size_t level = 0;

    std::string Indentation() const { return std::string(3 * level, ' '); }
    void Put(std::string const &piece) {
        if (piece == ">")
            ++level;
        else if (piece == "<")
            level -= level > 0 ? 1 : 0;
        else if (piece != "!")
            Write(piece);
        else if (!line.empty())
            BreakLine(line.size());
    }
    void Write(std::string rest) {
        for (std::size_t end; (end = rest.find('\n')) != std::string::npos; line.clear()) {
            file += (line.empty() ? Indentation() : line) + rest.substr(0, end + 1);
            rest.erase(0, end + 1);
        }
        if (!rest.empty())
            AppendToken(rest);
    }
    void AppendToken(std::string const &token) {
        if (line.empty())
            line = Indentation();
        bool const comment = line.find("--") + 1 || line.find('/') + 1;
        if (!comment && line.size() + token.size() > 80) {
            std::size_t const blank = line.rfind(' ');
            std::size_t const comma = line.rfind(',');
            BreakLine(blank + 1 ? blank : comma + 1 ? comma : line.size());
        }
        line += token;
    }
    void BreakLine(std::size_t position) {
        file += line.substr(0, position + 1) + "\n";
        line = Indentation() + SIX + line.erase(0, position + 1);
    }
};

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
            naive.Put(piece);
            if (step % 100 == 50) { // what closing leaves on the line shows on the next one
                file.stream.Close();
                naive.Put("!");
                file.stream << "dropped\n" << 1 << OutStream::NEW_LINE;
                file.stream.Open(file.path.c_str(), true);
            }
        }
        naive.Put("!");
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
