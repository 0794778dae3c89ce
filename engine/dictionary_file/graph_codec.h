#pragma once
// The nodes of a graph in the compact form of dictionary files; FILE_FORMAT.md describes it.
#include <cstddef>
#include <memory>
#include <span>
#include <vector>

#include "dictionary_file/dictionary_codes.h"
#include "graph/word_graph.h"

namespace Quorle {

/// Appends tables and nodes of a minimal graph to `out`, and fills in the header's counts.
void EncodeGraph(const WordGraph& graph, std::vector<std::byte>& out, DictionaryHeader& header);

/// The finished base, or null when the bytes, which follow the header and may be anything, are not
/// exactly a graph of its counts. Throws std::bad_alloc.
std::shared_ptr<EdgeStore> DecodeGraph(const DictionaryHeader& header,
                                       std::span<const std::byte> bytes);

}  // namespace Quorle
