#pragma once
// The words that a search finds. What costs time is put off until the words are asked for: their
// order, and their letters.
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

/// Puts words in the order of their numbers. `room`: memory to use again, whatever it holds.
void SortFound(std::vector<FoundWord>& words, std::vector<FoundWord>& room);

/// Writes the words of one board as letters.
class Speller {
  public:
    explicit Speller(const Board& board);

    PackedWord operator()(const FoundWord& word) const;

  private:
    // The letters of each two cubes, the first in the higher byte. Twice the same: "qu".
    std::array<std::uint16_t, std::size_t{Cubes} * Cubes> pairs_;
    bool hasQu_ = false;
};

}  // namespace Quorle
