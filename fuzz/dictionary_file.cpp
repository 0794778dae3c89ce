// Any bytes as a dictionary file, the checksum made right: refused, or a dictionary that works.
#include <vector>

#include "fuzz_target.h"

namespace {

constexpr std::size_t ChecksumAt = 4;

/// CRC-32C of all bytes but the checksum's own.
std::uint32_t Checksum(std::string_view bytes) {
    std::uint32_t crc = ~0U;
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        if (i >= ChecksumAt && i < ChecksumAt + 4) continue;
        crc ^= static_cast<unsigned char>(bytes[i]);
        for (int bit = 0; bit < 8; ++bit) crc = crc >> 1 ^ (crc & 1 ? 0x82F63B78U : 0);
    }
    return ~crc;
}

/// Few bytes can spell very many words; such a dictionary is not read through.
constexpr std::int32_t MostListed = 20'000;

std::vector<std::string> AllWords() {
    std::vector<std::string> words;
    for (std::int32_t first = 0; first < 26; ++first) {
        for (std::int32_t second = 0; second < 26; ++second) Fuzz::List(first, second, words);
    }
    return words;
}

void Use() {
    std::int32_t found = 0, other = 0;
    char word[] = "catsandcatsandca";
    cDictionaryCheck(word, &found, &other);
    if (cNumberOfWords() > MostListed) return;
    const std::vector<std::string> words = AllWords();
    REQUIRE(cNumberOfWords() == static_cast<std::int32_t>(words.size()));
    const std::int32_t max = cMaxWordSize();
    REQUIRE(max >= 2 && max <= 16);
    REQUIRE(cCheckForAllDefinedWords("catsboneqildhefy") <= cNumberOfWords());
    const std::string path = Fuzz::Folder() + "/saved.dat";
    REQUIRE(cWriteBinaryDictionary(path.c_str()) == 1);
    cDictionaryAdd("cat");
    cDictionaryRemove(words.empty() ? "cat" : words.front().c_str());
    REQUIRE(cReadBinaryDictionary(path.c_str()) == 1);
    REQUIRE(AllWords() == words && cMaxWordSize() == max);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::string bytes(Fuzz::Text(data, size));
    if (size >= ChecksumAt + 4) {
        const std::uint32_t checksum = Checksum(bytes);
        for (std::size_t i = 0; i < 4; ++i) {
            bytes[ChecksumAt + i] = static_cast<char>(checksum >> 8 * i);
        }
    }
    if (cReadBinaryDictionary(Fuzz::Write("input.dat", bytes).c_str()) == 1) Use();
    return 0;
}
