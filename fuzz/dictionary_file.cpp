// Any bytes as a dictionary file, the checksum made right: refused, or a dictionary that works.
// An input is a whole file, or begins with a line of words that make one; what follows changes it.
#include "fuzz_target.h"

namespace {

constexpr std::size_t ChecksumAt = 4;

/// Puts in the CRC-32C of all bytes but the checksum's own.
void MakeChecksumRight(std::string& bytes) {
    std::uint32_t crc = ~0U;
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        if (i >= ChecksumAt && i < ChecksumAt + 4) continue;
        crc ^= static_cast<unsigned char>(bytes[i]);
        for (int bit = 0; bit < 8; ++bit) crc = crc >> 1 ^ (crc & 1 ? 0x82F63B78U : 0);
    }
    for (std::size_t i = 0; i < 4 && bytes.size() >= ChecksumAt + 4; ++i) {
        bytes[ChecksumAt + i] = static_cast<char>(~crc >> 8 * i);
    }
}

/// Takes a place and a byte from each three bytes of the input.
std::string Changed(std::string_view input) {
    const std::string saved = Fuzz::Folder() + "/saved.dat";
    const std::size_t line = input.find('\n');
    if (line == input.npos) return std::string(input);
    cDictionaryClear();
    Fuzz::Merge(Fuzz::Write("words.txt", input.substr(0, line)));
    REQUIRE(cWriteBinaryDictionary(saved.c_str()) == 1);
    std::ifstream file(saved, std::ios::binary);
    std::string bytes(std::istreambuf_iterator<char>(file), {});
    for (std::size_t i = line + 1; i + 2 < input.size(); i += 3) {
        const auto place =
            static_cast<unsigned char>(input[i]) * 256U + static_cast<unsigned char>(input[i + 1]);
        bytes[place % bytes.size()] = input[i + 2];
    }
    return bytes;
}

/// Few bytes can spell very many words; such a dictionary is not read through.
constexpr std::int32_t MostListed = 20'000;

void Use() {
    if (cNumberOfWords() > MostListed) return;
    const std::set<std::string> words = Fuzz::AllWords();
    const std::int32_t max = cMaxWordSize();
    REQUIRE(cNumberOfWords() == static_cast<std::int32_t>(words.size()) && max >= 2 && max <= 16);
    REQUIRE(cCheckForAllDefinedWords("catsboneqildhefy") <= cNumberOfWords());
    const std::string path = Fuzz::Folder() + "/saved.dat";
    REQUIRE(cWriteBinaryDictionary(path.c_str()) == 1);
    cDictionaryAdd("cat");
    cDictionaryRemove(words.empty() ? "cat" : words.begin()->c_str());
    REQUIRE(cReadBinaryDictionary(path.c_str()) == 1);
    REQUIRE(Fuzz::AllWords() == words && cMaxWordSize() == max);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::string bytes = Changed(Fuzz::Text(data, size));
    const bool sound = cReadBinaryDictionary(Fuzz::Write("input.dat", bytes).c_str()) == 1;
    MakeChecksumRight(bytes);
    const bool read = cReadBinaryDictionary(Fuzz::Write("input.dat", bytes).c_str()) == 1;
    REQUIRE(read || !sound);
    if (read) Use();
    return 0;
}
