#pragma once

#include <fstream>
#include <iterator>
#include <string>

/// The bytes of a file; empty if there is none.
inline std::string ReadFile(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

inline void WriteFile(std::string const &path, std::string const &bytes) {
    std::ofstream(path, std::ios::binary) << bytes;
}
