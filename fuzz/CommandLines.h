#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

// What the targets share that read whole command files. Linked into a fuzzer, it mutates their
// inputs line by line, with lines made from the grammar of the commands.

/// Lines that declare what the others use, then the lines of an input, each up to its first NUL
/// byte.
std::vector<std::string> CommandLines(std::uint8_t const *data, std::size_t size);
