#include "search/found_words.h"

#include <algorithm>
#include <numeric>
#include <span>

namespace Quorle {

// A quarter of a million numbers have three digits of few values, or two of many to add up.
constexpr std::size_t FewWords = 20;
constexpr unsigned FewBits = 6;
constexpr unsigned ManyBits = 9;
constexpr std::size_t ManyWords = 300;

void FoundWords::clear() {
    for (std::size_t i = 0; i < size_; ++i) known_[words_[i].number / 64] = 0;
    size_ = 0;
    isFinished_ = false;
}

void FoundWords::begin(std::size_t dictionary, const Board& board) {
    clear();
    board_ = board;
    if (dictionary < knownSize_) return;
    known_ = TakeZeroed<std::uint64_t>(dictionary / 64 + 1);
    knownSize_ = dictionary + 1;
}

FoundWord* FoundWords::room(std::size_t most) {
    if (words_.size() < size_ + most) words_.resize(2 * size_ + most);
    return words_.data() + size_;
}

void FoundWords::take(const FoundWord* end, std::uint32_t letters) {
    FoundWord* to = words_.data() + size_;
    std::uint32_t number = 0;
    for (const FoundWord* word = to; word != end; ++word) {
        if (word->number == number) continue;  // boards of few letters spell a word many times over
        number = word->number;
        std::uint64_t& known = known_[number / 64];
        *to = {word->path, number, letters};
        to += ~known >> number % 64 & 1;
        known |= std::uint64_t{1} << number % 64;
    }
    size_ = static_cast<std::size_t>(to - words_.data());
}

/// Sorts by all digits, the lowest first.
template <unsigned DigitBits>
void FoundWords::sortByDigits() {
    constexpr std::uint32_t Digits = 1U << DigitBits;
    sorted_.resize(words_.size());
    for (unsigned shift = 0; knownSize_ >> shift != 0; shift += DigitBits) {
        const auto digit = [&](std::size_t i) { return words_[i].number >> shift & (Digits - 1); };
        std::array<std::uint32_t, Digits> places{};
        for (std::size_t i = 0; i < size_; ++i) ++places[digit(i)];
        std::exclusive_scan(places.begin(), places.end(), places.begin(), 0U);
        for (std::size_t i = 0; i < size_; ++i) sorted_[places[digit(i)]++] = words_[i];
        words_.swap(sorted_);
    }
}

/// Puts the words in order, and gets ready to spell them.
void FoundWords::finish() {
    if (size_ < FewWords) {
        std::ranges::sort(std::span(words_.data(), size_), {}, &FoundWord::number);
    } else {
        size_ < ManyWords ? sortByDigits<FewBits>() : sortByDigits<ManyBits>();
    }
    std::uint16_t* pair = pairs_.data();
    for (const char first : board_) {
        for (const char second : board_) *pair++ = static_cast<std::uint16_t>(first << 8 | second);
    }
    hasQu_ = std::find(board_.begin(), board_.end(), 'q') != board_.end();
    isFinished_ = true;
}

// Words of up to eight letters, nearly all there are, are put together two cubes at a time.
std::size_t FoundWords::spell(std::size_t i, char* to) {
    if (!isFinished_) finish();
    const std::size_t letters = words_[i].letters;
    const std::uint64_t path = words_[i].path << 4 * (LongestWord - letters);
    const auto four = [&](unsigned shift) {
        std::uint64_t spelled = 0;
        for (unsigned pair = 0; pair < 4; ++pair) {
            spelled = spelled << 16 | pairs_[path >> (shift + 24 - 8 * pair) & 0xff];
        }
        return spelled;
    };
    WriteLetters(PackedWord{four(32)} << 64 | (letters > 8 ? four(0) : 0), letters, to);
    for (std::size_t place = 1; hasQu_ && place < letters; ++place) {
        // A cube twice in a row is the Qu cube.
        const std::uint64_t both = path >> 4 * (LongestWord - 1 - place) & 0xff;
        if (both >> 4 == both % 16) to[place] = 'u';
    }
    return letters;
}

}  // namespace Quorle
