#pragma once
// A board of 4 by 4 letter cubes.
#include <array>
#include <cstdint>

inline constexpr int Cubes = 16;

/// The letters 0..25 of the cubes, row by row; "q" stands for the Qu cube.
using Board = std::array<std::uint8_t, Cubes>;

inline constexpr std::uint8_t LetterQ = 'q' - 'a';
inline constexpr std::uint8_t LetterU = 'u' - 'a';
