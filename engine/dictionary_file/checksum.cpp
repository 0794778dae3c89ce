#include <array>
#include <cstring>

#include "dictionary_file/file_form.h"

namespace Quorle {

namespace {

constexpr auto Table = [] {
    std::array<std::uint32_t, 256> table{};
    for (std::uint32_t i = 0; i < 256; ++i) {
        table[i] = i;
        for (int bit = 0; bit < 8; ++bit) table[i] = table[i] >> 1 ^ table[i] % 2 * 0x82f63b78U;
    }
    return table;
}();

std::uint32_t ByTable(std::uint32_t crc, std::span<const std::byte> bytes) {
    for (const std::byte byte : bytes) {
        crc = crc >> 8 ^ Table[crc % 256 ^ std::to_integer<std::uint32_t>(byte)];
    }
    return crc;
}

#if defined(__x86_64__)
[[gnu::target("sse4.2")]] std::uint32_t ByInstruction(std::uint64_t crc,
                                                      std::span<const std::byte> bytes) {
    for (; bytes.size() >= 8; bytes = bytes.subspan(8)) {
        std::uint64_t eight = 0;
        std::memcpy(&eight, bytes.data(), sizeof eight);
        crc = __builtin_ia32_crc32di(crc, eight);
    }
    return ByTable(static_cast<std::uint32_t>(crc), bytes);
}
#endif

}  // namespace

std::uint32_t Checksum(std::span<const std::byte> file) {
    constexpr std::size_t At = offsetof(DictionaryHeader, checksum);
    const std::uint32_t before = ByTable(~0U, file.first(At));
    const auto rest = file.subspan(At + sizeof DictionaryHeader::checksum);
#if defined(__x86_64__)
    if (__builtin_cpu_supports("sse4.2")) return ~ByInstruction(before, rest);
#endif
    return ~ByTable(before, rest);
}

}  // namespace Quorle
