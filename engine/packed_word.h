#pragma once
// A word as a number, so that words are compared, sorted and cut from a text in a few instructions.
#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

/// A word of up to 16 letters, "a" to "z": the first letter in the highest byte, zeros behind the
/// last. Numbers and words have the same order.
__extension__ using PackedWord = unsigned __int128;

constexpr std::size_t MaxPackedLetters = 16;

/// Packs up to 16 letters.
inline PackedWord Pack(std::string_view letters) {
    PackedWord word = 0;
    for (const char letter : letters) word = word << 8 | static_cast<unsigned char>(letter);
    return letters.empty() ? 0 : word << 8 * (MaxPackedLetters - letters.size());
}

/// The number of letters, 1..16.
inline std::size_t LengthOf(PackedWord word) {
    const auto low = static_cast<std::uint64_t>(word);
    const auto high = static_cast<std::uint64_t>(word >> 64);
    const int unused = low != 0 ? std::countr_zero(low) : 64 + std::countr_zero(high);
    return MaxPackedLetters - static_cast<std::size_t>(unused) / 8;
}

/// Writes the word's letters to `letters` (room for 16) and returns their number.
inline std::size_t Unpack(PackedWord word, char* letters) {
    std::size_t length = 0;
    for (; word != 0; word <<= 8) letters[length++] = static_cast<char>(word >> 120);
    return length;
}

/// The word's first `number` letters, 1..16.
inline PackedWord FirstLetters(PackedWord word, std::size_t number) {
    const std::size_t unused = 8 * (MaxPackedLetters - number);
    return word >> unused << unused;
}

/// Whether the word has more than `size` letters, 1..16.
inline bool IsLonger(PackedWord word, std::size_t size) {
    return size < MaxPackedLetters && word << 8 * size != 0;
}

/// The 16 bytes at `text`, the first in the highest byte.
inline PackedWord LoadBytes(const std::byte* text) {
    std::uint64_t halves[2];
    std::memcpy(halves, text, sizeof halves);
    if (std::endian::native == std::endian::little) {
        halves[0] = __builtin_bswap64(halves[0]);
        halves[1] = __builtin_bswap64(halves[1]);
    }
    return static_cast<PackedWord>(halves[0]) << 64 | halves[1];
}

/// Writes 16 bytes to `text`, the word's letters and zeros.
inline void StoreBytes(PackedWord word, std::byte* text) {
    std::uint64_t halves[2] = {static_cast<std::uint64_t>(word >> 64),
                               static_cast<std::uint64_t>(word)};
    if (std::endian::native == std::endian::little) {
        halves[0] = __builtin_bswap64(halves[0]);
        halves[1] = __builtin_bswap64(halves[1]);
    }
    std::memcpy(text, halves, sizeof halves);
}

/// The letters at the beginning of a text, in lower case.
struct LeadingLetters {
    PackedWord word;
    std::size_t number;  // 0..16
};

namespace PackedWords {

constexpr std::uint64_t EachByte = 0x0101010101010101;
constexpr std::uint64_t HighBits = EachByte * 0x80;

/// The number of letters at the beginning of eight bytes whose capitals are folded. The additions
/// carry into a byte's high bit from "a" on, and from beyond "z" on.
inline std::size_t CountLetters(std::uint64_t bytes) {
    const std::uint64_t low = bytes & ~HighBits;
    const std::uint64_t fromA = low + EachByte * (0x80 - 'a');
    const std::uint64_t beyondZ = low + EachByte * (0x80 - 'z' - 1);
    const std::uint64_t others = (~fromA | beyondZ | bytes) & HighBits;
    return static_cast<std::size_t>(std::countl_zero(others)) / 8;
}

}  // namespace PackedWords

/// Looks at the 16 bytes at `text`, all at once.
inline LeadingLetters LettersAt(const std::byte* text) {
    using namespace PackedWords;
    constexpr std::uint64_t Fold = EachByte * ('a' - 'A');
    const PackedWord all = LoadBytes(text) | (static_cast<PackedWord>(Fold) << 64 | Fold);
    std::size_t number = CountLetters(static_cast<std::uint64_t>(all >> 64));
    if (number == 8) number += CountLetters(static_cast<std::uint64_t>(all));
    return {number == 0 ? 0 : FirstLetters(all, number), number};
}
