#pragma once
// Building minimal graphs: of sorted words in one pass, or of another graph.
#include <array>
#include <memory>
#include <span>
#include <vector>

#include "graph/memory.h"
#include "graph/packed_word.h"
#include "graph/word_graph.h"

namespace Quorle {

/// Takes words in strictly ascending order, one by one, each in bounded time; so is finishing.
class GraphBuilder {
  public:
    /// Makes room ahead for about so many edges, which saves moving what is built as it grows.
    explicit GraphBuilder(std::size_t expectedEdges);

    /// `word`: after every word before it. When std::bad_alloc is thrown the builder is of no use.
    void add(PackedWord word);
    /// The graph of all words added. The builder is of no more use.
    WordGraph finish();
    /// Then: gives some memory back, for all at once takes long; false when there is no more.
    bool giveBack();

    /// Instead of words, nodes can be stored one by one, children first: by the edges of these
    /// letters. Gives the index of the first edge; 0 for no edges.
    std::uint32_t store(std::span<const Edge> node, std::uint32_t letters);
    /// The graph of a node stored, or of none.
    WordGraph finish(const Edge& root);

  private:
    // Where stored nodes are found by their edges: a hash table with open addressing.
    struct Slot {
        std::uint32_t first;  // 0: free
        std::uint32_t letters;
    };
    struct Table {
        explicit Table(std::size_t slots);
        Memory<Slot> slots;
        std::size_t last;
        std::size_t room;
    };
    static constexpr std::uint32_t WordsAtOnce = 256;
    /// The edges with as many letters before their ends that are not stored yet, in order. They
    /// count all words before them until they are stored.
    struct Level {
        std::array<Edge, WordsAtOnce + Letters> edges;
        std::size_t count = 0;
    };
    /// To be stored.
    struct Node {
        Edge* parent;  // the edge that leads to it
        std::span<Edge> edges;
        std::uint32_t hash;
    };

    std::span<Node> closedNodes(std::size_t depth);
    void storeClosedNodes();
    std::uint32_t store(std::span<const Edge> node, std::uint32_t letters, std::uint32_t hash);

    std::shared_ptr<EdgeStore> edges_;
    std::array<Level, LongestWord + 1> levels_{};  // the first one: of the root's edge
    std::array<Node, WordsAtOnce + 1> nodes_;
    PackedWord last_ = 0;
    std::size_t open_ = 0;  // levels with a node that letters can still come to
    std::uint32_t words_ = 0;
    // When a table is full a larger one is begun, and both are looked at: moving one takes long.
    std::vector<Table> tables_;
};

/// The graph made anew of the words of at most `longest` letters (1 to 16): minimal again after
/// edits. Goes by nodes, not by words: a small graph may spell a huge number of them. Throws
/// std::bad_alloc.
WordGraph CopyGraph(const WordGraph& words, std::size_t longest);

}  // namespace Quorle
