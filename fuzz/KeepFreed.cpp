// Replaces free() in a replay without sanitizers: freed memory is overwritten and reused late, so
// that an operation that reads a removed object does not find its former content.

#include <cstdlib>
#include <cstring>
#include <malloc.h>
#include <utility>

extern "C" void __libc_free(void *block); // glibc's own

extern "C" void free(void *block) {
    constexpr std::size_t MAX_BLOCKS = 1 << 16;
    static void *kept[MAX_BLOCKS];
    static std::size_t next = 0;
    if (!block)
        return;
    std::memset(block, 0xDD, ::malloc_usable_size(block));
    __libc_free(std::exchange(kept[next++ % MAX_BLOCKS], block));
}
