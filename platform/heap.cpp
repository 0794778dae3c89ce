#include "platform/heap.h"

#include <malloc.h>
#include <sys/mman.h>
#include <unistd.h>

#include <cstdlib>

namespace {

// What the heap holds at the first paint, so none is asked for in vain.
constexpr int UsedAtStart = 512 * 1024;

}  // namespace

void Platform::PrepareHeap() {
    // Larger than what is freed below, or it would not stay with the heap.
    mallopt(M_MMAP_THRESHOLD, 2 * UsedAtStart);
    mallopt(M_TRIM_THRESHOLD, 2 * UsedAtStart);
    void* heap = std::aligned_alloc(static_cast<std::size_t>(sysconf(_SC_PAGESIZE)), UsedAtStart);
#if defined(MADV_POPULATE_WRITE)
    if (heap != nullptr) madvise(heap, UsedAtStart, MADV_POPULATE_WRITE);
#endif
    std::free(heap);
}

void Platform::TrimHeap() {
    malloc_trim(0);
}
