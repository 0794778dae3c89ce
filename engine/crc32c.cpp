#include "crc32c.h"

#include <array>
#include <cstring>

#if defined(__x86_64__)
#include <nmmintrin.h>
#endif

namespace {

constexpr std::uint32_t Polynomial = 0x82f63b78U;

// Tables[n][b]: what byte b, followed by n zero bytes, does to the checksum.
using TableSet = std::array<std::array<std::uint32_t, 256>, 8>;

constexpr TableSet MakeTables() {
    TableSet tables{};
    for (std::uint32_t i = 0; i < 256; ++i) {
        std::uint32_t crc = i;
        for (int bit = 0; bit < 8; ++bit) crc = (crc >> 1) ^ ((crc & 1) != 0 ? Polynomial : 0);
        tables[0][i] = crc;
    }
    for (std::size_t n = 1; n < tables.size(); ++n) {
        for (std::size_t i = 0; i < 256; ++i) {
            const std::uint32_t crc = tables[n - 1][i];
            tables[n][i] = (crc >> 8) ^ tables[0][crc & 0xff];
        }
    }
    return tables;
}

constexpr TableSet Tables = MakeTables();

std::uint64_t EightBytes(const std::byte* bytes) {
    std::uint64_t value = 0;
    std::memcpy(&value, bytes, sizeof value);
    return value;
}

std::uint32_t OneByte(std::uint32_t crc, std::byte byte) {
    return (crc >> 8) ^ Tables[0][(crc ^ std::to_integer<std::uint32_t>(byte)) & 0xff];
}

#if defined(__x86_64__)
[[gnu::target("sse4.2")]] std::uint32_t ByInstruction(std::uint32_t crc,
                                                      std::span<const std::byte> bytes) {
    std::uint64_t wide = crc;
    for (; bytes.size() >= 8; bytes = bytes.subspan(8)) {
        wide = _mm_crc32_u64(wide, EightBytes(bytes.data()));
    }
    crc = static_cast<std::uint32_t>(wide);
    for (const std::byte byte : bytes) crc = OneByte(crc, byte);
    return crc;
}
#endif

}  // namespace

std::uint32_t Crc32cByTables(std::uint32_t crc, std::span<const std::byte> bytes) {
    crc = ~crc;
    for (; bytes.size() >= 8; bytes = bytes.subspan(8)) {
        const std::uint64_t mixed = EightBytes(bytes.data()) ^ crc;
        crc = 0;
        for (std::size_t i = 0; i < 8; ++i) crc ^= Tables[7 - i][(mixed >> (8 * i)) & 0xff];
    }
    for (const std::byte byte : bytes) crc = OneByte(crc, byte);
    return ~crc;
}

std::uint32_t Crc32c(std::uint32_t crc, std::span<const std::byte> bytes) {
#if defined(__x86_64__)
    if (__builtin_cpu_supports("sse4.2")) return ~ByInstruction(~crc, bytes);
#endif
    return Crc32cByTables(crc, bytes);
}
