#pragma once
// Sorting the words of a file in small pieces of work. Words in ascending order, as most word
// files have them, are only kept; others are sorted a chunk at a time, and the runs of ascending
// words that come of it are merged as they are read.
#include <algorithm>
#include <vector>

#include "graph/packed_word.h"

namespace Quorle {

class SortedWords {
  public:
    void add(PackedWord word) {
        if (chunk_.size() == ChunkSize) endChunk();
        chunk_.push_back(word);
    }
    /// Takes in what was added last.
    void endChunk();
    /// Not fewer than there are different words.
    std::size_t size() const { return size_; }

  private:
    friend class SortedWordsReader;
    static constexpr std::size_t ChunkSize = 4096;

    std::vector<std::vector<PackedWord>> chunks_;
    std::vector<std::size_t> runs_;  // the first chunk of each
    std::vector<PackedWord> chunk_;
    std::size_t size_ = 0;
};

/// The words in strictly ascending order. Memory is given back as they are read: at once it would
/// take long.
class SortedWordsReader {
  public:
    SortedWordsReader() = default;
    /// The words are finished.
    explicit SortedWordsReader(SortedWords words);

    /// The next word; false at the end.
    bool next(PackedWord& word);

  private:
    /// The next word of a run, and where it goes on.
    struct Head {
        PackedWord word;
        const PackedWord* at;
        const PackedWord* chunkEnd;
        std::size_t chunk;
        std::size_t end;
    };

    void sink(std::size_t place);
    bool advance(Head& head);

    SortedWords words_;
    std::vector<Head> heads_;  // a heap, the smallest word first
    PackedWord last_ = 0;
};

}  // namespace Quorle
