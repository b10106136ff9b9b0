// What has to hold for every design: a second write gives the same text, and so do declarations and
// connections in another order. That a file of lines and arrays of tokens give the same text too is
// tried by fuzz/commands.cpp.

#include <algorithm>
#include <random>

#include <gtest/gtest.h>

#include "tests/support/Consistency.h"
#include "tests/support/Lines.h"
#include "tests/support/MemoryFile.h"
#include "tests/support/RandomLines.h"

using namespace Vesk_Hdl;

namespace {

constexpr unsigned SEEDS = 40;
constexpr int LINES_A_DESIGN = 60;

/// Lines without writes and without the file name that differs from run to run.
Lines RandomDesign(unsigned seed) {
    std::mt19937 random(seed);
    RandomLines source(random);
    std::string text = RandomLines::Preface();
    for (int i = 0; i < LINES_A_DESIGN; ++i)
        if (std::string const line = source.Next(); line.rfind("WRITE", 0) != 0)
            text += line;
    Lines lines;
    for (std::size_t at = 0; at < text.size(); at = text.find('\n', at) + 1)
        lines.push_back(text.substr(at, text.find('\n', at) - at));
    return lines;
}

/// A model whose writes go into memory.
struct Written {
    CommandFactory factory;
    Model model{&factory};
    Capture capture;

    Written() { model.SetWriteOpener(&capture); }
    explicit Written(Lines const &lines) : Written() {
        for (std::string const &line : lines)
            Run(line);
    }
    void Run(std::string const &line) {
        MessageOf([&] { model.Execute(line.c_str()); });
    }
    std::string Write(char const *language) {
        model.Execute((std::string("WRITE ") + language + " -NOHEADER x").c_str());
        return capture.Take();
    }
    std::string WriteBoth() {
        std::string const vhdl = Write("VHDL");
        return vhdl + Write("VERILOG");
    }
};

TEST(Properties, AWriteIsTheSameFromTheSecondTimeOn) {
    for (unsigned seed = 0; seed < SEEDS; ++seed) {
        Written design(RandomDesign(seed));
        for (char const *const language : {"VHDL", "VERILOG"}) {
            design.Write(language);
            std::string const second = design.Write(language);
            EXPECT_EQ(design.Write(language), second) << "seed " << seed;
        }
        EXPECT_EQ(Inconsistency(*design.model.GetNetlist()), "") << "seed " << seed;
    }
}

/// The order of declarations of one kind, and of connections of different pins, has no effect.
TEST(Properties, TheOrderOfDeclarationsSaysNothing) {
    for (unsigned seed = 0; seed < SEEDS; ++seed) {
        std::mt19937 random(seed);
        std::vector<Lines> groups(4);
        for (std::string const cell : {"INV", "AND2", "MACRO"}) {
            groups[0].push_back("ADD COMPONENT " + cell);
            groups[1].push_back("ADD PIN " + cell + " A in");
            groups[1].push_back("ADD PIN " + cell + " D(3:0) out");
        }
        for (int i = 0; i < 12; ++i) {
            std::string const number = std::to_string(i);
            char const *const polarity[] = {"in", "out", "bi"};
            groups[2].push_back("ADD PORT p" + number + " " + polarity[random() % 3]);
            groups[2].push_back("ADD SIGNAL bus" + number + "(7:0)");
            groups[2].push_back("ADD INSTANCE " + std::string(i % 2 ? "INV u" : "AND2 x") + number);
            std::string const owner = (i % 2 ? "u" : "x") + number;
            std::string const net = random() % 2 ? "p" : "net";
            groups[3].push_back("CONNECT SIGNAL " + net + std::to_string(random() % 12) + " " +
                                owner + ".A");
            groups[3].push_back("CONNECT SIGNAL bus" + number + "(" +
                                std::to_string(random() % 2 + 3) + ":0) " + owner + ".D(3:0)");
        }
        auto const write = [&] {
            Lines lines;
            for (Lines const &group : groups)
                lines.insert(lines.end(), group.begin(), group.end());
            return Written(lines).WriteBoth();
        };
        std::string const expected = write();
        for (std::size_t group : {0U, 2U, 3U})
            std::shuffle(groups[group].begin(), groups[group].end(), random);
        EXPECT_EQ(write(), expected) << "seed " << seed;
    }
}

} // namespace
