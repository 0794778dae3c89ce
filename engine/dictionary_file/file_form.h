#pragma once
// The numbers of a dictionary file that both its ways share; FILE_FORMAT.md tells what they mean.
#include <bit>
#include <cstddef>
#include <cstdint>
#include <span>

namespace Quorle {

struct DictionaryHeader {
    std::uint32_t magic = 0x64727551;  // "Qurd"
    std::uint32_t checksum = 0;
    std::uint16_t version = 1;
    std::uint16_t maxWordSize = 0;
    std::uint32_t words = 0;
    std::uint32_t nodes = 0;
    std::uint32_t edges = 0;
    std::uint32_t shared = 0;
    std::uint16_t masks = 0;
    std::uint16_t hotLinks = 0;
};
inline constexpr std::size_t HeaderSize = 32;
static_assert(sizeof(DictionaryHeader) == HeaderSize);
static_assert(std::endian::native == std::endian::little, "numbers are copied as they are");

// What stands where a node may begin.
inline constexpr std::uint32_t ShareCode = 0;      // the node before gets a number
inline constexpr std::uint32_t FirstMaskCode = 1;  // a node with the mask of the table

// What stands for each letter of a node.
inline constexpr std::uint32_t EndCode = 0;          // a word ends and no letter follows
inline constexpr std::uint32_t NewChildCode = 1;     // the newest node without a parent
inline constexpr std::uint32_t NewWordCode = 2;      // the same, and a word ends
inline constexpr std::uint32_t FirstSharedCode = 3;  // the table of links, then all numbers

// A code below OneByteCodes is one byte, a mask that is not in the table five.
inline constexpr std::uint32_t OneByteCodes = 128;
inline constexpr std::uint32_t LongCode = 255;  // first byte before four
inline constexpr std::uint32_t TwoByteCodes = OneByteCodes + (LongCode - OneByteCodes) * 256;

inline constexpr std::uint32_t MostMasks = TwoByteCodes - FirstMaskCode;
inline constexpr std::uint32_t MostHotLinks = OneByteCodes - FirstSharedCode;

/// The CRC-32C (Castagnoli, as in RFC 3720) of a file's bytes but the checksum's own.
std::uint32_t Checksum(std::span<const std::byte> file);

}  // namespace Quorle
