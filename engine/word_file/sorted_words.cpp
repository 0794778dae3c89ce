#include "word_file/sorted_words.h"

#include <algorithm>
#include <utility>

namespace Quorle {

void SortedWords::endChunk() {
    if (!std::is_sorted(chunk_.begin(), chunk_.end())) std::sort(chunk_.begin(), chunk_.end());
    if (runs_.empty() || runs_.back().back().back() > chunk_.front()) runs_.emplace_back();
    size_ += chunk_.size();
    runs_.back().push_back(std::exchange(chunk_, {}));
    chunk_.reserve(ChunkSize);
}

SortedWords::Head SortedWords::headOf(Run& run) {
    const Chunk& chunk = run.front();
    return {chunk.front(), chunk.data(), chunk.data() + chunk.size(), &run};
}

void SortedWords::finish() {
    if (!chunk_.empty()) endChunk();
    for (Run& run : runs_) heads_.push_back(headOf(run));
    for (std::size_t place = heads_.size() / 2; place-- > 0;) sink(place);
}

/// Moves a head down to where no smaller word is below it.
void SortedWords::sink(std::size_t place) {
    const Head head = heads_[place];
    for (std::size_t child = 2 * place + 1; child < heads_.size(); child = 2 * place + 1) {
        if (child + 1 < heads_.size() && heads_[child + 1].word < heads_[child].word) ++child;
        if (head.word <= heads_[child].word) break;
        heads_[place] = heads_[child];
        place = child;
    }
    heads_[place] = head;
}

/// False at the end of the run.
bool SortedWords::advance(Head& head) {
    if (++head.at != head.chunkEnd) {
        head.word = *head.at;
        return true;
    }
    head.run->pop_front();
    if (!head.run->empty()) head = headOf(*head.run);
    return !head.run->empty();
}

PackedWord SortedWords::next() {
    while (!heads_.empty()) {
        const PackedWord word = heads_.front().word;
        if (!advance(heads_.front())) {
            heads_.front() = heads_.back();
            heads_.pop_back();
        }
        if (heads_.size() > 1) sink(0);
        if (std::exchange(last_, word) != word) return word;
    }
    return NoWord;
}

}  // namespace Quorle
