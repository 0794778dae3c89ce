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

}  // namespace Quorle
