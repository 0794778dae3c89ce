#pragma once
// Making a graph anew: minimal again after edits, or without its longer words.
#include "word_graph.h"

/// The minimal graph of the words of at most `longest` letters (1 to 16). Goes by nodes, not by
/// words: a small graph may spell a huge number of them. Throws std::bad_alloc.
WordGraph Rebuilt(const WordGraph& words, std::uint32_t longest);
