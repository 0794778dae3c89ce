#pragma once
// Building the minimal graph of sorted words in one pass.
#include <array>
#include <memory>
#include <string_view>
#include <vector>

#include "word_graph.h"

/// Takes words in strictly ascending order, one by one, each in bounded time; so is finishing.
class GraphBuilder {
  public:
    GraphBuilder();

    /// `word`: 1 to 16 letters, after every word before it. Throws std::bad_alloc; then the
    /// builder is of no more use.
    void add(std::string_view word);
    /// The graph of all words added. The builder is of no more use.
    WordGraph finish();

  private:
    // A node on the path of the word added last, still open for more letters.
    struct OpenNode {
        std::uint32_t mask = 0;
        std::uint32_t edges = 0;
        std::uint32_t words = 0;
        std::array<std::uint32_t, 2 * Letters> content{};  // link, skip, link, skip, ...
    };

    void closeNodes(std::size_t depth);
    NodeIndex store(const OpenNode& open);
    void growRegister();

    std::shared_ptr<NodeStore> nodes_;
    std::array<OpenNode, LongestWord + 1> path_;
    std::array<char, LongestWord> last_{};
    std::size_t lastSize_ = 0;
    std::uint32_t size_ = 0;
    std::vector<NodeIndex> register_;  // a hash table of the stored nodes; NoNode: free
    std::size_t stored_ = 0;
};
