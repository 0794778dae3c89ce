#pragma once
// New memory is handed over a page at a time as it is first written, each at the price of a trap;
// for much of it that costs more than the writing.
#include <sys/mman.h>
#include <unistd.h>

#include <cstddef>
#include <cstdint>

/// Has the system hand over the whole pages of new memory at once, where it can.
inline void Populate([[maybe_unused]] void* memory, [[maybe_unused]] std::size_t bytes) {
#if defined(MADV_POPULATE_WRITE)
    const auto page = static_cast<std::uintptr_t>(sysconf(_SC_PAGESIZE));
    const auto start = reinterpret_cast<std::uintptr_t>(memory);
    const std::uintptr_t begin = (start + page - 1) / page * page;
    const std::uintptr_t end = (start + bytes) / page * page;
    if (begin < end) madvise(reinterpret_cast<void*>(begin), end - begin, MADV_POPULATE_WRITE);
#endif
}
