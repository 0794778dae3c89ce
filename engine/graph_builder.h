#pragma once
// Building the minimal graph of sorted words in one pass.
#include <array>
#include <cstdlib>
#include <memory>
#include <string_view>
#include <vector>

#include "word_graph.h"

/// A node that is still open for more letters.
struct OpenNode {
    std::uint32_t mask = 0;
    std::uint32_t edges = 0;
    std::uint32_t words = 0;
    std::array<std::uint32_t, 2 * Letters> content{};  // link, skip, link, skip, ...

    /// `bit`: of a letter after all that are there. The words below it are yet to be counted.
    void open(std::uint32_t bit, std::uint32_t link) {
        mask |= bit;
        content[2 * edges] = link;
        content[2 * edges + 1] = words;
        ++edges;
    }
};

/// Takes words in strictly ascending order, one by one, each in bounded time; so is finishing.
class GraphBuilder {
  public:
    /// Makes room ahead for about so many words, which saves moving what is built as it grows.
    explicit GraphBuilder(std::size_t expectedWords = 0);

    /// `word`: 1 to 16 letters, after every word before it. Throws std::bad_alloc; then the
    /// builder is of no more use.
    void add(std::string_view word);
    /// The graph of all words added. The builder is of no more use.
    WordGraph finish();

    /// Instead of words, nodes can be stored one by one, children first: the stored node of this
    /// content, one that was there before or a new one. NoNode when it has no letters.
    NodeIndex store(const OpenNode& open);
    /// The graph of the node stored last, or of none.
    WordGraph finish(NodeIndex root, std::uint32_t words);

  private:
    // The stored nodes by their content: a hash table with open addressing.
    struct Slot {
        NodeIndex node;  // NoNode: free
        std::uint32_t hash;
    };
    struct Free {
        void operator()(Slot* slots) const { std::free(slots); }
    };
    struct Register {
        explicit Register(std::size_t slotCount);
        std::unique_ptr<Slot[], Free> slots;
        std::size_t size;
    };

    void closeNodes(std::size_t depth);
    NodeIndex append(const OpenNode& open);
    Slot& find(const Register& table, const OpenNode& open, std::uint32_t hash) const;
    void growRegister();

    std::shared_ptr<NodeStore> nodes_;
    std::array<OpenNode, LongestWord + 1> path_;
    std::array<char, LongestWord> last_{};
    std::size_t lastSize_ = 0;
    std::uint32_t size_ = 0;
    // A full table is moved into one of twice the size a few slots with each new node, so that no
    // word takes long; until that is done both are looked at.
    Register register_;
    Register moving_{0};
    std::size_t moved_ = 0;
    std::size_t stored_ = 0;
    std::size_t room_ = 0;  // words of the store reserved and not used
};
