#include "graph/graph_builder.h"

#include <algorithm>
#include <unordered_map>

namespace Quorle {

namespace {

constexpr std::size_t LeastSlots = 512;
constexpr std::size_t SlotsAtOnce = 1 << 18;

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

GraphBuilder::Table::Table(std::size_t count)
    : slots(TakeZeroed<Slot>(count)), last(count - 1), room(count - count / 4) {}

/// The first edge of the stored node that is like the open one; 0 when there is none.
std::uint32_t GraphBuilder::Table::find(const OpenNode& open, std::uint64_t hash,
                                        const Edge* edges) const {
    for (std::size_t at = hash & last;; at = (at + 1) & last) {
        const Slot& slot = slots[at];
        if (slot.first == 0) return 0;
        if (slot.letters != open.letters) continue;
        const Edge* const own = open.edges.data();
        if (std::equal(own, own + open.count, edges + slot.first)) return slot.first;
    }
}

void GraphBuilder::Table::insert(Slot slot, std::uint64_t hash) {
    std::size_t at = hash & last;
    while (slots[at].first != 0) at = (at + 1) & last;
    slots[at] = slot;
    --room;
}

GraphBuilder::GraphBuilder(std::size_t expectedEdges) : edges_(std::make_shared<EdgeStore>()) {
    edges_->reserve(expectedEdges);
    tables_.emplace_back(std::bit_ceil(LeastSlots + expectedEdges / 2));
}

void GraphBuilder::add(PackedWord word) {
    assert(last_ < word);
    const std::size_t length = LengthOf(word);
    closeNodes(SharedLetters(word, last_));
    for (; depth_ < length; ++depth_) {
        path_[depth_].open(1U << LetterAt(word, depth_));
        path_[depth_ + 1].clear();
    }
    path_[depth_ - 1].endWord();
    last_ = word;
}

WordGraph GraphBuilder::finish() {
    closeNodes(0);
    return finish(store(path_[0]));
}

WordGraph GraphBuilder::finish(const Edge& root) {
    edges_->closeBase({root.first, root.letters});
    return WordGraph(edges_);
}

bool GraphBuilder::giveBack() {
    if (tables_.empty()) return false;
    Table& table = tables_.back();
    if (table.last >= SlotsAtOnce) Resize(table.slots, (table.last -= SlotsAtOnce) + 1);
    if (table.last < SlotsAtOnce) tables_.pop_back();
    return true;
}

// Stores the nodes of the last word below `depth` letters, deepest first, and leads to them.
void GraphBuilder::closeNodes(std::size_t depth) {
    for (; depth_ > depth; --depth_) {
        if (path_[depth_].letters == 0) continue;
        const std::size_t size = edges_->size();
        path_[depth_ - 1].lead(store(path_[depth_]));
        if (edges_->size() > size) path_[depth_ - 1].isNew = true;
    }
}

Edge GraphBuilder::store(const OpenNode& open) {
    if (open.letters == 0) return {};
    const std::uint64_t hash = Hash(open);
    for (auto table = tables_.rbegin(); !open.isNew && table != tables_.rend(); ++table) {
        const std::uint32_t first = table->find(open, hash, edges_->edges());
        if (first != 0) return {first, open.letters, open.words};
    }
    const std::uint32_t first = edges_->append(open.count);
    std::copy_n(open.edges.data(), open.count, edges_->edges() + first);
    if (tables_.back().room == 0) tables_.emplace_back(4 * (tables_.back().last + 1));
    tables_.back().insert({first, open.letters}, hash);
    return {first, open.letters, open.words};
}

namespace {

class Copier {
  public:
    explicit Copier(const WordGraph& words)
        : edges_(words.edges()),
          builder_(words.edgesEnd()),
          heights_(words.edgesEnd()),
          whole_(words.edgesEnd()) {}

    WordGraph copy(const Edge& root, std::size_t longest) {
        return builder_.finish(copyNode(root, longest));
    }

  private:
    // The node with the words of at most so many letters. A node that is cut at several places
    // becomes several nodes; where nothing is cut off, the place makes no difference.
    Edge copyNode(const Edge& to, std::size_t letters) {
        if (letters == 0 || to.next() == 0) return {};
        if (letters >= height(to)) {
            Edge& whole = whole_[to.first];
            if (whole.letters == 0) whole = copyEdges(to, letters);
            return whole;
        }
        const auto [at, isNew] = cut_.try_emplace(std::uint64_t{to.first} << 8 | letters);
        Edge& cut = at->second;  // stays there while more are added
        if (isNew) cut = copyEdges(to, letters);
        return cut;
    }

    Edge copyEdges(const Edge& to, std::size_t letters) {
        OpenNode open;
        const Edge* edge = edges_ + to.first;
        for (std::uint32_t left = to.next(); left != 0; left &= left - 1, ++edge) {
            const Edge child = copyNode(*edge, letters - 1);
            if (child.letters == 0 && !edge->isWord()) continue;
            open.open(left & -left);
            if (edge->isWord()) open.endWord();
            open.lead(child);
        }
        return builder_.store(open);
    }

    // The letters of the longest word below the node.
    std::size_t height(const Edge& to) {
        if (to.next() == 0 || heights_[to.first] != 0) return heights_[to.first];
        std::size_t highest = 0;
        for (std::uint32_t i = 0; i < to.count(); ++i) {
            highest = std::max(highest, 1 + height(edges_[to.first + i]));
        }
        heights_[to.first] = static_cast<std::uint8_t>(highest);
        return highest;
    }

    const Edge* edges_;
    GraphBuilder builder_;
    // Of nodes, by their first edge.
    std::vector<std::uint8_t> heights_;
    std::vector<Edge> whole_;
    std::unordered_map<std::uint64_t, Edge> cut_;  // and by the letters left
};

}  // namespace

WordGraph CopyGraph(const WordGraph& words, std::size_t longest) {
    return Copier(words).copy(words.root(), longest);
}

}  // namespace Quorle
