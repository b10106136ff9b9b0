#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>

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

/// An input as text up to its first NUL byte.
inline std::string TextOf(std::uint8_t const *data, std::size_t size) {
    std::string const text(reinterpret_cast<char const *>(data), size);
    return text.substr(0, text.find('\0'));
}
