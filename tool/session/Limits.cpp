#include "tool/session/Limits.h"

#include <charconv>
#include <limits>
#include <system_error>

namespace {

// The shadow memory of a sanitizer, which is terabytes, counts as data of the process: under a
// sanitizer no limit can be set.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr bool SANITIZED = true;
#elif defined(__has_feature)
constexpr bool SANITIZED = __has_feature(address_sanitizer) || __has_feature(thread_sanitizer);
#else
constexpr bool SANITIZED = false;
#endif

constexpr std::string_view UNITS = "kMGT";
constexpr unsigned long long UNIT = 1024; ///< in each, those of the one before

} // namespace

/// RLIMIT_DATA and not RLIMIT_AS: address space that is only reserved costs nothing.
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
    std::string unit = " bytes";
    for (char const larger : UNITS) {
        if (bytes == 0 || bytes % UNIT != 0)
            break;
        bytes /= UNIT;
        unit = larger;
    }
    return std::to_string(bytes) + unit;
}

unsigned long long BytesOf(std::string_view text) {
    char const *const end = text.data() + text.size();
    unsigned long long size = 0;
    auto const [rest, error] = std::from_chars(text.data(), end, size);
    if (error != std::errc())
        return 0;
    std::size_t units = 0;
    if (rest != end) {
        units = UNITS.find(*rest == 'K' ? 'k' : *rest) + 1;
        if (rest + 1 != end || units == 0)
            return 0;
    }
    for (; units > 0; --units)
        // An overflow gives 0, which the options refuse.
        size = size > std::numeric_limits<unsigned long long>::max() / UNIT ? 0 : size * UNIT;
    return size;
}
