#pragma once
// The form of a dictionary in its file; FILE_FORMAT.md describes every byte.
#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "graph/packed_word.h"
#include "graph/word_graph.h"

namespace Quorle {

struct DictionaryContent {
    WordGraph words;
    std::int32_t maxWordSize = 16;
};

/// The file's bytes. Throws std::bad_alloc.
std::vector<std::byte> EncodeDictionary(const DictionaryContent& content);

/// Takes a file's bytes apart; false, and `content` as it was, when they are not exactly what
/// EncodeDictionary may write. Takes time and memory of a small multiple of the bytes, whatever
/// they are. Throws std::bad_alloc.
bool DecodeDictionary(std::span<const std::byte> file, DictionaryContent& content);

}  // namespace Quorle
