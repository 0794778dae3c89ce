#pragma once
// Building minimal graphs: of sorted words in one pass, or of another graph.
#include <array>
#include <memory>
#include <vector>

#include "graph/memory.h"
#include "graph/packed_word.h"
#include "graph/word_graph.h"

namespace Quorle {

/// A node that is still open for more letters.
struct OpenNode {
    std::uint32_t letters = 0;
    std::uint32_t count = 0;
    std::uint32_t words = 0;
    bool isNew = false;  // as is known of what leads to a new node
    std::array<Edge, Letters> edges;

    void clear() {
        letters = count = words = 0;
        isNew = false;
    }
    /// `bit`: of a letter after all that are there.
    void open(std::uint32_t bit) {
        assert(letters < bit);
        letters |= bit;
        edges[count++] = {0, 0, words};
    }
    /// A word ends with the last letter.
    void endWord() {
        edges[count - 1].letters |= WordEnds;
        edges[count - 1].before = ++words;
    }
    /// The last letter leads to a stored node.
    void lead(const Edge& node) {
        edges[count - 1].letters |= node.letters;
        edges[count - 1].first = node.first;
        words += node.before;
    }
};

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

    /// Instead of words, nodes can be stored one by one, children first. Gives what an edge says
    /// of the node, and as its words before those that go on from it.
    Edge store(const OpenNode& open);
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
        std::uint32_t find(const OpenNode& open, std::uint64_t hash, const Edge* edges) const;
        void insert(Slot slot, std::uint64_t hash);
        Memory<Slot> slots;
        std::size_t last;
        std::size_t room;
    };

    void closeNodes(std::size_t depth);

    std::shared_ptr<EdgeStore> edges_;
    std::array<OpenNode, LongestWord + 1> path_;
    PackedWord last_ = 0;
    std::size_t depth_ = 0;  // letters of the last word
    // When a table is full a larger one is begun, and both are looked at: moving one takes long.
    std::vector<Table> tables_;
};

/// The graph made anew of the words of at most `longest` letters (1 to 16): minimal again after
/// edits. Goes by nodes, not by words: a small graph may spell a huge number of them. Throws
/// std::bad_alloc.
WordGraph CopyGraph(const WordGraph& words, std::size_t longest);

}  // namespace Quorle
