#pragma once
// Reading single words of a graph by their index in alphabetical order.
#include <array>
#include <string_view>

#include "word_graph.h"

/// Remembers where it stands, so that a word near the one before is found in a few steps.
class WordReader {
  public:
    WordReader() = default;
    explicit WordReader(WordGraph graph);

    /// Word `index` (below the graph's size), valid until the next call.
    std::string_view word(std::uint32_t index);

  private:
    // The words that begin with the first letters: begin to end - 1, the letters' own first.
    struct Step {
        NodeIndex node = NoNode;
        std::uint32_t begin = 0;
        std::uint32_t end = 0;
        bool isWord = false;
    };

    void descend(std::uint32_t index);

    WordGraph graph_;
    std::array<char, LongestWord + 1> letters_{};
    std::array<Step, LongestWord + 1> steps_{};  // steps_[i]: after i letters
    std::size_t depth_ = 0;
};
