#pragma once
// Finding every word of a graph on a board of touching cubes.
#include <cstdint>
#include <memory>
#include <vector>

#include "board.h"
#include "found_words.h"
#include "word_graph.h"

/// How the letters below a node are compared with those of the cubes; all find the same. Wide:
/// sixteen chains at once, and Avx512 on boards with a Qu cube.
enum class Matching { Plain, Avx2, Avx512, Wide };

/// Whether this machine can do it, and the best that it can.
bool CanMatch(Matching matching);
Matching BestMatching();

struct SearchLimits {
    std::int32_t minLetters;
    std::int32_t maxLetters;
};

/// The working memory of searches, used again by each.
class BoardSearch {
  public:
    explicit BoardSearch(Matching matching = BestMatching());
    ~BoardSearch();
    BoardSearch(const BoardSearch&) = delete;
    BoardSearch& operator=(const BoardSearch&) = delete;

    /// Replaces `found` by the words found, each once, in no order. Throws std::bad_alloc; then
    /// the BoardSearch is of no more use.
    void search(const WordGraph& graph, const Board& board, SearchLimits limits,
                std::vector<FoundWord>& found);

  private:
    struct State;

    Matching matching_;
    std::unique_ptr<State> state_;
};
