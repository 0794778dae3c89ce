#include "graph/edge_store.h"

#include <algorithm>

namespace Quorle {

constexpr std::size_t MostEdges = 0x7fffffffU;

std::uint32_t CountWords(const Edge* edges, const Edge& edge) {
    std::uint32_t count = 0;
    // A node's words are those up to its last letter, and what goes on from there.
    for (const Edge* at = &edge; at->next() != 0;) {
        at = edges + at->first + at->count() - 1;
        count += at->before;
    }
    return count;
}

void EdgeStore::reserve(std::size_t count) {
    const std::size_t needed = size_ + count;
    if (needed <= capacity_) return;
    if (needed > MostEdges) throw std::bad_alloc();
    const std::size_t capacity = std::max(needed, capacity_ + capacity_ / 8);
    Resize(edges_, capacity + 1);
    capacity_ = capacity;
}

std::uint32_t EdgeStore::append(std::size_t count) {
    reserve(count);
    size_ += count;
    return static_cast<std::uint32_t>(size_ - count);
}

void EdgeStore::closeBase(const Edge& root) {
    edges_[0] = root;
    baseEnd_ = static_cast<std::uint32_t>(size_);
    capacity_ = size_;
    Resize(edges_, capacity_ + 1);
}

std::uint32_t EdgeStore::allocate(std::uint32_t count) {
    std::uint32_t first = free_[count];
    if (first != 0) {
        free_[count] = references(first);
    } else {
        first = append(1 + std::size_t{count}) + 1;
    }
    references(first) = 1;
    return first;
}

void EdgeStore::free(std::uint32_t first, std::uint32_t count) {
    references(first) = free_[count];
    free_[count] = first;
}

void EdgeStore::hold(const Edge& edge) {
    if (isEdited(edge.first)) ++references(edge.first);
}

void EdgeStore::release(const Edge& edge) {
    if (!isEdited(edge.first) || --references(edge.first) > 0) return;
    const std::uint32_t count = edge.count();
    for (std::uint32_t i = 0; i < count; ++i) release(edges_[edge.first + i]);
    free(edge.first, count);
}

}  // namespace Quorle
