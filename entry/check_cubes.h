#pragma once
// The one judge of whether a word lies on the board.
#include <cstddef>
#include <string>
#include <string_view>

#include "state/game_state.h"

namespace CheckCubes {

/// Whether `word` lies on the board along a chain of touching cubes, none used twice;
/// TracedPath takes the chain, of several the one with the smallest board indexes from its
/// first cube on. The empty word is on every board and marks nothing. After a failure
/// TracedPath marks the last cube, in board order, that shows the word's first letter; it
/// stays as it was where none does.
Boolean IsOnBoard(std::string_view word);

/// The number of bytes, from the front, of the longest beginning of `text` that
/// is on the board. TracedPath is left as IsOnBoard leaves it for that beginning.
std::size_t LongestOnBoard(std::string_view text);

/// Where the cubes of a word lie, in its order: "row 1 column 2, row 1 column 3"; empty
/// when it is not on the board.
std::string Places(std::string_view word);

}  // namespace CheckCubes
