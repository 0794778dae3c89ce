#pragma once
// Finding every word of a graph on a board of touching cubes.
#include <memory>
#include <vector>

#include "graph/dictionary.h"
#include "search/board.h"
#include "search/found_words.h"

namespace Quorle {

/// How letters are compared with those of the places; both find the same.
enum class Matching { Plain, Avx2 };

/// Whether this machine can do it.
bool CanMatch(Matching matching);

/// The working memory of searches, used again by each.
class BoardSearch {
  public:
    explicit BoardSearch(Matching matching);
    ~BoardSearch();
    BoardSearch(const BoardSearch&) = delete;
    BoardSearch& operator=(const BoardSearch&) = delete;

    /// Replaces `found` by the words found, each once, in no order. Throws std::bad_alloc; then
    /// the BoardSearch is of no more use.
    void search(const WordGraph& graph, const Board& board, WordLimits limits,
                std::vector<FoundWord>& found);

  private:
    struct State;

    Matching matching_;
    std::unique_ptr<State> state_;
};

}  // namespace Quorle
