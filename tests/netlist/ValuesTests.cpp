#include "vesk_hdl/netlist/Values.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

using namespace Vesk_Hdl;

namespace {

TEST(Polarity, WordsMatchByPrefix) {
    struct Row {
        char const *text;
        Polarity::Value value;
    };
    for (Row const &row : std::vector<Row>{{"Input", Polarity::INPUT},
                                           {"INP", Polarity::INPUT},
                                           {"i", Polarity::INPUT},
                                           {"o", Polarity::OUTPUT},
                                           {"OUTPUT", Polarity::OUTPUT},
                                           {"bi", Polarity::BIDIRECTIONAL},
                                           {"BIDIRECTIONAL", Polarity::BIDIRECTIONAL},
                                           {"inputs", Polarity::INVALID},
                                           {"inout", Polarity::INVALID},
                                           {"x", Polarity::INVALID},
                                           {" in", Polarity::INVALID},
                                           {"", Polarity::INVALID}}) {
        EXPECT_EQ(row.value, Polarity::GetValue(row.text)) << row.text;
        EXPECT_EQ(row.value, Polarity(row.text).GetValue()) << row.text;
        Polarity polarity(Polarity::OUTPUT);
        polarity.SetValue(row.text);
        EXPECT_EQ(row.value, polarity.GetValue()) << row.text;
    }
}

TEST(Polarity, NamesAndOrder) {
    EXPECT_STREQ("Input", Polarity(Polarity::INPUT).GetValueName());
    EXPECT_STREQ("Output", Polarity(Polarity::OUTPUT).GetValueName());
    EXPECT_STREQ("BiDirectional", Polarity(Polarity::BIDIRECTIONAL).GetValueName());
    EXPECT_STREQ("Output", Polarity().GetValueName());
    EXPECT_STREQ("Output", Polarity(static_cast<Polarity::Value>(3)).GetValueName());
    for (int value = -3; value < 5; ++value)
        EXPECT_EQ(value >= 0 && value <= 2,
                  Polarity::IsValidValue(static_cast<Polarity::Value>(value)))
            << value;
    for (int a = -1; a <= 2; ++a)
        for (int b = -1; b <= 2; ++b)
            EXPECT_EQ(a < b, Polarity(static_cast<Polarity::Value>(a)) <
                                 Polarity(static_cast<Polarity::Value>(b)));
}

struct Constant {
    char const *text;
    char const *value;
    int base;
    int length;
    bool hasBaseAndLength;
};

Constant const CONSTANTS[] = {{"8:h:FF", "FF", 16, 8, true},   {"4:b:1010", "1010", 2, 4, true},
                              {"3:o:7", "7", 8, 3, true},      {"3:Octal:7:9", "7", 8, 3, true},
                              {"8:Hex:zz", "zz", 16, 8, true}, {"8:x:FF", "FF", 2, 8, true},
                              {"x:h:FF", "FF", 16, 0, true},   {"-4:B:1", "1", 2, -4, true},
                              {"1010", "1010", 2, 1, false},   {"8:FF", "8:FF", 2, 1, false},
                              {"8::FF", "8::FF", 2, 1, false}, {":8::h:FF", "FF", 16, 8, true},
                              {"::", "::", 2, 1, false},       {"", "", 2, 1, false},
                              {nullptr, "", 2, 1, false}};

void ExpectConstant(Constant const &expected, BitVectorValue const &actual) {
    EXPECT_STREQ(expected.value, actual.GetValue()) << expected.value;
    EXPECT_EQ(expected.base, actual.GetBase()) << expected.value;
    EXPECT_EQ(expected.length, actual.GetLength()) << expected.value;
    EXPECT_EQ(expected.hasBaseAndLength, actual.HasBaseAndLength()) << expected.value;
}

TEST(BitVectorValue, ReadsLengthBaseAndDigits) {
    BitVectorValue reused("8:h:FF");
    for (Constant const &constant : CONSTANTS) {
        ExpectConstant(constant, BitVectorValue(constant.text));
        reused.SetValue(constant.text);
        ExpectConstant(constant, reused);
    }
}

TEST(BitVectorValue, CopiesAreIndependent) {
    BitVectorValue first("8:h:FF");
    BitVectorValue second(first);
    BitVectorValue third;
    third = first;
    first.SetValue(nullptr);
    second = *&second;
    ExpectConstant(CONSTANTS[0], second);
    ExpectConstant(CONSTANTS[0], third);
    third = first;
    ExpectConstant({"", "", 2, 1, false}, third);
}

} // namespace
