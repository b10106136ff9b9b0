#include "vesk_hdl/netlist/Values.h"

#include <gtest/gtest.h>

#include "tests/support/Lines.h"

using namespace Vesk_Hdl;

namespace {

TEST(Polarity, WordsMatchByPrefix) {
    for (auto const &[word, value] : Pairs("Input=0; INP=0; i=0; o=1; OUTPUT=1; bi=2;"
                                           "BIDIRECTIONAL=2; inputs=-1; inout=-1; x=-1; =-1")) {
        EXPECT_EQ(value, std::to_string(Polarity(word.c_str()).GetValue())) << word;
        Polarity polarity(Polarity::OUTPUT);
        polarity.SetValue(word.c_str());
        EXPECT_EQ(value, std::to_string(polarity.GetValue())) << word;
    }
}

TEST(Polarity, NamesAndOrder) {
    char const *const names[] = {"Output", "Input", "Output", "BiDirectional", "Output"};
    for (int value = -1; value <= 3; ++value) {
        Polarity const polarity(static_cast<Polarity::Value>(value));
        EXPECT_STREQ(names[value + 1], polarity.GetValueName()) << value;
        EXPECT_EQ(value >= 0 && value <= 2, Polarity::IsValidValue(polarity.GetValue())) << value;
        EXPECT_EQ(value > 0, Polarity(Polarity::INPUT) < polarity) << value;
        EXPECT_EQ(value < 0, polarity < Polarity(Polarity::INPUT)) << value;
    }
}

std::string TextOf(BitVectorValue const &value) {
    return Basis::StringBase<char>::doFormat("%s %d %d %d", value.GetValue().GetText(),
                                             value.GetBase(), value.GetLength(),
                                             value.HasBaseAndLength())
        .GetText();
}

TEST(BitVectorValue, ReadsLengthBaseAndDigits) {
    BitVectorValue value;
    for (auto const &[text, expected] :
         Pairs("8:h:FF=FF 16 8 1; 4:b:1010=1010 2 4 1; 3:o:7=7 8 3 1; 3:Octal:7:9=7 8 3 1;"
               "8:Hex:zz=zz 16 8 1; 8:x:FF=FF 2 8 1; x:h:FF=FF 16 0 1; -4:B:1=1 2 -4 1;"
               "1010=1010 2 1 0; 8:FF=8:FF 2 1 0; 8::FF=8::FF 2 1 0; :8::h:FF=FF 16 8 1;"
               "::=:: 2 1 0; = 2 1 0")) {
        value.SetValue(text.c_str());
        EXPECT_EQ(expected, TextOf(value)) << text;
    }
    BitVectorValue first("8:h:FF");
    BitVectorValue second(first);
    value = first;
    first.SetValue(nullptr);
    second = *&second;
    EXPECT_EQ(" 2 1 0", TextOf(first));
    EXPECT_EQ("FF 16 8 1", TextOf(second));
    EXPECT_EQ("FF 16 8 1", TextOf(value));
}

} // namespace
