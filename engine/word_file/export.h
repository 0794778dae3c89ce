#pragma once
// Writing the dictionary as a text file.
#include <string>

#include "graph/word_graph.h"

namespace Quorle {

/// Every word, in alphabetical order, one a line.
std::string WordsAsText(const WordGraph& words);

}  // namespace Quorle
