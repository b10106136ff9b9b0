#include "vesk_hdl/netlist/NaturalOrder.h"

#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

using namespace Basis::Ascii;

namespace {

/// The characters that are no digits, small letters as capitals, each by its place in the order:
/// bytes as signed, the end of a text among them as 0. Above them stand runs of digits by length.
constexpr unsigned int FIRST_RUN = 256 - 10 - 26;
constexpr unsigned int LONGEST_RUN = 255 - FIRST_RUN;

constexpr std::array<unsigned char, 256> MakeRanks() {
    std::array<unsigned char, 256> ranks = {};
    unsigned char rank = 0;
    for (int code = -128; code < 128; ++code) {
        char const c = static_cast<char>(code);
        if (!IsDigit(c) && ToUpper(c) == c)
            ranks[static_cast<unsigned char>(c)] = rank++;
    }
    for (char c = 'a'; c <= 'z'; ++c)
        ranks[static_cast<unsigned char>(c)] = ranks[static_cast<unsigned char>(ToUpper(c))];
    return ranks;
}
constexpr std::array<unsigned char, 256> RANKS = MakeRanks();

unsigned int RunLength(char const *text) {
    unsigned int length = 0;
    while (length < LONGEST_RUN && IsDigit(text[length]))
        ++length;
    return length;
}

} // namespace

NaturalHead HeadOf(char const *name) {
    std::array<unsigned char, sizeof(NaturalHead)> bytes = {};
    bool more = true;
    for (std::size_t i = 0; more && i < bytes.size();) {
        if (unsigned int run = RunLength(name)) {
            bytes[i++] = static_cast<unsigned char>(FIRST_RUN + run);
            more = run < LONGEST_RUN; // of the longest runs no byte tells the length
            for (; more && run > 0 && i < bytes.size(); --run)
                bytes[i++] = static_cast<unsigned char>(*name++);
        } else {
            bytes[i++] = RANKS[static_cast<unsigned char>(*name)];
            more = *name++ != '\0';
        }
    }
    NaturalHead head = {};
    for (std::size_t i = 0; i < bytes.size(); ++i)
        head[i / 8] = head[i / 8] << 8 | bytes[i];
    return head;
}

int NaturalCompare(char const *a, char const *b) {
    while (ToUpper(*a) == ToUpper(*b)) {
        if (*a == '\0')
            return 0;
        ++a;
        ++b;
    }
    if (IsDigit(*a) != IsDigit(*b))
        return IsDigit(*a) ? 1 : -1;
    if (!IsDigit(*a))
        return static_cast<signed char>(ToUpper(*a)) < static_cast<signed char>(ToUpper(*b)) ? -1
                                                                                             : 1;

    // Runs of equal length compare by their first difference, which is where they stand now.
    int const difference = *a < *b ? -1 : 1;
    while (IsDigit(*a) && IsDigit(*b)) {
        ++a;
        ++b;
    }
    if (IsDigit(*a) != IsDigit(*b))
        return IsDigit(*a) ? 1 : -1;
    return difference;
}

} // namespace Vesk_Hdl
