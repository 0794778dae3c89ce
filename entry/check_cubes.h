#pragma once
// The one judge of whether a word lies on the board.
#include <cstddef>
#include <string_view>

#include "game/game_state.h"

namespace CheckCubes {

/// True when `word` lies on the board along a chain of touching cubes, none used
/// twice; TracedPath then marks the chain, of several the one with the smallest
/// board indexes from its first cube on. The empty word is on every board and
/// marks nothing. After a failure the last cube, in board order, that shows the
/// word's first letter stays marked; where none does, TracedPath stays as it was.
Boolean IsOnBoard(std::string_view word);

/// The number of bytes, from the front, of the longest beginning of `text` that
/// is on the board. TracedPath is left as IsOnBoard leaves it for that beginning.
std::size_t LongestOnBoard(std::string_view text);

}  // namespace CheckCubes
