#include "tool/session/Limits.h"

namespace {

// What a sanitizer keeps beside the memory of the program counts as data too: terabytes.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool SANITIZED = true;
#elif defined(__has_feature)
constexpr bool SANITIZED = __has_feature(address_sanitizer) || __has_feature(thread_sanitizer);
#else
constexpr bool SANITIZED = false;
#endif

} // namespace

void MemoryLimit::Apply() {
    if (SANITIZED || size == 0 || applied || ::getrlimit(RLIMIT_DATA, &former) != 0)
        return;
    rlimit wanted = former;
    if (wanted.rlim_cur == RLIM_INFINITY || wanted.rlim_cur > size)
        wanted.rlim_cur = size; // the hard limit stays, so that this one can be lifted
    applied = ::setrlimit(RLIMIT_DATA, &wanted) == 0;
}

void MemoryLimit::Lift() {
    if (applied)
        applied = ::setrlimit(RLIMIT_DATA, &former) != 0;
}

std::string SizeText(unsigned long long bytes) {
    constexpr char UNITS[] = {'k', 'M', 'G', 'T'};
    std::string unit;
    for (char const larger : UNITS) {
        if (bytes == 0 || bytes % 1024 != 0)
            break;
        bytes /= 1024;
        unit = larger;
    }
    return std::to_string(bytes) + (unit.empty() ? " bytes" : unit);
}
