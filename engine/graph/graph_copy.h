#pragma once
// Making a graph anew: minimal again after edits, or without its longer words.
#include "graph/word_graph.h"

namespace Quorle {

/// The minimal graph of the words of at most `longest` letters (1 to 16). Goes by nodes, not by
/// words: a small graph may spell a huge number of them. Throws std::bad_alloc.
WordGraph CopyGraph(const WordGraph& words, std::size_t longest);

}  // namespace Quorle
