// The operator new of the fault tests. A source of its own: the compiler may not look through it.

#include <cstdlib>
#include <new>

long allocationsLeft = -1; ///< until the one that fails; negative: none does
bool allLaterFail = false; ///< and not that one alone

void *operator new(std::size_t size) {
    if (allocationsLeft >= 0 && allocationsLeft-- == 0) {
        allocationsLeft += allLaterFail ? 1 : 0;
        throw std::bad_alloc();
    }
    if (void *const block = std::malloc(size ? size : 1))
        return block;
    throw std::bad_alloc();
}
void operator delete(void *block) noexcept { std::free(block); }
void operator delete(void *block, std::size_t) noexcept { std::free(block); }
