#include "graph/word_cursor.h"

#include <utility>

namespace Quorle {

// A prefix may be a word itself: the last of its letters is the first one to go along.
WordCursor::WordCursor(WordGraph graph, std::string_view prefix) : graph_(std::move(graph)) {
    assert(prefix.size() <= LongestWord);
    if (prefix.empty()) {
        steps_[0] = {graph_.root().first, graph_.root().letters, 0};
        return;
    }
    depth_ = top_ = prefix.size() - 1;
    const Edge place = graph_.find(prefix.substr(0, top_));
    const std::uint32_t bit = LetterBit(prefix.back());
    steps_[top_] = {place.at(bit), place.letters & bit, 0};
    for (std::size_t i = 0; i < top_; ++i) {
        steps_[top_].word |= PackedLetter(prefix[i] - 'a', i);
    }
}

}  // namespace Quorle
