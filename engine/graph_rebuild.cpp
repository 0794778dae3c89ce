#include "graph_rebuild.h"

#include <algorithm>
#include <unordered_map>
#include <vector>

#include "graph_builder.h"

namespace {

class Rebuilder {
  public:
    explicit Rebuilder(const WordGraph& words)
        : nodes_(words.nodes()), heights_(words.nodesEnd()), wholes_(words.nodesEnd()) {}

    WordGraph rebuild(NodeIndex root, std::uint32_t longest) {
        const Part whole = copy(root, longest);
        return builder_.finish(whole.node, whole.words);
    }

  private:
    struct Part {
        NodeIndex node = NoNode;
        std::uint32_t words = 0;
    };

    // The node with the words of at most so many letters. A node that is cut at several places
    // becomes several nodes; where nothing is cut off, the place makes no difference.
    Part copy(NodeIndex node, std::uint32_t letters) {
        if (letters == 0 || node == NoNode) return {};
        if (letters >= height(node)) {
            Part& whole = wholes_[node];
            if (whole.node == NoNode) whole = copyBelow(node, letters);
            return whole;
        }
        const auto [place, isNew] = cuts_.try_emplace(std::uint64_t{node} << 8 | letters);
        Part& cut = place->second;
        if (isNew) cut = copyBelow(node, letters);
        return cut;
    }

    Part copyBelow(NodeIndex node, std::uint32_t letters) {
        OpenNode open;
        const std::uint32_t* link = nodes_ + node + 1;
        for (std::uint32_t left = nodes_[node]; left != 0; left &= left - 1, link += 2) {
            const Part child = copy(ChildOf(link[0]), letters - 1);
            const std::uint32_t wordEnds = link[0] & WordEnds;
            if ((child.node | wordEnds) == 0) continue;
            open.open(left & -left, child.node | wordEnds);
            open.words += child.words + (wordEnds >> 31);
        }
        return {builder_.store(open), open.words};
    }

    // The letters of the longest word below the node.
    std::uint32_t height(NodeIndex node) {
        if (node == NoNode || heights_[node] != 0) return heights_[node];
        std::uint32_t highest = 0;
        for (std::uint32_t i = 0; i < EdgeCount(nodes_[node]); ++i) {
            highest = std::max(highest, 1 + height(ChildOf(nodes_[node + 1 + 2 * i])));
        }
        heights_[node] = static_cast<std::uint8_t>(highest);
        return highest;
    }

    const std::uint32_t* nodes_;
    GraphBuilder builder_;
    std::vector<std::uint8_t> heights_;
    std::vector<Part> wholes_;                      // of nodes copied whole
    std::unordered_map<std::uint64_t, Part> cuts_;  // of nodes cut, with where
};

}  // namespace

WordGraph Rebuilt(const WordGraph& words, std::uint32_t longest) {
    return Rebuilder(words).rebuild(words.root(), longest);
}
