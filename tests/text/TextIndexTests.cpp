#include <algorithm>
#include <functional>
#include <map>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/RandomText.h"
#include "vesk_hdl/text/IStringPtrMap.h"
#include "vesk_hdl/text/SeededHash.h"

using namespace Vesk_Hdl;

namespace {

constexpr std::string_view LETTERS = "aAbB_09z\x80\xC4\xE4\xFF";

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

/// Every character at every place, in texts of all lengths that the hash reads in a different way.
/// Two of so many random numbers are hardly ever equal by chance.
TEST(SeededHash, IgnoresTheCaseOfLettersAlone) {
    int equal = 0;
    for (std::size_t size = 1; size < 20; ++size)
        for (std::size_t at = 0; at < size; ++at)
            for (int c = 0; c < 256; ++c) {
                std::string text(size, 'Q');
                std::string other = text;
                text[at] = static_cast<char>(c);
                other[at] = static_cast<char>(c ^ 0x20);
                bool const isEqual = SeededHashIgnoringCase(text) == SeededHashIgnoringCase(other);
                if ((c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'))
                    ASSERT_TRUE(isEqual) << size << ", " << at << ", " << c;
                else
                    equal += isEqual;
                equal += SeededHash(text) == SeededHash(other);
            }
    EXPECT_LE(equal, 2);
}

TEST(SeededHash, SpreadsSimilarTexts) {
    constexpr unsigned int COUNT = 4096;
    struct Family {
        char const *texts;
        std::function<std::string(unsigned int)> makeText;
    };
    auto const inPairs = [](char const *one, char const *zero) {
        return [=](unsigned int number) {
            std::string text;
            for (unsigned int bit = COUNT; bit > 0; bit /= 2)
                text += number & bit ? one : zero;
            return text;
        };
    };
    for (Family const &family : {
             Family{"counted", [](unsigned int i) { return "net" + std::to_string(i); }},
             Family{"counted in the middle",
                    [](unsigned int i) { return "net" + std::to_string(i) + "_openSignal(31:0)"; }},
             Family{"longer and longer", [](unsigned int i) { return std::string(i, 'x'); }},
             Family{"alike under 33 * hash + character", inPairs("1Z", "29")},
             Family{"of two words of the machine", inPairs("AAAAAAAA", "BBBBBBBB")},
         }) {
        SCOPED_TRACE(family.texts);
        std::map<std::uint32_t, int> buckets;
        int longest = 0;
        for (unsigned int i = 0; i < COUNT; ++i)
            longest = std::max(longest, ++buckets[SeededHash(family.makeText(i)) % COUNT]);
        EXPECT_LT(longest, 20);
    }
}

} // namespace
