#include "crc32c.h"

#include <array>

namespace {

constexpr std::uint32_t Polynomial = 0x82f63b78U;

constexpr std::array<std::uint32_t, 256> MakeTable() {
    std::array<std::uint32_t, 256> table{};
    for (std::uint32_t i = 0; i < table.size(); ++i) {
        std::uint32_t crc = i;
        for (int bit = 0; bit < 8; ++bit) crc = (crc >> 1) ^ ((crc & 1) != 0 ? Polynomial : 0);
        table[i] = crc;
    }
    return table;
}

constexpr auto Table = MakeTable();

}  // namespace

std::uint32_t Crc32c(std::uint32_t crc, std::span<const std::byte> bytes) {
    crc = ~crc;
    for (const std::byte byte : bytes) {
        crc = (crc >> 8) ^ Table[(crc ^ std::to_integer<std::uint32_t>(byte)) & 0xff];
    }
    return ~crc;
}
