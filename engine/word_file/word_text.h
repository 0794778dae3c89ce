#pragma once
// Cutting the text of a word file into words. Words stand between ASCII white space; capitals
// become lower case. A token with any other byte, or of other than 2 to 16 letters, is left out.
#include <algorithm>

#include "graph/packed_word.h"

namespace Quorle {

inline constexpr bool IsSpace(std::byte byte) {
    return byte == std::byte{' '} || (byte >= std::byte{'\t'} && byte <= std::byte{'\r'});
}

/// The letters at the beginning of a text, in lower case.
struct LeadingLetters {
    PackedWord word;
    std::size_t number;  // 0..16
};

/// Looks at the 16 bytes at `text`, all at once.
inline LeadingLetters LettersAt(const std::byte* text) {
    constexpr std::uint64_t EachByte = 0x0101010101010101;
    constexpr std::uint64_t HighBits = EachByte * 0x80;
    constexpr std::uint64_t Fold = EachByte * ('a' - 'A');
    // The additions carry into a byte's high bit from "a" on, and from beyond "z" on.
    const auto count = [](std::uint64_t bytes) {
        const std::uint64_t low = bytes & ~HighBits;
        const std::uint64_t fromA = low + EachByte * (0x80 - 'a');
        const std::uint64_t beyondZ = low + EachByte * (0x80 - 'z' - 1);
        const std::uint64_t others = (~fromA | beyondZ | bytes) & HighBits;
        return static_cast<std::size_t>(std::countl_zero(others)) / 8;
    };
    const PackedWord all = LoadBytes(text) | (PackedWord{Fold} << 64 | Fold);
    std::size_t number = count(static_cast<std::uint64_t>(all >> 64));
    if (number == 8) number += count(static_cast<std::uint64_t>(all));
    return {number == 0 ? 0 : FirstLetters(all, number), number};
}

/// Calls `found` with each word of the text, and returns where the token begins that the text ends
/// within, or its end. Behind it 16 bytes can be read; the first is no letter and no space.
template <class Found>
const std::byte* ReadWords(const std::byte* at, const std::byte* end, const Found& found) {
    while (at < end) {
        const LeadingLetters letters = LettersAt(at);
        const std::byte* after = at + letters.number;
        if (!IsSpace(*after)) {  // another byte, or a seventeenth letter
            after = std::find_if(after, end, IsSpace);
            if (after == end) return at;
        } else if (letters.number >= 2) {
            found(letters.word);
        }
        at = after + 1;
    }
    return end;
}

}  // namespace Quorle
