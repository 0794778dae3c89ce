#pragma once
// Finding every word of a graph on a board of 4 by 4 touching cubes.
#include <array>
#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

#include "word_graph.h"

inline constexpr int Cubes = 16;

/// The letters 0..25 of the cubes, row by row; "q" stands for the Qu cube.
using Board = std::array<std::uint8_t, Cubes>;

/// How the letters below a node are compared with those around a cube; all find the same.
enum class Matching { Plain, Avx2, Avx512 };

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

    /// The indexes of the words found, ascending, each once; valid until the next search.
    const std::vector<std::uint32_t>& search(const WordGraph& graph, const Board& board,
                                             SearchLimits limits);

  private:
    struct State;

    Matching matching_;
    std::unique_ptr<State> state_;
};
