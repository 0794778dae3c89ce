#include "search/found_words.h"

#include <algorithm>
#include <numeric>
#include <span>

namespace Quorle {

namespace {

#if defined(__x86_64__)
// The letters by one shuffle of the board; a cube twice in a row is the Qu cube. What stands behind
// the word in the buffer is written again as it is.
[[gnu::target("avx2")]] std::size_t SpellAvx2(const FoundWord& word, const Board& board, char* to) {
    const auto load = [](const char* from) {
        return _mm_loadu_si128(reinterpret_cast<const __m128i*>(from));
    };
    const std::uint64_t path = __builtin_bswap64(word.path << 4 * (LongestWord - word.letters));
    const __m128i pairs = _mm_cvtsi64_si128(static_cast<std::int64_t>(path));
    const __m128i cubes =
        _mm_and_si128(_mm_unpacklo_epi8(_mm_srli_epi64(pairs, 4), pairs), _mm_set1_epi8(15));
    const __m128i before = _mm_or_si128(_mm_slli_si128(cubes, 1), _mm_cvtsi32_si128(Cubes));
    const __m128i spelled = _mm_blendv_epi8(_mm_shuffle_epi8(load(board.data()), cubes),
                                            _mm_set1_epi8('u'), _mm_cmpeq_epi8(cubes, before));
    _mm_storeu_si128(reinterpret_cast<__m128i*>(to),
                     _mm_blendv_epi8(spelled, load(to), load(BehindWord(word.letters))));
    return word.letters;
}
#endif

}  // namespace

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

void FoundWords::begin(std::size_t dictionary, const Board& board, bool hasAvx2) {
    clear();
    board_ = board;
    hasAvx2_ = hasAvx2;
    if (known_.size() <= dictionary / 64) known_.resize(dictionary / 64 + 1);
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
    for (unsigned shift = 0; 64 * known_.size() >> shift != 0; shift += DigitBits) {
        const auto digit = [&](std::size_t i) { return words_[i].number >> shift & (Digits - 1); };
        std::array<std::uint32_t, Digits> places{};
        for (std::size_t i = 0; i < size_; ++i) ++places[digit(i)];
        std::exclusive_scan(places.begin(), places.end(), places.begin(), 0U);
        for (std::size_t i = 0; i < size_; ++i) sorted_[places[digit(i)]++] = words_[i];
        words_.swap(sorted_);
    }
}

/// Puts the words in order.
void FoundWords::finish() {
    if (size_ < FewWords)
        std::ranges::sort(std::span(words_.data(), size_), {}, &FoundWord::number);
    else
        size_ < ManyWords ? sortByDigits<FewBits>() : sortByDigits<ManyBits>();
    isFinished_ = true;
}

std::size_t FoundWords::spell(std::size_t i, char* to) {
    if (!isFinished_) finish();
#if defined(__x86_64__)
    if (hasAvx2_) return SpellAvx2(words_[i], board_, to);
#endif
    std::uint64_t path = words_[i].path;
    for (std::size_t place = words_[i].letters; place-- > 0; path >>= 4) {
        const bool isU = place > 0 && (path >> 4) % Cubes == path % Cubes;
        to[place] = isU ? 'u' : board_[path % Cubes];
    }
    return words_[i].letters;
}

}  // namespace Quorle
