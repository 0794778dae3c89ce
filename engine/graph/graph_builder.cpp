#include "graph/graph_builder.h"

#include <algorithm>
#include <unordered_map>

namespace Quorle {

namespace {

constexpr std::size_t LeastSlots = 512;
constexpr std::size_t SlotsAtOnce = 1 << 18;

std::uint32_t Hash(std::span<const Edge> node, std::uint32_t letters) {
    std::uint64_t hash = letters * 0x9e3779b97f4a7c15U;
    // The words before each edge follow from where the edges lead.
    for (const Edge& edge : node) {
        const std::uint64_t to = std::uint64_t{edge.letters} << 32 | edge.first;
        hash = (std::rotl(hash, 23) ^ to) * 0xd6e8feb86659fd93U;
    }
    return static_cast<std::uint32_t>(hash ^ hash >> 32);
}

}  // namespace

GraphBuilder::Table::Table(std::size_t count)
    : slots(TakeZeroed<Slot>(count)), last(count - 1), room(count - count / 4) {}

GraphBuilder::GraphBuilder(std::size_t expectedEdges) : edges_(std::make_shared<EdgeStore>()) {
    edges_->reserve(expectedEdges);
    tables_.emplace_back(std::bit_ceil(LeastSlots + expectedEdges / 2));
    levels_[0].count = 1;
}

void GraphBuilder::add(PackedWord word) {
    assert(last_ < word);
    const std::size_t length = LengthOf(word);
    const std::size_t shared = SharedLetters(word, last_);
    PackedWord rest = word << 8 * shared;
    levels_[shared].edges[levels_[shared].count - 1].letters |= 1U << FirstLetter(rest);
    for (std::size_t depth = shared + 1; depth <= length; ++depth) {
        rest <<= 8;
        const std::uint32_t letters = depth == length ? WordEnds : 1U << FirstLetter(rest);
        levels_[depth].edges[levels_[depth].count++] = {0, letters, words_ + letters / WordEnds};
    }
    last_ = word;
    open_ = length;
    if (++words_ % WordsAtOnce == 0) CountingBits([this] { storeClosedNodes(); });
}

WordGraph GraphBuilder::finish() {
    open_ = 0;
    storeClosedNodes();
    return finish(levels_[0].edges[0]);
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

/// The nodes of a level that are not stored and that no letters come to any more.
std::span<GraphBuilder::Node> GraphBuilder::closedNodes(std::size_t depth) {
    Level& before = levels_[depth - 1];
    Edge* edge = levels_[depth].edges.data();
    Node* end = nodes_.data();
    const std::size_t parents = before.count - (depth <= open_ ? 1 : 0);
    for (Edge& parent : std::span(before.edges.data(), parents)) {
        if (parent.first != 0) continue;  // stored before
        *end = {&parent, {edge, parent.count()}, 0};
        end += parent.next() != 0 ? 1 : 0;
        edge += parent.count();
    }
    return {nodes_.data(), end};
}

// The deepest first. Those of a level do not depend on each other, so what is needed of the table
// is fetched for all of them at once.
void GraphBuilder::storeClosedNodes() {
    for (std::size_t depth = LongestWord; depth > 0; --depth) {
        Level& level = levels_[depth];
        const std::span<Node> nodes = closedNodes(depth);
        const Table& table = tables_.back();
        for (Node& node : nodes) {
            const std::uint32_t before = node.edges[0].before - (node.edges[0].isWord() ? 1 : 0);
            for (Edge& edge : node.edges) edge.before -= before;
            node.hash = Hash(node.edges, node.parent->next());
            __builtin_prefetch(&table.slots[node.hash & table.last]);
        }
        for (const Node& node : nodes)
            __builtin_prefetch(edges_->edges() + table.slots[node.hash & table.last].first);
        std::size_t stored = 0;
        for (const Node& node : nodes) {
            node.parent->first = store(node.edges, node.parent->next(), node.hash);
            stored += node.edges.size();
        }
        Edge* const edges = level.edges.data();
        std::copy(edges + stored, edges + level.count, edges);
        level.count -= stored;
    }
}

std::uint32_t GraphBuilder::store(std::span<const Edge> node, std::uint32_t letters) {
    return node.empty() ? 0 : store(node, letters, Hash(node, letters));
}

std::uint32_t GraphBuilder::store(std::span<const Edge> node, std::uint32_t letters,
                                  std::uint32_t hash) {
    if (tables_.back().room == 0) tables_.emplace_back(4 * (tables_.back().last + 1));
    Slot* slot = nullptr;
    for (const Table& table : tables_) {
        for (std::size_t at = hash;; ++at) {
            slot = &table.slots[at & table.last];
            if (slot->first == 0) break;
            if (slot->letters == letters &&
                std::equal(node.begin(), node.end(), edges_->edges() + slot->first))
                return slot->first;
        }
    }
    *slot = {edges_->append(node.size()), letters};
    std::copy(node.begin(), node.end(), edges_->edges() + slot->first);
    --tables_.back().room;
    return slot->first;
}

namespace {

constexpr Edge NotYet{0, WordEnds, 0};

class Copier {
  public:
    Copier(const WordGraph& words, std::size_t longest, GraphBuilder& builder)
        : edges_(words.edges()), isCut_(longest < LongestWord), builder_(builder) {
        if (!isCut_) whole_.resize(words.edgesEnd(), NotYet);
    }

    // The node with the words of at most so many letters: what an edge says of it, and as its words
    // before those that go on from it.
    Edge copyNode(const Edge& to, std::size_t letters) {
        if (letters == 0 || to.next() == 0) return {};
        const std::uint64_t place = std::uint64_t{to.first} << 8 | letters;
        Edge& copy = isCut_ ? cut_.try_emplace(place, NotYet).first->second : whole_[to.first];
        if (copy != NotYet) return copy;
        copy = {};
        std::array<Edge, Letters> edges;
        std::size_t count = 0;
        const Edge* edge = edges_ + to.first;
        for (std::uint32_t left = to.next(); left != 0; left &= left - 1, ++edge) {
            const Edge child = copyNode(*edge, letters - 1);
            const std::uint32_t end = edge->letters & WordEnds;
            if ((child.letters | end) == 0) continue;
            copy.letters |= left & -left;
            copy.before += end / WordEnds;
            edges[count++] = {child.first, child.letters | end, copy.before};
            copy.before += child.before;
        }
        copy.first = builder_.store({edges.data(), count}, copy.letters);
        return copy;
    }

  private:
    const Edge* edges_;
    const bool isCut_;  // a node then becomes several, by the letters left where it stands
    GraphBuilder& builder_;
    std::vector<Edge> whole_;                      // by the node's first edge
    std::unordered_map<std::uint64_t, Edge> cut_;  // and the letters left; all stay in their places
};

}  // namespace

WordGraph CopyGraph(const WordGraph& words, std::size_t longest) {
    GraphBuilder builder(words.edgesEnd());
    return builder.finish(Copier(words, longest, builder).copyNode(words.root(), longest));
}

}  // namespace Quorle
