// The operator new of the fault tests, in a source of its own so that the compiler cannot inline
// it.

#include <cstdlib>
#include <new>

long allocationsLeft = -1; ///< allocations until the one that fails; negative if none is to fail
bool allLaterFail = false; ///< whether those after it fail too

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
