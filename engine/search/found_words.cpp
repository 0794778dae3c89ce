#include "search/found_words.h"

#include <algorithm>
#include <utility>

namespace Quorle {

namespace {

// A quarter of a million numbers have three digits of few values each, or two of many, which take
// longer to add up.
constexpr unsigned FewBits = 6;
constexpr unsigned ManyBits = 9;
constexpr std::size_t ManyWords = 300;

/// Sorts by all digits, the lowest first; how often each occurs is counted in one pass.
template <unsigned DigitBits>
void SortByDigits(std::vector<FoundWord>& words, std::vector<FoundWord>& room) {
    constexpr std::uint32_t Digits = 1U << DigitBits;
    constexpr std::size_t Most = (32 + DigitBits - 1) / DigitBits;
    std::uint32_t all = 0;
    for (const FoundWord& word : words) all |= word.number;
    const std::size_t used =
        (static_cast<unsigned>(std::bit_width(all)) + DigitBits - 1) / DigitBits;
    std::array<std::array<std::uint32_t, Digits>, Most> places;
    std::fill_n(places.begin(), used, std::array<std::uint32_t, Digits>{});
    for (const FoundWord& word : words) {
        for (std::size_t i = 0; i < used; ++i)
            ++places[i][word.number >> i * DigitBits & (Digits - 1)];
    }
    for (std::size_t i = 0; i < used; ++i) {
        std::uint32_t before = 0;
        for (std::uint32_t& place : places[i]) before += std::exchange(place, before);
        for (const FoundWord& word : words) {
            room[places[i][word.number >> i * DigitBits & (Digits - 1)]++] = word;
        }
        words.swap(room);
    }
}

}  // namespace

void SortFound(std::vector<FoundWord>& words, std::vector<FoundWord>& room) {
    room.resize(words.size());
    const bool many = words.size() >= ManyWords;
    many ? SortByDigits<ManyBits>(words, room) : SortByDigits<FewBits>(words, room);
}

Speller::Speller(const Board& board) {
    std::uint16_t* pair = pairs_.data();
    for (const char first : board) {
        hasQu_ = hasQu_ || first == 'q';
        for (const char second : board) *pair++ = static_cast<std::uint16_t>(first << 8 | second);
    }
}

// Words of up to eight letters, nearly all there are, are put together two cubes at a time.
PackedWord Speller::operator()(const FoundWord& word) const {
    const std::uint64_t path = word.path << 4 * (LongestWord - word.letters);
    const auto pair = [&](unsigned shift) { return std::uint64_t{pairs_[path >> shift & 0xff]}; };
    const auto four = [&](unsigned shift) {
        return pair(shift + 24) << 48 | pair(shift + 16) << 32 | pair(shift + 8) << 16 |
               pair(shift);
    };
    PackedWord spelled = PackedWord{four(32)} << 64;
    if (word.letters > 8) spelled |= four(0);
    spelled = FirstLetters(spelled, word.letters);
    if (!hasQu_) return spelled;
    // A cube twice in a row is the Qu cube, of which the second letter is the "u".
    for (std::size_t i = 1; i < word.letters; ++i) {
        const std::uint64_t both = path >> 4 * (LongestWord - 1 - i) & 0xff;
        if (both >> 4 == both % 16) spelled += PackedLetter('u' - 'q', i) - PackedLetter(0, i);
    }
    return spelled;
}

}  // namespace Quorle
