#pragma once
// The one judge of whether a word lies on the board.
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "state/game_state.h"

namespace CheckCubes {

struct Trace {
    Boolean found;
    std::optional<BoardMarks> path;
    std::vector<std::size_t> chain;  ///< the path's board indexes in the word's order
};

/// Whether `word` lies on the board along a chain of touching cubes, none used twice,
/// and the chain, of several the one with the smallest board indexes from its first
/// cube on. The empty word is on every board and marks nothing. After a failure the
/// path marks the last cube, in board order, that shows the word's first letter;
/// there is no path where none does.
Trace TraceWord(std::string_view word);

/// The same; TracedPath takes the path where there is one.
Boolean IsOnBoard(std::string_view word);

/// The number of bytes, from the front, of the longest beginning of `text` that
/// is on the board. TracedPath is left as IsOnBoard leaves it for that beginning.
std::size_t LongestOnBoard(std::string_view text);

/// Where the cubes of a word lie, in its order: "row 1 column 2, row 1 column 3"; empty
/// when it is not on the board.
std::string Places(std::string_view word);

}  // namespace CheckCubes
