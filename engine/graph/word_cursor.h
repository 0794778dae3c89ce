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
        std::size_t last = 0;
        PackedWord before = 0;
        for (; last + 1 < prefix.size(); ++last) before |= PackedLetter(prefix[last] - 'a', last);
        const Edge place = graph_.find(prefix.substr(0, last));
        const std::uint32_t bits = prefix.empty() ? ~WordEnds : LetterBit(prefix.back());
        steps_[0] = {place.at(bits & -bits), place.letters & bits, last, before};
        size_ = steps_[0].left != 0 ? 1 : 0;
    }

    /// The next word; NoWord at the end, and from then on. Every way ends with a word. Steps are
    /// written first and counted after, so that the one branch is whether a word ends.
    PackedWord next() {
        const Edge* const edges = graph_.edges();
        std::size_t size = size_;
        PackedWord word = NoWord;
        for (bool isWord = false; size != 0 && !isWord;) {
            Step& step = steps_[size - 1];
            const Edge& edge = edges[step.edge++];
            __builtin_prefetch(edges + edges[step.edge].first);
            word = step.word | PackedLetter(std::countr_zero(step.left), step.place);
            const std::size_t place = step.place + 1;
            step.left &= step.left - 1;
            size -= step.left == 0 ? 1 : 0;
            steps_[size] = {edge.first, edge.next(), place, word};
            size += edge.next() != 0 ? 1 : 0;
            isWord = edge.isWord();
        }
        size_ = size;
        return word;
    }

  private:
    /// Edges of one node that are to be gone along.
    struct Step {
        std::uint32_t edge = 0;  // the first of them
        std::uint32_t left = 0;  // their letters
        std::size_t place = 0;   // of the letters in the words
        PackedWord word = 0;     // the letters before them
    };

    WordGraph graph_;
    std::array<Step, LongestWord + 1> steps_{};
    std::size_t size_ = 0;
};

}  // namespace Quorle
