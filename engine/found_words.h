#pragma once
// The words that a search finds. What costs time is put off until the words are asked for: their
// order, and their letters.
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

/// Writes the word's letters, at most 16, and returns how many.
inline std::size_t Spell(const FoundWord& word, const Board& board, char* letters) {
    const std::size_t size = word.spelling % EndsInQ;
    char* letter = letters + size;
    std::uint64_t path = word.path;
    if (word.spelling != size) [[unlikely]] {
        *--letter = 'q';
        path >>= 4;
    }
    while (letter != letters) {
        const char face = board[path % Cubes];
        path >>= 4;
        if (face == 'q') [[unlikely]]
            *--letter = 'u';
        *--letter = face;
    }
    return size;
}
