#include "word_file/sorted_words.h"

#include <utility>

namespace Quorle {

void SortedWords::endChunk() {
    if (chunk_.empty()) return;
    if (!std::is_sorted(chunk_.begin(), chunk_.end())) std::sort(chunk_.begin(), chunk_.end());
    const bool goesOn = !chunks_.empty() && chunks_.back().back() <= chunk_.front();
    if (!goesOn) runs_.push_back(chunks_.size());
    size_ += chunk_.size();
    chunks_.push_back(std::move(chunk_));
    chunk_ = {};
    chunk_.reserve(ChunkSize);
}

SortedWordsReader::SortedWordsReader(SortedWords words) : words_(std::move(words)) {
    const std::size_t runs = words_.runs_.size();
    for (std::size_t run = 0; run < runs; ++run) {
        const std::size_t chunk = words_.runs_[run];
        const std::size_t end = run + 1 < runs ? words_.runs_[run + 1] : words_.chunks_.size();
        const std::vector<PackedWord>& first = words_.chunks_[chunk];
        heads_.push_back({first.front(), first.data(), first.data() + first.size(), chunk, end});
    }
    for (std::size_t place = heads_.size() / 2; place-- > 0;) sink(place);
}

void SortedWordsReader::sink(std::size_t place) {
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
bool SortedWordsReader::advance(Head& head) {
    if (++head.at == head.chunkEnd) {
        words_.chunks_[head.chunk] = {};
        if (++head.chunk == head.end) return false;
        const std::vector<PackedWord>& chunk = words_.chunks_[head.chunk];
        head.at = chunk.data();
        head.chunkEnd = head.at + chunk.size();
    }
    head.word = *head.at;
    return true;
}

bool SortedWordsReader::next(PackedWord& word) {
    while (!heads_.empty()) {
        word = heads_.front().word;
        if (!advance(heads_.front())) {
            heads_.front() = heads_.back();
            heads_.pop_back();
        }
        if (heads_.size() > 1) sink(0);
        if (word != last_) {
            last_ = word;
            return true;
        }
    }
    return false;
}

}  // namespace Quorle
