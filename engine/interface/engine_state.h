#pragma once
// All that the engine holds between two calls.
#include <memory>
#include <set>
#include <string>

#include "graph/dictionary.h"
#include "graph/word_cursor.h"
#include "search/board_search.h"
#include "word_file/merge_line.h"

namespace Quorle {

struct EngineState {
    Dictionary dictionary;
    WordCursor listing;
    std::unique_ptr<BoardSearch> search;  // made by the first one
    Board board{};                        // of the last one
    FoundWords found;
    MergeLine merges{dictionary};
    std::set<std::string> unreadable;  // dictionary files, by their path without links
};

}  // namespace Quorle
