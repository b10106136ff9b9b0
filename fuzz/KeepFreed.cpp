// The memory of a replay without sanitizers: what is freed is overwritten and not handed out again
// soon, so that an operation that looks into a removed object finds nothing that seems to live.

#include <cstdlib>
#include <cstring>
#include <malloc.h>
#include <utility>

extern "C" void __libc_free(void *block); // glibc's own

extern "C" void free(void *block) {
    constexpr std::size_t MOST_BLOCKS = 1 << 16;
    static void *kept[MOST_BLOCKS];
    static std::size_t next = 0;
    if (!block)
        return;
    std::memset(block, 0xDD, ::malloc_usable_size(block));
    __libc_free(std::exchange(kept[next++ % MOST_BLOCKS], block));
}
