#pragma once
// The checksum of dictionary files: CRC-32C (Castagnoli), as in RFC 3720.
#include <cstddef>
#include <cstdint>
#include <span>

namespace Quorle {

/// Continues `crc` (0 at the start) over more bytes.
std::uint32_t Crc32c(std::uint32_t crc, std::span<const std::byte> bytes);

}  // namespace Quorle
