#include <algorithm>
#include <cstdint>
#include <map>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/RandomText.h"
#include "vesk_hdl/text/IStringPtrMap.h"
#include "vesk_hdl/text/StringSet.h"

using namespace Vesk_Hdl;
using Strings = std::vector<std::string>;

namespace {

constexpr std::string_view LETTERS = "aAbB_09z\x80\xC4\xE4\xFF";

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
        std::uint32_t hash = 5381;
        for (char const c : text)
            hash = hash * 33 + static_cast<std::uint32_t>(static_cast<signed char>(c));
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
    for (unsigned int const seed : {1, 2, 3}) {
        std::mt19937 random(seed);
        StringSet set;
        NaiveTable naive;
        for (int step = 0; step < 5000; ++step) {
            std::string const name = RandomText(random, LETTERS, seed == 1 ? 3 : 6);
            bool const removes = random() % 8 == 0;
            removes ? set.Remove(name.c_str()) : set.Add(name.c_str());
            removes ? naive.Remove(name) : naive.Add(name);
            if (step == 2500 && seed == 3) { // the buckets stay as many as they are
                set.Empty();
                naive.nodes.clear();
            }
            SCOPED_TRACE(testing::Message() << "seed " << seed << ", step " << step);
            if (step % 100 == 99)
                naive.ExpectSameWalk(set);
        }
    }
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

TEST(IStringPtrMap, AnswersLikeANaiveMap) {
    std::mt19937 random(7);
    std::vector<int> values(20000);
    IStringPtrMap<int *> map;
    std::map<std::string, int *> naive;
    auto upper = [](std::string text) {
        for (char &c : text)
            c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
        return text;
    };
    for (int &value : values) {
        std::string const name = RandomText(random, LETTERS, 5);
        int *const pointer = random() % 9 ? &value : nullptr;
        bool const removes = random() % 4 == 0;
        removes ? map.Remove(name.c_str()) : map.Add(name.c_str(), pointer);
        removes ? void(naive.erase(upper(name))) : void(naive[upper(name)] = pointer);
        std::string const asked = RandomText(random, LETTERS, 4);
        auto const found = naive.find(upper(asked));
        ASSERT_EQ(map.Get(asked.c_str()), found == naive.end() ? nullptr : found->second) << asked;
        ASSERT_EQ(map.Contains(asked.c_str()), found != naive.end()) << asked;
    }
    IStringPtrMap<int *> assigned;
    assigned.Add("no letters of those", values.data());
    assigned = map;
    IStringPtrMap<int *> const copy(map);
    map.Empty();
    EXPECT_TRUE(map.IsEmpty() && !assigned.Contains("no letters of those"));
    for (auto const &[name, pointer] : naive)
        ASSERT_TRUE(assigned.Get(name.c_str()) == pointer && copy.Get(name.c_str()) == pointer);
}

/// "1Z" and "29" hash alike, and so does everything that is made of them: 65,536 names in one
/// bucket would have this test run for a minute.
TEST(IStringPtrMap, FindsNamesThatWereMadeToCollide) {
    constexpr unsigned int PAIRS = 16;
    auto const nameOf = [](unsigned int number) {
        std::string name;
        for (unsigned int bit = 0; bit < PAIRS; ++bit)
            name += number >> bit & 1U ? "1z" : "29";
        return name;
    };
    std::vector<int> values(1U << PAIRS);
    IStringPtrMap<int *> map;
    for (unsigned int i = 0; i < values.size(); ++i)
        map.Add(nameOf(i).c_str(), &values[i]);
    map.Remove("292929292929292929292929292929"
               "1Z");
    for (unsigned int i = 0; i < values.size(); ++i)
        ASSERT_EQ(i == 1U << (PAIRS - 1) ? nullptr : &values[i], map.Get(nameOf(i).c_str())) << i;
}

} // namespace
