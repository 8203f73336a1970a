#include "tests/faults/MemoryFaults.h"

#include <atomic>
#include <cerrno>
#include <cstdlib>
#include <new>
#include <string_view>

#include <dlfcn.h>

// NOLINTBEGIN(bugprone-reserved-identifier): the names are those of the C library and the
// sanitizer.
#if defined(DRAWMERE_SANITIZED)
#define REAL(name) __interceptor_##name // NOLINT(cppcoreguidelines-macro-usage): it makes a name
#else
#define REAL(name) __libc_##name // NOLINT(cppcoreguidelines-macro-usage): it makes a name
#endif

extern "C" {
void* REAL(malloc)(std::size_t size);
void* REAL(calloc)(std::size_t count, std::size_t size);
void* REAL(realloc)(void* block, std::size_t size);
void* REAL(memalign)(std::size_t alignment, std::size_t size);
void REAL(free)(void* block);
}

namespace DrawmereTest {
namespace {

struct Plan {
    MemoryFaults::Mode mode = MemoryFaults::NONE;
    std::size_t number = 0;
    std::size_t asked = 0;
    std::size_t failed = 0;
    bool isOn = false;
};

constinit thread_local Plan plan;
constinit std::atomic<std::ptrdiff_t> live = 0;

/// HarfBuzz goes on with less when it gets no memory, and has no way to say so.
bool isSpared(const void* caller) {
    Dl_info place = {};
    return caller && dladdr(caller, &place) != 0 &&
           std::string_view(place.dli_fname).find("libharfbuzz") != std::string_view::npos;
}

bool mayAllocate(const void* caller) {
    if (!plan.isOn) {
        return true;
    }
    const std::size_t number = plan.asked++;
    const bool fails = plan.mode == MemoryFaults::ALL_FROM_THEN_ON
                           ? number >= plan.number
                           : plan.mode == MemoryFaults::ONE && number == plan.number;
    if (fails && isSpared(caller)) {
        return true;
    }
    if (fails) {
        ++plan.failed;
        errno = ENOMEM;
    }
    return !fails;
}

void* counted(void* block) {
    live.fetch_add(block ? 1 : 0, std::memory_order_relaxed);
    return block;
}

void* allocate(std::size_t size, const void* caller = nullptr) {
    return mayAllocate(caller) ? counted(REAL(malloc)(size)) : nullptr;
}

void* allocateAligned(std::size_t alignment, std::size_t size) {
    return mayAllocate(nullptr) ? counted(REAL(memalign)(alignment, size)) : nullptr;
}

void release(void* block) {
    live.fetch_sub(block ? 1 : 0, std::memory_order_relaxed);
    REAL(free)(block);
}

void* orThrow(void* block) {
    if (!block) {
        throw std::bad_alloc();
    }
    return block;
}

} // namespace

MemoryFaults::MemoryFaults(Mode mode, std::size_t number) {
    plan = {.mode = mode, .number = number, .asked = 0, .failed = 0, .isOn = true};
}

MemoryFaults::~MemoryFaults() { end(); }

void MemoryFaults::end() { plan.isOn = false; }

std::size_t MemoryFaults::countAsked() { return plan.asked; }

std::size_t MemoryFaults::countFailed() { return plan.failed; }

std::ptrdiff_t MemoryFaults::countLive() { return live.load(std::memory_order_relaxed); }

} // namespace DrawmereTest

// These take the places of the C library's and the sanitizer's own for the whole program, shared
// libraries included.
using namespace DrawmereTest;

extern "C" {
void* malloc(std::size_t size) { return allocate(size, __builtin_return_address(0)); }

void* calloc(std::size_t count, std::size_t size) {
    return mayAllocate(__builtin_return_address(0)) ? counted(REAL(calloc)(count, size)) : nullptr;
}

void* realloc(void* block, std::size_t size) {
    if (!mayAllocate(__builtin_return_address(0))) {
        return nullptr;
    }
    void* const grown = REAL(realloc)(block, size);
    const bool isNew = !block && grown;
    const bool isGone = block && !grown && size == 0;
    live.fetch_add(isNew ? 1 : isGone ? -1 : 0, std::memory_order_relaxed);
    return grown;
}

int posix_memalign(void** block, std::size_t alignment, std::size_t size) {
    void* const made = allocateAligned(alignment, size);
    if (!made) {
        return ENOMEM;
    }
    *block = made;
    return 0;
}

void* aligned_alloc(std::size_t alignment, std::size_t size) {
    return allocateAligned(alignment, size);
}

void* memalign(std::size_t alignment, std::size_t size) { return allocateAligned(alignment, size); }

void free(void* block) { release(block); }
}

// NOLINTEND(bugprone-reserved-identifier)

void* operator new(std::size_t size) { return orThrow(allocate(size)); }

void* operator new[](std::size_t size) { return orThrow(allocate(size)); }

void* operator new(std::size_t size, const std::nothrow_t&) noexcept { return allocate(size); }

void* operator new[](std::size_t size, const std::nothrow_t&) noexcept { return allocate(size); }

void* operator new(std::size_t size, std::align_val_t alignment) {
    return orThrow(allocateAligned(static_cast<std::size_t>(alignment), size));
}

void* operator new[](std::size_t size, std::align_val_t alignment) {
    return orThrow(allocateAligned(static_cast<std::size_t>(alignment), size));
}

void operator delete(void* block) noexcept { release(block); }

void operator delete[](void* block) noexcept { release(block); }

void operator delete(void* block, std::size_t) noexcept { release(block); }

void operator delete[](void* block, std::size_t) noexcept { release(block); }

void operator delete(void* block, std::align_val_t) noexcept { release(block); }

void operator delete[](void* block, std::align_val_t) noexcept { release(block); }

void operator delete(void* block, std::size_t, std::align_val_t) noexcept { release(block); }

void operator delete[](void* block, std::size_t, std::align_val_t) noexcept { release(block); }
