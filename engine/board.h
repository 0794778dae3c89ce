#pragma once
// A board of 4 by 4 letter cubes.
#include <algorithm>
#include <array>

inline constexpr int Cubes = 16;
inline constexpr int MostTouching = 8;  // cubes around a cube

/// The letters "a" to "z" of the cubes, row by row; "q" stands for the Qu cube.
using Board = std::array<char, Cubes>;

inline bool HasQu(const Board& board) {
    return std::find(board.begin(), board.end(), 'q') != board.end();
}
