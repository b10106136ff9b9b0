#pragma once

#include <atomic>
#include <cassert>

#if __has_include(<sys/single_threaded.h>)
#include <sys/single_threaded.h>
#endif

/// Counts the owners of shared memory. The count is atomic. As long as the process has one thread,
/// plain loads and stores do, which saves the locked instructions: names are copied so often that
/// this is visible (docs/performance.md, "Why it is so").
namespace Basis::Counting {

inline bool IsSingleThreaded() {
#if __has_include(<sys/single_threaded.h>)
    return __libc_single_threaded;
#else
    return false;
#endif
}

inline void Join(std::atomic<unsigned int> &owners) noexcept {
    if (IsSingleThreaded())
        owners.store(owners.load(std::memory_order_relaxed) + 1, std::memory_order_relaxed);
    else
        owners.fetch_add(1, std::memory_order_relaxed);
}

/// Whether the owner that leaves was the last one and has to free the memory.
inline bool Leave(std::atomic<unsigned int> &owners) noexcept {
    // No other thread can join: it would need a copy to copy from, and this is the only one.
    unsigned int const count = owners.load(std::memory_order_acquire);
    assert(count > 0 && "memory without an owner is in use");
    if (count == 1)
        return true;
    if (!IsSingleThreaded())
        return owners.fetch_sub(1, std::memory_order_acq_rel) == 1;
    owners.store(count - 1, std::memory_order_relaxed);
    return false;
}

} // namespace Basis::Counting
