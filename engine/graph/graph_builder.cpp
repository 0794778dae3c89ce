#include "graph/graph_builder.h"

#include <algorithm>

namespace Quorle {

namespace {

constexpr std::size_t LeastEdges = 1024;

std::uint64_t Hash(const OpenNode& open) {
    std::uint64_t hash = open.letters * 0x9e3779b97f4a7c15U;
    // The words before each edge follow from where the edges lead.
    for (std::uint32_t i = 0; i < open.count; ++i) {
        const std::uint64_t edge = std::uint64_t{open.edges[i].letters} << 32 | open.edges[i].first;
        hash = (std::rotl(hash, 23) ^ edge) * 0xd6e8feb86659fd93U;
    }
    return hash ^ hash >> 32;
}

}  // namespace

// Zeroed memory that the system hands out page by page as it is used: clearing a large table at
// once would take long.
GraphBuilder::Table::Table(std::size_t count)
    : slots(static_cast<Slot*>(std::calloc(count, sizeof(Slot)))),
      last(count - 1),
      room(count - count / 4) {
    if (!slots) throw std::bad_alloc();
}

/// The slot of the stored node of these edges, or the free one where it belongs.
GraphBuilder::Slot& GraphBuilder::Table::find(const OpenNode& open, std::uint64_t hash,
                                              const Edge* edges) const {
    for (std::size_t at = hash & last;; at = (at + 1) & last) {
        Slot& slot = slots[at];
        if (slot.first == 0) return slot;
        if (slot.letters != open.letters) continue;
        const Edge* const own = open.edges.data();
        if (std::equal(own, own + open.count, edges + slot.first)) return slot;
    }
}

GraphBuilder::GraphBuilder(std::size_t expectedEdges) : edges_(std::make_shared<EdgeStore>()) {
    const std::size_t expected = std::max(LeastEdges, expectedEdges);
    edges_->reserve(expected);
    tables_.emplace_back(std::bit_ceil(expected / 2));
}

void GraphBuilder::add(PackedWord word) {
    assert(last_ < word);
    const std::size_t length = LengthOf(word);
    closeNodes(SharedLetters(word, last_));
    for (; depth_ < length; ++depth_) {
        path_[depth_].open(1U << LetterAt(word, depth_));
        path_[depth_ + 1].letters = path_[depth_ + 1].count = path_[depth_ + 1].words = 0;
    }
    path_[depth_ - 1].endWord();
    last_ = word;
}

WordGraph GraphBuilder::finish() {
    closeNodes(0);
    return finish(store(path_[0]));
}

WordGraph GraphBuilder::finish(const StoredNode& root) {
    edges_->closeBase({root.letters, root.first});
    return WordGraph(std::move(edges_));
}

// Stores the nodes of the last word below `depth` letters, deepest first, and leads to them.
void GraphBuilder::closeNodes(std::size_t depth) {
    for (; depth_ > depth; --depth_) path_[depth_ - 1].lead(store(path_[depth_]));
}

StoredNode GraphBuilder::store(const OpenNode& open) {
    if (open.letters == 0) return {};
    const std::uint64_t hash = Hash(open);
    Slot* free = nullptr;
    for (auto table = tables_.rbegin(); table != tables_.rend(); ++table) {
        Slot& slot = table->find(open, hash, edges_->edges());
        if (slot.first != 0) return {open.letters, slot.first, open.words};
        if (free == nullptr) free = &slot;
    }
    if (tables_.back().room-- == 0) {
        Table& larger = tables_.emplace_back(2 * (tables_.back().last + 1));
        --larger.room;
        free = &larger.find(open, hash, edges_->edges());
    }
    if (edges_->room() < open.count) edges_->reserve(edges_->size() / 2 + Letters);
    *free = {edges_->append(open.count), open.letters};
    std::copy_n(open.edges.data(), open.count, edges_->edges() + free->first);
    return {open.letters, free->first, open.words};
}

}  // namespace Quorle
