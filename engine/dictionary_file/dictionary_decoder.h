#pragma once
// Reading the nodes of a dictionary file, every byte of which may be wrong.
#include <cstddef>
#include <memory>
#include <span>

#include "dictionary_file/dictionary_codes.h"
#include "graph/edge_store.h"

namespace Quorle {

/// The finished base, or null when the bytes, which follow the header, are not exactly a graph of
/// its counts. Throws std::bad_alloc.
std::shared_ptr<EdgeStore> DecodeGraph(const DictionaryHeader& header,
                                       std::span<const std::byte> bytes);

}  // namespace Quorle
