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

/// Writes the word's letters, 2 to 16, and nothing behind them: by both ends, which may overlap.
inline void WriteLetters(PackedWord word, std::size_t length, char* to) {
    static_assert(std::endian::native == std::endian::little);
    const auto write = [to, length](auto first, auto last) {
        std::memcpy(to, &first, sizeof first);
        std::memcpy(to + length - sizeof last, &last, sizeof last);
    };
    const auto high = static_cast<std::uint64_t>(word >> 64);
    if (length > 8) {
        const auto end = static_cast<std::uint64_t>(word >> 8 * (LongestWord - length));
        return write(__builtin_bswap64(high), __builtin_bswap64(end));
    }
    const std::uint64_t end = high >> 8 * (8 - length);
    if (length >= 4) {
        write(__builtin_bswap32(static_cast<std::uint32_t>(high >> 32)),
              __builtin_bswap32(static_cast<std::uint32_t>(end)));
    } else if (length >= 2) {
        write(__builtin_bswap16(static_cast<std::uint16_t>(high >> 48)),
              __builtin_bswap16(static_cast<std::uint16_t>(end)));
    }
}

}  // namespace Quorle
