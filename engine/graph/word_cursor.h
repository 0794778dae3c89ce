#pragma once
// Reading the words of a graph in alphabetical order.
#include "graph/packed_word.h"
#include "graph/word_graph.h"

namespace Quorle {

/// Streams the words that begin with a prefix, of the graph as it was when the cursor was made.
class WordCursor {
  public:
    WordCursor() = default;
    /// `prefix`: letters "a" to "z", or empty for the whole graph.
    explicit WordCursor(WordGraph graph, std::string_view prefix = {});

    /// The next word; false at the end, and from then on.
    bool next(PackedWord& word) {
        const Edge* const edges = graph_.edges();
        while (true) {
            Step& step = steps_[depth_];
            if (step.left == 0) {
                if (depth_ == top_) return false;
                --depth_;
                continue;
            }
            const Edge& edge = edges[step.edge++];
            word = step.word | PackedLetter(std::countr_zero(step.left), depth_);
            step.left &= step.left - 1;
            steps_[++depth_] = {edge.first, edge.next(), word};
            if (edge.isWord()) return true;
        }
    }

  private:
    struct Step {
        std::uint32_t edge = 0;  // the next one
        std::uint32_t left = 0;  // the letters not yet gone along
        PackedWord word = 0;     // the letters before them
    };

    WordGraph graph_;
    std::array<Step, LongestWord + 1> steps_{};
    std::size_t depth_ = 0;  // of the letters in steps_[depth_].left
    std::size_t top_ = 0;
};

}  // namespace Quorle
