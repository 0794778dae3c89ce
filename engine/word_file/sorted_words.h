#pragma once
// Sorting the words of a file in small pieces of work. Words in ascending order, as most word
// files have them, are only kept; others are sorted a chunk at a time, and the runs of ascending
// words that come of it are merged as they are taken out.
#include <deque>
#include <vector>

#include "graph/packed_word.h"

namespace Quorle {

class SortedWords {
  public:
    void add(PackedWord word) {
        if (chunk_.size() == ChunkSize) endChunk();
        chunk_.push_back(word);
    }
    /// All words are in.
    void finish();
    /// Not fewer than there are different words.
    std::size_t size() const { return size_; }

    /// Once they are in: the next word, strictly ascending; NoWord at the end. Memory is given back
    /// as words are taken out, for at once it would take long.
    PackedWord next();

  private:
    static constexpr std::size_t ChunkSize = 4096;

    using Chunk = std::vector<PackedWord>;
    using Run = std::deque<Chunk>;
    /// A run by its next word.
    struct Head {
        PackedWord word;
        const PackedWord* at;
        const PackedWord* chunkEnd;
        Run* run;
    };

    static Head headOf(Run& run);
    static bool advance(Head& head);
    void endChunk();
    void sink(std::size_t place);

    Chunk chunk_;
    std::deque<Run> runs_;
    std::vector<Head> heads_;  // a heap, the smallest word first
    std::size_t size_ = 0;
    PackedWord last_ = 0;
};

}  // namespace Quorle
