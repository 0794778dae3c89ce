#pragma once
// The nodes of a graph in the compact form of dictionary files; FILE_FORMAT.md describes it.
#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <vector>

#include "graph/word_graph.h"

namespace Quorle {

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

struct DictionaryHeader {
    std::uint32_t magic;
    std::uint32_t checksum;
    std::uint16_t version;
    std::uint16_t maxWordSize;
    std::uint32_t words;
    std::uint32_t nodes;
    std::uint32_t edges;
    std::uint32_t shared;
    std::uint16_t masks;
    std::uint16_t hotLinks;
};
inline constexpr std::uint32_t HeaderSize = 32;
static_assert(sizeof(DictionaryHeader) == HeaderSize);
inline constexpr std::uint32_t ChecksumAt = 4;

/// Appends tables and nodes of a minimal graph to `out`, and fills in the header's counts.
void EncodeGraph(const WordGraph& graph, std::vector<std::byte>& out, DictionaryHeader& header);

/// The finished base, or null when the bytes, which follow the header and may be anything, are not
/// exactly a graph of its counts. Throws std::bad_alloc.
std::shared_ptr<EdgeStore> DecodeGraph(const DictionaryHeader& header,
                                       std::span<const std::byte> bytes);

}  // namespace Quorle
