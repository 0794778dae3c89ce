#include "dictionary_file/crc32c.h"

#include <array>
#include <cstring>

#if defined(__x86_64__)
#include <nmmintrin.h>
#endif

namespace Quorle {

namespace {

constexpr std::uint32_t Polynomial = 0x82f63b78U;

constexpr std::array<std::uint32_t, 256> MakeTable() {
    std::array<std::uint32_t, 256> table{};
    for (std::uint32_t i = 0; i < 256; ++i) {
        table[i] = i;
        for (int bit = 0; bit < 8; ++bit) {
            table[i] = (table[i] >> 1) ^ ((table[i] & 1) != 0 ? Polynomial : 0);
        }
    }
    return table;
}

constexpr auto Table = MakeTable();

std::uint32_t ByTable(std::uint32_t crc, std::span<const std::byte> bytes) {
    crc = ~crc;
    for (const std::byte byte : bytes) {
        crc = (crc >> 8) ^ Table[(crc ^ std::to_integer<std::uint32_t>(byte)) & 0xff];
    }
    return ~crc;
}

#if defined(__x86_64__)
[[gnu::target("sse4.2")]] std::uint32_t ByInstruction(std::uint32_t crc,
                                                      std::span<const std::byte> bytes) {
    std::uint64_t wide = ~crc;
    for (; bytes.size() >= 8; bytes = bytes.subspan(8)) {
        std::uint64_t eight = 0;
        std::memcpy(&eight, bytes.data(), sizeof eight);
        wide = _mm_crc32_u64(wide, eight);
    }
    return ByTable(~static_cast<std::uint32_t>(wide), bytes);
}
#endif

}  // namespace

std::uint32_t Crc32c(std::uint32_t crc, std::span<const std::byte> bytes) {
#if defined(__x86_64__)
    if (__builtin_cpu_supports("sse4.2")) return ByInstruction(crc, bytes);
#endif
    return ByTable(crc, bytes);
}

}  // namespace Quorle
