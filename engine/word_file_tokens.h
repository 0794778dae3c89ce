#pragma once
// Cutting the text of a word file into words.
#include <array>
#include <cstddef>
#include <span>

#include "packed_word.h"

/// Finds the words in a text that comes in blocks; a token may lie across blocks of any number.
/// Words stand between ASCII white space; capitals become lower case. A token with any other byte,
/// or of other than 2 to 16 letters, is left out.
class WordTokens {
  public:
    /// Calls `found` with each word that ends in the block.
    template <typename Found>
    void read(std::span<const std::byte> block, Found found) {
        std::size_t at = 0;
        while (at < block.size() && inToken()) readByte(block[at++], found);
        while (at + MaxPackedLetters < block.size()) {
            const LeadingLetters letters = LettersAt(block.data() + at);
            at += letters.number;
            if (code(block[at]) != Separator) {  // another byte, or a seventeenth letter
                while (at < block.size() && code(block[at]) != Separator) ++at;
                if (at == block.size()) length_ = TooLong;
            } else if (letters.number >= 2) {
                found(letters.word);
            }
            ++at;
        }
        while (at < block.size()) readByte(block[at++], found);
    }

    /// Calls `found` with the word at the text's end, if there is one.
    template <typename Found>
    void end(Found found) {
        if (length_ >= 2 && length_ <= MaxPackedLetters) {
            found(word_ << 8 * (MaxPackedLetters - length_));
        }
        length_ = 0;
        word_ = 0;
    }

    /// Whether the text so far ends within a token.
    bool inToken() const { return length_ > 0; }

  private:
    static constexpr unsigned char Separator = 1;
    static constexpr std::size_t TooLong = MaxPackedLetters + 1;
    static const std::array<unsigned char, 256> Codes;  // a letter's lower case, Separator, or 0

    static unsigned char code(std::byte byte) { return Codes[static_cast<std::size_t>(byte)]; }

    template <typename Found>
    void readByte(std::byte byte, Found found) {
        const unsigned char letter = code(byte);
        if (letter == Separator) return end(found);
        word_ = word_ << 8 | letter;
        length_ += letter == 0 ? TooLong : 1;
    }

    PackedWord word_ = 0;  // of the token so far
    std::size_t length_ = 0;
};
