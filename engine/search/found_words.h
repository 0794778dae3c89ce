#pragma once
// The words that a search finds, each once. What costs time is put off until the words are asked
// for: their order, and their letters.
#include <vector>

#include "graph/packed_word.h"
#include "search/board.h"

namespace Quorle {

/// A word as a chain of cubes.
struct FoundWord {
    std::uint64_t path;     // a cube for each letter, four bits, the last one lowest
    std::uint32_t number;   // among the dictionary's words, in alphabetical order, from 1
    std::uint32_t letters;  // how many
};

class FoundWords {
  public:
    std::size_t size() const { return size_; }
    bool contains(std::uint32_t number) const {
        return (known_[number / 64] >> number % 64 & 1) != 0;
    }

    void clear();
    /// No words: those that come are of a dictionary of so many, and on a board. `hasAvx2`: whether
    /// the processor does. Throws std::bad_alloc.
    void begin(std::size_t dictionary, const Board& board, bool hasAvx2);
    /// Where so many words can be written behind those there are. Throws std::bad_alloc.
    FoundWord* room(std::size_t most) {
        if (words_.size() < size_ + most) words_.resize(2 * size_ + most);
        return words_.data() + size_;
    }
    /// Takes in the words written there up to `end` that are new: all of so many letters.
    void take(const FoundWord* end, std::uint32_t letters);

    /// Once all are in: writes the word of index `i`, in alphabetical order, into a buffer of 16
    /// letters, and returns how many it has. Throws std::bad_alloc.
    std::size_t spell(std::size_t i, char* to);

  private:
    void finish();
    template <unsigned DigitBits>
    void sortByDigits();

    std::vector<FoundWord> words_;  // more than size_
    std::vector<FoundWord> sorted_;
    std::size_t size_ = 0;
    std::vector<std::uint64_t> known_;  // a bit for each word of the dictionary
    Board board_{};
    bool isFinished_ = false;
    bool hasAvx2_ = false;
};

}  // namespace Quorle
