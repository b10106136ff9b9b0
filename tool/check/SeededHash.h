#pragma once

#include <cstdint>
#include <cstring>
#include <random>
#include <string_view>

namespace Checks {

/// A hash of texts for tables whose order nobody sees. A text is read as the digits of a number to
/// a random base, modulo the prime 2^61 - 1: the author of a command file does not know the base,
/// and two texts of that file collide by chance alone.
struct SeededHash {
    std::size_t operator()(std::string_view text) const {
        constexpr std::size_t DIGIT = 7; // bytes that are always less than the prime
        static std::uint64_t const base = RandomBase();
        std::uint64_t hash = text.size();
        for (; text.size() >= DIGIT; text.remove_prefix(DIGIT))
            hash = AddDigit(hash, base, text.substr(0, DIGIT));
        return AddDigit(hash, base, text);
    }

private:
    static constexpr std::uint64_t PRIME = (std::uint64_t(1) << 61) - 1;

    static std::uint64_t RandomBase() {
        std::random_device device;
        std::uint64_t const high = device();
        return (high << 32 | device()) % PRIME;
    }

    static std::uint64_t AddDigit(std::uint64_t hash, std::uint64_t base, std::string_view bytes) {
        __extension__ using Wide = unsigned __int128;
        std::uint64_t digit = 0;
        if (!bytes.empty())
            std::memcpy(&digit, bytes.data(), bytes.size());
        // 2^61 is 1 modulo the prime, so that its multiples fold onto the low bits.
        Wide const product = Wide(hash) * base + digit;
        std::uint64_t const sum =
            static_cast<std::uint64_t>(product & PRIME) + static_cast<std::uint64_t>(product >> 61);
        return sum >= PRIME ? sum - PRIME : sum;
    }
};

} // namespace Checks
