#include "vesk_hdl/text/StringSet.h"

#include <algorithm>
#include <cstdint>
#include <functional>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/RandomText.h"

using namespace Vesk_Hdl;
using Strings = std::vector<std::string>;

namespace {

constexpr std::string_view LETTERS = "aAbB_09z\x80\xC4\xE4\xFF";

std::uint32_t HashOf(std::string_view text) {
    std::uint32_t hash = 5381;
    for (char const c : text)
        hash = hash * 33 + static_cast<std::uint32_t>(static_cast<signed char>(c));
    return hash;
}

/// "1Z" and "29" hash alike, and so do all names of one length that are made of them.
std::string CollidingName(unsigned int number, unsigned int pairs) {
    std::string name;
    for (unsigned int bit = 0; bit < pairs; ++bit)
        name += number >> bit & 1U ? "1Z" : "29";
    return name;
}

Strings Walk(StringSet &set) {
    Strings strings;
    for (StringSetIterator at = set.GetBeginPos(); at != set.GetEndPos(); ++at)
        strings.emplace_back(*at);
    return strings;
}

/// The exact half of a set: all texts in the order of a walk, with their hashes.
struct NaiveTable {
    std::vector<std::pair<std::string, std::uint32_t>> nodes;
    std::uint32_t buckets = 193;

    /// The first text of the bucket, or of the next one that has any.
    auto PlaceOf(std::uint32_t hash) {
        return std::find_if(nodes.begin(), nodes.end(), [&](auto const &node) {
            return node.second % buckets >= hash % buckets;
        });
    }
    void Add(std::string const &text) {
        if (nodes.size() + 1 > buckets) {
            for (std::uint32_t const prime : {12289, 6151, 3079, 1543, 769, 389})
                buckets = prime > nodes.size() ? prime : buckets;
            for (auto const &node : std::exchange(nodes, {}))
                nodes.insert(PlaceOf(node.second), node);
        }
        std::uint32_t const hash = HashOf(text);
        auto const place = PlaceOf(hash);
        bool const taken = place != nodes.end() && place->second % buckets == hash % buckets;
        if (std::find(nodes.begin(), nodes.end(), std::pair(text, hash)) == nodes.end())
            nodes.insert(place + taken, {text, hash});
    }
    void Remove(std::string const &text) {
        std::erase_if(nodes, [&](auto const &node) { return node.first == text; });
    }
    void ExpectSameWalk(StringSet &set) const {
        Strings strings;
        for (auto const &node : nodes)
            strings.push_back(node.first);
        ASSERT_EQ(Walk(set), strings);
    }
};

TEST(StringSet, WalksLikeTheNaiveTable) {
    struct Case {
        char const *names;
        std::function<std::string(std::mt19937 &)> makeName;
        bool isEmptied = false; ///< halfway; the buckets stay as many as they are
    };
    auto const upTo = [](std::size_t longest) {
        return [=](std::mt19937 &random) { return RandomText(random, LETTERS, longest); };
    };
    for (Case const &test : {
             Case{"short", upTo(3)},
             Case{"long", upTo(6)},
             Case{"emptied", upTo(6), true},
             Case{"one bucket for each length",
                  [](std::mt19937 &random) {
                      auto const pairs = static_cast<unsigned int>(random() % 12);
                      return CollidingName(static_cast<unsigned int>(random()), pairs);
                  }},
             Case{"in one bucket once the table has 389",
                  [](std::mt19937 &random) {
                      std::string name = RandomText(random, "abc", 7);
                      while (random() % 4 && HashOf(name) % 389 != 7)
                          name = RandomText(random, "abc", 7);
                      return name;
                  }},
         }) {
        SCOPED_TRACE(test.names);
        std::mt19937 random(1);
        StringSet set;
        NaiveTable naive;
        for (int step = 0; step < 5000; ++step) {
            std::string const name = test.makeName(random);
            bool const removes = random() % 8 == 0;
            removes ? set.Remove(name.c_str()) : set.Add(name.c_str());
            removes ? naive.Remove(name) : naive.Add(name);
            if (step == 2500 && test.isEmptied) {
                set.Empty();
                naive.nodes.clear();
            }
            SCOPED_TRACE(step);
            if (step % 100 == 99)
                naive.ExpectSameWalk(set);
        }
    }
}

/// All in one bucket: a table that searches it in order would need a minute.
TEST(StringSet, FindsNamesThatWereMadeToCollide) {
    constexpr unsigned int PAIRS = 16;
    StringSet set;
    for (unsigned int i = 0; i < 1U << PAIRS; ++i)
        set.Add(CollidingName(i, PAIRS).c_str());
    for (unsigned int i = 0; i < 1U << PAIRS; i += 2)
        set.Remove(CollidingName(i, PAIRS).c_str());
    for (unsigned int i = 0; i < 1U << PAIRS; ++i)
        ASSERT_EQ(set.Contains(CollidingName(i, PAIRS).c_str()), i % 2 == 1) << i;
    EXPECT_EQ(Walk(set).size(), 1U << (PAIRS - 1));
    while (!set.IsEmpty()) // the first name first
        set.Remove(*set.GetBeginPos());
}

TEST(StringSet, GrowsAlsoForAStringThatItHolds) {
    StringSet set;
    NaiveTable naive;
    for (int i = 0; i <= 193; ++i) {
        std::string const name = "name" + std::to_string(i % 193);
        set.Add(name.c_str());
        naive.Add(name);
    }
    naive.ExpectSameWalk(set);
}

TEST(StringSet, KeepsTwoRules) {
    StringSet set;
    for (char const *const name : {"Clk", "CLK", "Clk"})
        set.Add(name);
    EXPECT_EQ(Walk(set).size(), 2U);
    EXPECT_TRUE(set.Contains("CLK") && set.IContains("clk"));
    EXPECT_FALSE(set.Contains("clk") || set.IContains("clk1"));
    set.Remove("clk"); // no exact entry, yet the one that ignores case
    EXPECT_TRUE(set.Contains("Clk") && set.Contains("CLK") && !set.IContains("Clk"));
    set.Add("x");
    set.Empty();
    EXPECT_TRUE(set.IsEmpty() && set.IContains("X") && !set.Contains("x"));
    EXPECT_TRUE(set.GetBeginPos() == set.GetEndPos());
}

TEST(StringSet, AssignmentForgetsOnlyWhatIgnoredCase) {
    StringSet source;
    StringSet target;
    source.Add("gone");
    source.Empty();
    for (char const *const text : {"ac", "c!", "bB"})
        source.Add(text); // a walk gives ac, bB, c!
    target.Add("Old");
    target = source;
    EXPECT_TRUE(target.Contains("Old") && target.IContains("BB"));
    EXPECT_FALSE(target.IContains("Old") || target.IContains("gone"));
    StringSet copy(source);
    EXPECT_EQ(Walk(copy), (Strings{"ac", "c!", "bB"}));
    StringSet &same = source;
    source = same;
    EXPECT_TRUE(source.IContains("GONE"));
}

TEST(StringSetIterator, ComparesByPosition) {
    StringSet set;
    set.Add("A");
    StringSetIterator nowhere;
    StringSetIterator at = set.GetBeginPos();
    StringSetIterator const copy(at);
    EXPECT_TRUE(nowhere == StringSetIterator(nullptr) && nowhere != set.GetEndPos());
    ++nowhere;
    EXPECT_STREQ(*nowhere, "");
    at++;
    EXPECT_TRUE(copy != at && at == set.GetEndPos());
    nowhere = copy;
    EXPECT_STREQ(*nowhere, "A");
}

} // namespace
