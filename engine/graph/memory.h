#pragma once
// Large arrays from the C library, which moves them by their pages.
#include <cstdlib>
#include <memory>
#include <new>

namespace Quorle {

struct FreeMemory {
    void operator()(void* memory) const { std::free(memory); }
};

/// Of items that can be moved as bytes. Whoever owns it knows its size.
template <class Item>
using Memory = std::unique_ptr<Item[], FreeMemory>;

/// All zero. The system hands the pages out as they are used, so they take neither time nor memory
/// for what is not. Throws std::bad_alloc.
template <class Item>
Memory<Item> TakeZeroed(std::size_t count) {
    Memory<Item> memory(static_cast<Item*>(std::calloc(count, sizeof(Item))));
    if (!memory) throw std::bad_alloc();
    return memory;
}

/// Keeps the items there are, up to `count`. Throws std::bad_alloc and changes nothing.
template <class Item>
void Resize(Memory<Item>& memory, std::size_t count) {
    void* const resized = std::realloc(static_cast<void*>(memory.get()), count * sizeof(Item));
    if (resized == nullptr) throw std::bad_alloc();
    static_cast<void>(memory.release());
    memory.reset(static_cast<Item*>(resized));
}

}  // namespace Quorle
