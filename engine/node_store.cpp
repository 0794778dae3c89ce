#include "node_store.h"

#include <algorithm>
#include <cstdlib>
#include <new>

namespace {

// A link has 31 bits for the index.
constexpr std::size_t MostWords = 0x7fffffffU;

}  // namespace

NodeStore::NodeStore() {
    reserve(1);
    words_[append(1)] = 0;
}

NodeStore::~NodeStore() {
    std::free(words_);
}

void NodeStore::reserve(std::size_t count) {
    const std::size_t needed = size_ + count;
    if (needed <= capacity_) return;
    if (needed > MostWords) throw std::bad_alloc();
    // Small steps: memory, not time, is what an edit should spare, and the C library moves large
    // arrays by their pages.
    const std::size_t capacity = std::max(needed, capacity_ + capacity_ / 16);
    void* grown = std::realloc(words_, capacity * sizeof(std::uint32_t));
    if (grown == nullptr) throw std::bad_alloc();
    words_ = static_cast<std::uint32_t*>(grown);
    capacity_ = capacity;
}

NodeIndex NodeStore::append(std::size_t count) {
    const auto index = static_cast<NodeIndex>(size_);
    size_ += count;
    return index;
}

void NodeStore::shrink() {
    void* shrunk = std::realloc(words_, size_ * sizeof(std::uint32_t));
    if (shrunk == nullptr) return;
    words_ = static_cast<std::uint32_t*>(shrunk);
    capacity_ = size_;
}

void NodeStore::closeBase(NodeIndex root) {
    baseRoot_ = root;
    baseEnd_ = static_cast<NodeIndex>(size_);
}

NodeIndex NodeStore::allocate(std::uint32_t edges) {
    NodeIndex node = free_[edges];
    if (node != NoNode) {
        free_[edges] = words_[node];
    } else {
        node = append(2 + 2 * std::size_t{edges}) + 1;
    }
    references(node) = 1;
    return node;
}

void NodeStore::free(NodeIndex node, std::uint32_t edges) {
    words_[node] = free_[edges];
    free_[edges] = node;
}

void NodeStore::hold(NodeIndex node) {
    if (isEdited(node)) ++references(node);
}

void NodeStore::release(NodeIndex node) {
    if (!isEdited(node) || --references(node) > 0) return;
    const std::uint32_t edges = EdgeCount(words_[node]);
    for (std::uint32_t i = 0; i < edges; ++i) release(ChildOf(words_[node + 1 + 2 * i]));
    free(node, edges);
}
