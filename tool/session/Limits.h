#pragma once

#include <string>
#include <string_view>
#include <sys/resource.h>

/// A limit of the memory that the process asks for. Beyond it allocations fail.
class MemoryLimit {
public:
    /// In bytes; 0 for none.
    explicit MemoryLimit(unsigned long long bytes) : size(bytes) {}

    void Apply();
    /// Makes room again, as for the message that the memory was not enough.
    void Lift();
    /// In bytes, 0 for none.
    unsigned long long GetSize() const { return size; }

private:
    unsigned long long size;
    bool applied = false;
    rlimit former = {};
};

/// A number of bytes as it is given to an option: 524288000 is "500M".
std::string SizeText(unsigned long long bytes);
/// The reverse: a whole number, perhaps with k, M, G or T. 0 for any other text and for
/// what is too large.
unsigned long long BytesOf(std::string_view text);
