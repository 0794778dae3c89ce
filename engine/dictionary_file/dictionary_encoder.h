#pragma once
// Writing the nodes of a graph in the compact form of dictionary files.
#include <cstddef>
#include <vector>

#include "dictionary_file/dictionary_codes.h"
#include "graph/word_graph.h"

namespace Quorle {

/// Appends tables and nodes of a minimal graph to `out`, and fills in the header's counts.
void EncodeGraph(const WordGraph& graph, std::vector<std::byte>& out, DictionaryHeader& header);

}  // namespace Quorle
