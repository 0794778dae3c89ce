#pragma once
// The one dictionary of the process, with its word-size limits.
#include <cstdint>

#include "graph_builder.h"
#include "word_cursor.h"
#include "word_graph.h"

inline constexpr std::int32_t ShortestWordSize = 2;
inline constexpr std::int32_t LongestWordSize = 16;

struct CurrentDictionary {
    WordGraph words;
    std::int32_t minWordSize = 3;
    std::int32_t maxWordSize = 16;
};

inline CurrentDictionary TheDictionary;
