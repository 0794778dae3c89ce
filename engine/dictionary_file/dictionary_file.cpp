#include "dictionary_file/dictionary_file.h"

#include <bit>
#include <cstring>

#include "dictionary_file/crc32c.h"
#include "dictionary_file/graph_codec.h"
#include "graph/graph_copy.h"

namespace Quorle {

static_assert(std::endian::native == std::endian::little, "headers are copied as they are");

namespace {

constexpr std::uint32_t Magic = 0x64727551;  // "Qurd"
constexpr std::uint16_t Version = 1;

std::uint32_t Checksum(std::span<const std::byte> bytes) {
    return Crc32c(Crc32c(0, bytes.first(ChecksumAt)), bytes.subspan(ChecksumAt + 4));
}

bool IsSound(const DictionaryHeader& header) {
    return header.magic == Magic && header.version == Version && header.maxWordSize >= 2 &&
           header.maxWordSize <= LongestWord;
}

}  // namespace

std::vector<std::byte> EncodeDictionary(const DictionaryContent& content) {
    const bool isMinimal = content.words.isMinimal();
    const WordGraph words = isMinimal ? content.words : CopyGraph(content.words, LongestWord);
    DictionaryHeader header{};
    header.magic = Magic;
    header.version = Version;
    header.maxWordSize = static_cast<std::uint16_t>(content.maxWordSize);
    header.words = words.size();
    std::vector<std::byte> bytes(HeaderSize);
    EncodeGraph(words, bytes, header);
    std::memcpy(bytes.data(), &header, HeaderSize);
    header.checksum = Checksum(bytes);
    std::memcpy(bytes.data(), &header, HeaderSize);
    return bytes;
}

bool DecodeDictionary(std::span<const std::byte> bytes, DictionaryContent& content) {
    DictionaryHeader header{};
    if (bytes.size() < HeaderSize) return false;
    std::memcpy(&header, bytes.data(), HeaderSize);
    if (!IsSound(header) || header.checksum != Checksum(bytes)) return false;
    auto store = DecodeGraph(header, bytes.subspan(HeaderSize));
    if (!store) return false;
    content.words = WordGraph(std::move(store));
    content.maxWordSize = header.maxWordSize;
    return true;
}

}  // namespace Quorle
