#include "word_file_tokens.h"

#include <array>
#include <cstdint>

namespace {

constexpr std::array<unsigned char, 256> MakeCodes(unsigned char separator) {
    std::array<unsigned char, 256> codes{};
    for (const unsigned char space : {' ', '\t', '\n', '\v', '\f', '\r'}) codes[space] = separator;
    for (unsigned char letter = 'a'; letter <= 'z'; ++letter) {
        codes[letter] = letter;
        codes[std::size_t{letter} - 'a' + 'A'] = letter;
    }
    return codes;
}

}  // namespace

const std::array<unsigned char, 256> WordTokens::Codes = MakeCodes(Separator);
