#pragma once
// All that the engine holds between two calls.
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "graph/dictionary.h"
#include "graph/word_cursor.h"
#include "search/board_search.h"
#include "word_file/merge_line.h"

namespace Quorle {

struct LastSearch {
    std::unique_ptr<BoardSearch> search;  // made by the first search
    Board board{};
    std::vector<FoundWord> words;
    std::optional<Speller> speller;  // once the words are sorted
    std::vector<FoundWord> room;     // for sorting
};

struct EngineState {
    Dictionary dictionary;
    WordCursor listing;
    LastSearch found;
    MergeLine merges{dictionary};
    std::set<std::string> unreadable;  // dictionary files, by their path without links
};

}  // namespace Quorle
