#pragma once
// The sixteen letter cubes and the shake that puts them on the board.
#include <cstdint>
#include <string>

namespace Dice {

/// Fills CubeFaces. Once, at start-up.
void FillCubeFaces();

/// A whole number from 0 to n - 1, every one equally likely. n: 1..16.
std::int16_t RandomBelow(std::int16_t n);

/// Puts every cube once on the board, a random face up, with 32 draws.
/// Returns 16 upper-case letters in board order; "Q" stands for the Qu face.
std::string ShakeCubes();

/// Puts one letter of a shake on the board: CubeLetters and BoardGrid.
/// k: board index 0..15.
void PutOnBoard(std::int16_t k, char letter);

}  // namespace Dice
