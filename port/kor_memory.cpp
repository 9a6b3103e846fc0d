#include "port/kor_memory.h"

#include <cstdint>
#include <cstdlib>

#if defined(__linux__)
#include <sys/mman.h>
#endif

void* kor_malloc(size_t size) { return std::malloc(size ? size : 1); }

void* kor_realloc(void* p, size_t size) { return std::realloc(p, size ? size : 1); }

void kor_free(void* p) { std::free(p); }

void* kor_allocBlock(size_t size) {
#if defined(__linux__) && defined(MADV_HUGEPAGE)
    // Map 2 MB more than asked and keep a 2 MB aligned part: the kernel can
    // back aligned ranges with huge pages.
    const size_t huge = size_t(2) << 20;
    void* raw = mmap(nullptr, size + huge, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (raw == MAP_FAILED) return nullptr;
    const uintptr_t start = reinterpret_cast<uintptr_t>(raw);
    const uintptr_t aligned = (start + huge - 1) & ~(uintptr_t(huge) - 1);
    if (aligned > start) munmap(raw, aligned - start);
    const uintptr_t end = start + size + huge, used = aligned + size;
    if (end > used) munmap(reinterpret_cast<void*>(used), end - used);
    madvise(reinterpret_cast<void*>(aligned), size, MADV_HUGEPAGE);
    return reinterpret_cast<void*>(aligned);
#else
    return std::malloc(size);
#endif
}
