#pragma once
// Reading the words of a graph in alphabetical order.
#include <array>
#include <string_view>

#include "word_graph.h"

/// Streams the words that begin with a prefix, of the graph as it was when the cursor was made.
class WordCursor {
  public:
    WordCursor() = default;
    /// `prefix`: letters "a" to "z", or empty for the whole graph.
    explicit WordCursor(WordGraph graph, std::string_view prefix = {});

    /// The next word, valid until the next call; false at the end, and from then on.
    bool next(std::string_view& word);

  private:
    struct Step {
        NodeIndex node = NoNode;
        std::uint32_t left = 0;  // the letters of the node not yet gone along
    };

    bool goOn();

    WordGraph graph_;
    std::array<char, LongestWord + 1> letters_{};
    std::array<Step, LongestWord + 1> steps_{};  // steps_[i] chose letters_[i]
    std::size_t depth_ = 0;                      // letters chosen
    std::size_t top_ = 0;                        // letters of the prefix
    bool prefixIsNext_ = false;
};
