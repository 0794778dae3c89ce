#pragma once
// New memory is handed over a page at a time as it is first written, each at the price of a trap;
// for much of it that costs more than the writing.
#include <sys/mman.h>
#include <unistd.h>

#include <cstddef>
#include <cstdint>

namespace Quorle {

/// Has the system hand over the whole pages of new memory at once, where it can.
inline void Populate([[maybe_unused]] void* memory, [[maybe_unused]] std::size_t bytes) {
#if defined(MADV_POPULATE_WRITE)
    const auto page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
    const std::size_t before = (page - reinterpret_cast<std::uintptr_t>(memory) % page) % page;
    if (before >= bytes) return;
    madvise(static_cast<char*>(memory) + before, (bytes - before) / page * page,
            MADV_POPULATE_WRITE);
#endif
}

}  // namespace Quorle
