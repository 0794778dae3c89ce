#pragma once
// The words that a search finds. What costs time is put off until the words are asked for: their
// order, and their letters.
#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "board.h"

/// A word as a chain of cubes.
struct FoundWord {
    std::uint64_t path;      // its cubes, four bits each, the last one lowest
    std::uint32_t index;     // among the dictionary's words, in alphabetical order
    std::uint32_t spelling;  // the number of letters, and EndsInQ
};

/// The last cube, a Qu, is the "q" alone.
inline constexpr std::uint32_t EndsInQ = 0x100;

/// Puts words in the order of their indexes. `room`: memory to use again, whatever it holds.
void SortFound(std::vector<FoundWord>& words, std::vector<FoundWord>& room);

/// Writes the words of one board as letters.
class Speller {
  public:
    explicit Speller(const Board& board);

    /// Writes the word's letters, 2 to 16, and nothing behind them; returns how many.
    std::size_t operator()(const FoundWord& word, char* letters) const;

  private:
    std::size_t cubeByCube(const FoundWord& word, char* letters) const;

    Board board_;
    bool hasQu_;
    // The letters of each two cubes, the first in the higher byte.
    std::array<std::uint16_t, Cubes * Cubes> pairs_;
};
