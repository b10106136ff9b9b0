#pragma once

#include <atomic>

#if __has_include(<sys/single_threaded.h>)
#include <sys/single_threaded.h>
#endif

/// Counting the owners of shared memory. It is atomic counting; while the process has one thread
/// only, nobody is there to count at the same time, and the bus need not be locked for it.
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

/// Whether the one who leaves was the last, and so has the memory to free.
inline bool Leave(std::atomic<unsigned int> &owners) noexcept {
    // Somebody who holds the only copy need not take part in the counting.
    unsigned int const count = owners.load(std::memory_order_acquire);
    if (count == 1)
        return true;
    if (!IsSingleThreaded())
        return owners.fetch_sub(1, std::memory_order_acq_rel) == 1;
    owners.store(count - 1, std::memory_order_relaxed);
    return false;
}

} // namespace Basis::Counting
