#pragma once
// Reading single words of a graph by their index in alphabetical order.
#include <array>
#include <string_view>

#include "word_graph.h"

/// Remembers where it stands: words asked for in ascending order take a few steps each.
class WordReader {
  public:
    WordReader() = default;
    explicit WordReader(WordGraph graph);

    /// Word `index` (below the graph's size), valid until the next call.
    std::string_view word(std::uint32_t index);

  private:
    // The words that begin with the first letters: begin to end - 1, the letters' own first.
    struct Step {
        std::uint32_t begin = 0;
        std::uint32_t end = 0;
        std::uint32_t isWord = 0;
        std::uint32_t left = 0;  // the letters that may come next, from the one tried last
        NodeIndex link = 0;      // where that one's link stands
    };

    Step stepTo(NodeIndex node, std::uint32_t begin, std::uint32_t end, std::uint32_t isWord) const;
    void descend(std::uint32_t index);

    WordGraph graph_;
    std::array<char, LongestWord + 1> letters_{};
    std::array<Step, LongestWord + 1> steps_{};  // steps_[i]: after i letters
    std::size_t depth_ = 0;
};
