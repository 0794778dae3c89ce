#include <algorithm>
#include <unordered_map>

#include "graph/graph_builder.h"

namespace Quorle {

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
        const auto [cut, isNew] = cut_.try_emplace(std::uint64_t{to.first} << 8 | letters);
        if (isNew) cut->second = copyEdges(to, letters);
        return cut->second;
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
