// The seeded hash. It reads eight characters at a time, since every command hashes names.

#include "vesk_hdl/text/SeededHash.h"

#include <algorithm>
#include <chrono>
#include <cstring>
#include <exception>
#include <random>

namespace Vesk_Hdl {

namespace {

constexpr std::size_t WORD = sizeof(std::uint64_t);
constexpr std::uint64_t EACH_BYTE = 0x0101010101010101U; ///< times a byte: that byte eight times
/// The bits of the last character in which numbered names differ: those of a decimal digit.
constexpr unsigned int COUNTED_BITS = 0x0F;

/// The random numbers of this process. They must stay the same from the first hash to the last.
struct Key {
    std::uint64_t a, b, c, d;

    Key() {
        try {
            std::random_device device;
            for (std::uint64_t *const part : {&a, &b, &c, &d})
                *part = std::uint64_t{device()} << 32U | device();
        } catch (std::exception const &) {
            // The machine provides no random numbers. The time and an address are hard to guess for
            // the author of a file of colliding names.
            auto const now = std::chrono::steady_clock::now().time_since_epoch().count();
            std::mt19937_64 random(static_cast<std::uint64_t>(now) ^
                                   reinterpret_cast<std::uintptr_t>(this));
            for (std::uint64_t *const part : {&a, &b, &c, &d})
                *part = random();
        }
    }
};

/// Both halves of the product, combined. Each factor has been combined with a secret number before,
/// so that texts with the same result cannot be chosen.
std::uint64_t Mix(std::uint64_t a, std::uint64_t b) {
    __extension__ using Product = unsigned __int128;
    Product const product = Product{a} * b;
    return static_cast<std::uint64_t>(product) ^ static_cast<std::uint64_t>(product >> 64U);
}

template <class Number> std::uint64_t Load(char const *text) {
    Number number;
    std::memcpy(&number, text, sizeof number);
    return number;
}

std::uint64_t Byte(char const *text, std::size_t at) {
    return std::uint64_t{static_cast<unsigned char>(text[at])} << 8 * at;
}

/// Up to eight characters as a number. Different texts of the same length give different numbers.
std::uint64_t LoadWord(char const *text, std::size_t size) {
    if (size >= WORD)
        return Load<std::uint64_t>(text);
    // Loads that overlap cover every length without a loop and without reading past the end.
    constexpr std::size_t HALF = WORD / 2;
    if (size >= HALF)
        return Load<std::uint32_t>(text) | Load<std::uint32_t>(text + size - HALF) << 8 * HALF;
    return size > 0 ? Byte(text, 0) | Byte(text, size / 2) | Byte(text, size - 1) : 0;
}

/// Basis::Ascii::ToUpper for each byte of a word at once. The top bit of each byte of the two sums
/// says whether the byte is at least 'a' and whether it is greater than 'z'. Shifted by two, the
/// top bit is 32, the difference between a small and a capital letter.
std::uint64_t ToUpper(std::uint64_t word) {
    constexpr std::uint64_t TOP_BITS = 0x80 * EACH_BYTE;
    std::uint64_t const low = word & ~TOP_BITS;
    std::uint64_t const fromSmallA = low + (0x80 - 'a') * EACH_BYTE;
    std::uint64_t const afterSmallZ = low + (0x7F - 'z') * EACH_BYTE;
    return word - ((fromSmallA & ~afterSmallZ & ~word & TOP_BITS) >> 2U);
}

/// The last character is left out of the words: its low bits are added to the finished hash, so
/// that numbered names become neighbours, and its other bits take part with the length.
template <bool ignoresCase> std::uint32_t Hash(std::string_view text) {
    auto const load = [](char const *from, std::size_t size) {
        std::uint64_t const word = LoadWord(from, size);
        return ignoresCase ? ToUpper(word) : word;
    };
    if (text.empty())
        return 0;
    auto const last =
        static_cast<unsigned char>(ignoresCase ? Basis::Ascii::ToUpper(text.back()) : text.back());
    static Key const key;
    char const *at = text.data();
    std::size_t left = text.size() - 1;
    std::uint64_t hash = 0;
    for (; left > WORD; left -= WORD, at += WORD)
        hash = Mix(load(at, WORD) ^ hash ^ key.a, key.b);
    std::uint64_t const rest = std::uint64_t{text.size()} << 8U | (last & ~COUNTED_BITS);
    hash = Mix(load(at, left) ^ hash ^ key.c, rest ^ key.d);
    return static_cast<std::uint32_t>(hash) ^ (last & COUNTED_BITS);
}

} // namespace

std::uint32_t SeededHash(std::string_view text) { return Hash<false>(text); }
std::uint32_t SeededHashIgnoringCase(std::string_view text) { return Hash<true>(text); }

} // namespace Vesk_Hdl
