#pragma once
// Large arrays that are zero at first. The system hands their pages out as they are used, so they
// take neither time nor memory for what is not.
#include <cstdlib>
#include <memory>
#include <new>

namespace Quorle {

struct FreeMemory {
    void operator()(void* memory) const { std::free(memory); }
};

template <class Item>
using ZeroedMemory = std::unique_ptr<Item[], FreeMemory>;

/// Throws std::bad_alloc.
template <class Item>
ZeroedMemory<Item> TakeZeroed(std::size_t count) {
    ZeroedMemory<Item> memory(static_cast<Item*>(std::calloc(count, sizeof(Item))));
    if (!memory) throw std::bad_alloc();
    return memory;
}

/// Gives back what is behind `count` items.
template <class Item>
void Shrink(ZeroedMemory<Item>& memory, std::size_t count) {
    void* const shrunk = std::realloc(memory.get(), count * sizeof(Item));
    if (shrunk == nullptr) return;
    static_cast<void>(memory.release());
    memory.reset(static_cast<Item*>(shrunk));
}

}  // namespace Quorle
