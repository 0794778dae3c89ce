#include "found_words.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstring>

namespace {

// A quarter of a million indexes have three digits of few values each, or two of many, which take
// longer to add up.
constexpr unsigned FewBits = 6;
constexpr unsigned ManyBits = 9;
constexpr std::size_t ManyWords = 300;

/// Sorts by one digit of the index and keeps the order of those that are equal in it.
template <unsigned DigitBits>
void SortByDigit(const std::vector<FoundWord>& from, std::vector<FoundWord>& to, unsigned shift) {
    constexpr std::uint32_t Digits = 1U << DigitBits;
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

template <unsigned DigitBits>
void SortByDigits(std::vector<FoundWord>& words, std::vector<FoundWord>& room) {
    std::uint32_t largest = 0;
    for (const FoundWord& word : words) largest = std::max(largest, word.index);
    for (unsigned shift = 0; shift < 32 && largest >> shift != 0; shift += DigitBits) {
        SortByDigit<DigitBits>(words, room, shift);
        words.swap(room);
    }
}

/// Writes a number's bytes, the highest first.
template <class Number>
void Store(Number number, char* to) {
    if constexpr (std::endian::native == std::endian::little) {
        number = sizeof number == 4 ? static_cast<Number>(__builtin_bswap32(number))
                                    : __builtin_bswap16(static_cast<std::uint16_t>(number));
    }
    std::memcpy(to, &number, sizeof number);
}

}  // namespace

void SortFound(std::vector<FoundWord>& words, std::vector<FoundWord>& room) {
    room.resize(words.size());
    const bool many = words.size() >= ManyWords;
    many ? SortByDigits<ManyBits>(words, room) : SortByDigits<FewBits>(words, room);
}

Speller::Speller(const Board& board) : board_(board), hasQu_(HasQu(board)) {
    std::uint16_t* pair = pairs_.data();
    for (const char first : board) {
        for (const char second : board) {
            *pair++ = static_cast<std::uint16_t>(static_cast<unsigned char>(first) << 8 |
                                                 static_cast<unsigned char>(second));
        }
    }
}

// Words of up to eight cubes, nearly all there are, are put together two cubes at a time, and
// written by their ends, which meet or overlap.
std::size_t Speller::operator()(const FoundWord& word, char* letters) const {
    const std::size_t size = word.spelling % EndsInQ;
    if (hasQu_ || size > 8) [[unlikely]]
        return cubeByCube(word, letters);
    const std::uint64_t path = word.path << 4 * (8 - size);
    const auto pair = [&](unsigned shift) { return std::uint64_t{pairs_[path >> shift & 0xff]}; };
    const std::uint64_t text = pair(24) << 48 | pair(16) << 32 | pair(8) << 16 | pair(0);
    if (size >= 4) {
        Store(static_cast<std::uint32_t>(text >> 32), letters);
        Store(static_cast<std::uint32_t>(text >> 8 * (8 - size)), letters + size - 4);
    } else {
        Store(static_cast<std::uint16_t>(text >> 48), letters);
        Store(static_cast<std::uint16_t>(text >> 8 * (8 - size)), letters + size - 2);
    }
    return size;
}

std::size_t Speller::cubeByCube(const FoundWord& word, char* letters) const {
    const std::size_t size = word.spelling % EndsInQ;
    char* letter = letters + size;
    std::uint64_t path = word.path;
    if (word.spelling != size) {
        *--letter = 'q';
        path >>= 4;
    }
    while (letter != letters) {
        const char face = board_[path % Cubes];
        path >>= 4;
        if (face == 'q') *--letter = 'u';
        *--letter = face;
    }
    return size;
}
