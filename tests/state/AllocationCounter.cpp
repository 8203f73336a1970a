#include "tests/state/AllocationCounter.h"

namespace {

thread_local std::size_t allocations = 0;

} // namespace

// ICU and the tree allocate by `malloc` and the rest by `new`, which stands on it, so one counter
// sees them all.
// NOLINTBEGIN(bugprone-reserved-identifier): the names are those of the C library and the
// sanitizer.
#if defined(__SANITIZE_ADDRESS__)

extern "C" int __sanitizer_install_malloc_and_free_hooks(void (*onAllocation)(const volatile void*,
                                                                              std::size_t),
                                                         void (*onRelease)(const volatile void*));

namespace {

const int hooks = __sanitizer_install_malloc_and_free_hooks(
    [](const volatile void*, std::size_t) { ++allocations; }, [](const volatile void*) {});

} // namespace

#else

extern "C" {
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* block, std::size_t size);

void* malloc(std::size_t size) {
    ++allocations;
    return __libc_malloc(size);
}

void* calloc(std::size_t count, std::size_t size) {
    ++allocations;
    return __libc_calloc(count, size);
}

void* realloc(void* block, std::size_t size) {
    ++allocations;
    return __libc_realloc(block, size);
}
}

#endif
// NOLINTEND(bugprone-reserved-identifier)

namespace DrawmereTest {

AllocationCounter::AllocationCounter() : before(allocations) {}

std::size_t AllocationCounter::getCount() const { return allocations - before; }

} // namespace DrawmereTest
