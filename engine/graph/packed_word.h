#pragma once
// A word as a number: the one form in which the engine's parts hand words to each other, so that
// words are compared, sorted and cut in a few instructions.
#include <bit>
#include <cassert>
#include <cstddef>
#include <cstdint>
#include <cstring>

namespace Quorle {

inline constexpr std::size_t LongestWord = 16;

/// A word of up to 16 letters, "a" to "z": the first letter in the highest byte, zeros behind the
/// last. Numbers and words have the same order.
__extension__ using PackedWord = unsigned __int128;

inline constexpr PackedWord NoWord = ~PackedWord{0};  ///< after every word

/// A letter (0 "a" .. 25 "z") as that of a word's place, 0..15.
inline PackedWord PackedLetter(int letter, std::size_t place) {
    return PackedWord{static_cast<unsigned>('a' + letter)} << 8 * (LongestWord - 1 - place);
}

/// The first letter (0 "a" .. 25 "z") of the word.
inline unsigned FirstLetter(PackedWord word) {
    return static_cast<unsigned>(word >> 8 * (LongestWord - 1)) % 32 - 1;
}

/// The number of letters, 1..16.
inline std::size_t LengthOf(PackedWord word) {
    assert(word != 0);
    const auto low = static_cast<std::uint64_t>(word);
    const auto high = static_cast<std::uint64_t>(word >> 64);
    const int unused = low != 0 ? std::countr_zero(low) : 64 + std::countr_zero(high);
    return LongestWord - static_cast<std::size_t>(unused) / 8;
}

/// How many letters two different words have in common at their beginning, 0..15.
inline std::size_t SharedLetters(PackedWord a, PackedWord b) {
    assert(a != b);
    const auto low = static_cast<std::uint64_t>(a ^ b);
    const auto high = static_cast<std::uint64_t>((a ^ b) >> 64);
    return static_cast<std::size_t>(high != 0 ? std::countl_zero(high)
                                              : 64 + std::countl_zero(low)) /
           8;
}

/// The word's first `number` letters, 1..16.
inline PackedWord FirstLetters(PackedWord word, std::size_t number) {
    const std::size_t unused = 8 * (LongestWord - number);
    return word >> unused << unused;
}

/// The 16 bytes at `text`, the first in the highest byte.
inline PackedWord LoadBytes(const std::byte* text) {
    std::uint64_t halves[2];
    std::memcpy(halves, text, sizeof halves);
    return PackedWord{__builtin_bswap64(halves[0])} << 64 | __builtin_bswap64(halves[1]);
}

inline constexpr std::uint64_t WordAndBehind[] = {0, 0, ~std::uint64_t{0}, ~std::uint64_t{0}};
/// 16 bytes that mark those behind a word of so many letters.
inline const char* BehindWord(std::size_t length) {
    return reinterpret_cast<const char*>(WordAndBehind) + LongestWord - length;
}

/// Writes the word's letters, `length` of them, into a buffer of 16. What stands behind them there
/// is written again as it is, so that no branch depends on the length.
inline void WriteLetters(PackedWord word, std::size_t length, char* to) {
    static_assert(std::endian::native == std::endian::little);
    std::uint64_t halves[2];
    std::uint64_t behind[2];
    std::memcpy(halves, to, sizeof halves);
    std::memcpy(behind, BehindWord(length), sizeof behind);
    halves[0] = (halves[0] & behind[0]) | __builtin_bswap64(static_cast<std::uint64_t>(word >> 64));
    halves[1] = (halves[1] & behind[1]) | __builtin_bswap64(static_cast<std::uint64_t>(word));
    std::memcpy(to, halves, sizeof halves);
}

}  // namespace Quorle
