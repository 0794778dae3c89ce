#pragma once
// Reading the words of a graph in alphabetical order.
#include <utility>

#include "graph/packed_word.h"
#include "graph/word_graph.h"

namespace Quorle {

/// Streams the words that begin with a prefix, of the graph as it was when the cursor was made.
class WordCursor {
  public:
    WordCursor() = default;
    /// `prefix`: letters "a" to "z", or empty for the whole graph. It may be a word itself: the
    /// last of its letters is the first one to go along.
    explicit WordCursor(WordGraph graph, std::string_view prefix = {}) : graph_(std::move(graph)) {
        assert(prefix.size() <= LongestWord);
        steps_[0] = {graph_.root().first, graph_.root().letters, 0};
        if (prefix.empty()) return;
        depth_ = top_ = prefix.size() - 1;
        const Edge place = graph_.find(prefix.substr(0, top_));
        const std::uint32_t bit = LetterBit(prefix.back());
        steps_[top_] = {place.at(bit), place.letters & bit, 0};
        for (std::size_t i = 0; i < top_; ++i) {
            steps_[top_].word |= PackedLetter(prefix[i] - 'a', i);
        }
    }

    /// The next word; NoWord at the end, and from then on.
    PackedWord next() {
        const Edge* const edges = graph_.edges();
        while (true) {
            Step& step = steps_[depth_];
            if (step.left == 0) {
                if (depth_ == top_) return NoWord;
                --depth_;
                continue;
            }
            const Edge& edge = edges[step.edge++];
            const PackedWord word = step.word | PackedLetter(std::countr_zero(step.left), depth_);
            step.left &= step.left - 1;
            if (edge.next() != 0) steps_[++depth_] = {edge.first, edge.next(), word};
            if (edge.isWord()) return word;
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
