#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

// What the targets share. A target is one LLVMFuzzerTestOneInput: libFuzzer feeds it, and so does
// the replay program with the stored inputs.

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size);

/// Ends the process with a message, which a fuzzer counts as a finding.
#define FUZZ_EXPECT(condition, ...)                                                                \
    do {                                                                                           \
        if (!(condition)) {                                                                        \
            std::fprintf(stderr, "%s:%d: not so: %s: ", __FILE__, __LINE__, #condition);           \
            std::fprintf(stderr, __VA_ARGS__);                                                     \
            std::abort();                                                                          \
        }                                                                                          \
    } while (false)

/// The parts of a text between separators, without empty ones.
inline std::vector<std::string> Split(std::string const &text, std::string_view separators) {
    std::vector<std::string> parts(1);
    for (char const c : text)
        if (separators.find(c) != separators.npos)
            parts.emplace_back();
        else
            parts.back() += c;
    std::erase(parts, "");
    return parts;
}

/// An input as text up to its first NUL byte.
inline std::string TextOf(std::uint8_t const *data, std::size_t size) {
    std::string const text(reinterpret_cast<char const *>(data), size);
    return text.substr(0, text.find('\0'));
}
