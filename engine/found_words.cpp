#include "found_words.h"

#include <algorithm>
#include <array>

namespace {

// Three rounds for a quarter of a million words, each with few digits to add up.
constexpr unsigned DigitBits = 6;
constexpr std::uint32_t Digits = 1U << DigitBits;

/// Sorts by one digit of the index and keeps the order of those that are equal in it.
void SortByDigit(const std::vector<FoundWord>& from, std::vector<FoundWord>& to, unsigned shift) {
    std::array<std::uint32_t, Digits> places{};
    for (const FoundWord& word : from) ++places[(word.index >> shift) % Digits];
    std::uint32_t before = 0;
    for (std::uint32_t& place : places) {
        const std::uint32_t count = place;
        place = before;
        before += count;
    }
    for (const FoundWord& word : from) to[places[(word.index >> shift) % Digits]++] = word;
}

}  // namespace

void SortFound(std::vector<FoundWord>& words, std::vector<FoundWord>& room) {
    room.resize(words.size());
    std::uint32_t largest = 0;
    for (const FoundWord& word : words) largest = std::max(largest, word.index);
    for (unsigned shift = 0; shift < 32 && largest >> shift != 0; shift += DigitBits) {
        SortByDigit(words, room, shift);
        words.swap(room);
    }
}
