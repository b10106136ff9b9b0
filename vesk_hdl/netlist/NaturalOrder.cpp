// The order of names, and the heads that save most comparisons of whole names.

#include "vesk_hdl/netlist/NaturalOrder.h"

#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

using namespace Basis::Ascii;

namespace {

// A byte of a head is a character or the length of a run of digits. Characters that are no digits
// have the lower values, small letters those of capitals, in their order: bytes as signed numbers,
// the end of a text among them as 0. The values above are lengths of runs, since digits come after
// other characters and longer runs after shorter ones.
constexpr unsigned int FIRST_RUN = 256 - 10 - 26; ///< all bytes but digits and small letters
constexpr unsigned int MAX_RUN = 255 - FIRST_RUN; ///< longer runs have this value as well

/// The value of each character that is no digit.
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

/// The length of the run of digits at the beginning of a text, at most MAX_RUN.
unsigned int RunLength(char const *text) {
    unsigned int length = 0;
    while (length < MAX_RUN && IsDigit(text[length]))
        ++length;
    return length;
}

} // namespace

NaturalHead HeadOf(char const *name, unsigned int head) {
    std::array<unsigned char, sizeof(NaturalHead)> bytes = {};
    std::size_t const begin = head * bytes.size();
    std::size_t const end = begin + bytes.size();
    std::size_t at = 0;
    auto const put = [&](unsigned int byte) {
        if (at >= begin)
            bytes[at - begin] = static_cast<unsigned char>(byte);
        ++at;
    };
    bool more = true;
    while (more && at < end) {
        if (unsigned int run = RunLength(name)) {
            put(FIRST_RUN + run);
            more = run < MAX_RUN; // runs of that length may differ in length: the heads end here
            for (; more && run > 0 && at < end; --run)
                put(static_cast<unsigned char>(*name++));
        } else {
            put(RANKS[static_cast<unsigned char>(*name)]);
            more = *name++ != '\0';
        }
    }
    NaturalHead result = {};
    for (std::size_t i = 0; i < bytes.size(); ++i)
        result[i / 8] = result[i / 8] << 8 | bytes[i]; // the first byte weighs most, as in a text
    return result;
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

    // Required: both are in a run of digits that began alike. If the rests are of equal length, the
    // digits at this first difference decide.
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
