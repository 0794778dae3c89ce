#pragma once
// A board of 4 by 4 letter cubes, as places that chains go along.
//
// Places 0 to 15 are the cubes. A Qu cube i shows "q" and touches place 16 + i alone, which shows
// "u" and touches the cube's neighbours: so each place is one letter, and a word may end in a lone
// "q".
#include "graph/edge_store.h"

#if defined(__x86_64__)
#include <immintrin.h>
#endif

namespace Quorle {

inline constexpr std::uint32_t Cubes = 16;
inline constexpr std::uint32_t Places = 2 * Cubes;
inline constexpr std::uint32_t MostTouching = 8;
inline constexpr std::uint32_t AllCubes = (1U << Cubes) - 1;

/// The letters "a" to "z" of the cubes, row by row; "q" stands for the Qu cube.
using Board = std::array<char, Cubes>;

/// Bit i of each cube's: cube i touches it.
inline constexpr auto Around = [] {
    std::array<std::uint32_t, Cubes> around{};
    for (std::uint32_t cube = 0; cube < Cubes; ++cube) {
        const std::uint32_t row = (cube % 4 > 0 ? 1U : 0) | 2 | (cube % 4 < 3 ? 4U : 0);
        const std::uint32_t rows = (row | row << 4 | row << 8) << cube % 4 >> 1;
        const std::uint32_t all = cube < 4 ? rows >> 4 : rows << (cube / 4 - 1) * 4;
        around[cube] = all & AllCubes & ~(1U << cube);
    }
    return around;
}();

/// The fields of an edge as one value, and a fourth: the places that a chain has not gone along.
using Fields [[gnu::vector_size(16)]] = std::uint32_t;
inline constexpr int First = 0, Mask = 1, Before = 2, Free = 3;

/// What a step to a place needs to know of it: an array each, as indexes then need no arithmetic.
class BoardPlaces {
  public:
    BoardPlaces() {
        for (std::uint32_t i = 0; i < Places; ++i) {
            touching[i] = Around[i % Cubes];
            kept[i] = Fields{0, 0, ~0U, ~(1U << i)};
            setLetter(i, 'u');  // of a place behind the cubes: for good
        }
    }
    void show(const Board& board) {
        for (std::uint32_t i = 0; i < Cubes; ++i) {
            setLetter(i, board[i]);
            touching[i] = board[i] == 'q' ? 1U << (Cubes + i) : Around[i];
        }
    }

    std::array<Fields, Places> kept;             // what a chain that goes there keeps of its head
    std::array<std::uint32_t, Places> below;     // the bits of the letters before its own
    std::array<std::uint32_t, Places> touching;  // bit i: place i can follow
    // The letter of each place, as the bit of a byte of an edge's first eight.
    alignas(32) std::array<std::uint8_t, Places> byte;
    alignas(32) std::array<std::uint8_t, Places> bit;

  private:
    void setLetter(std::uint32_t place, char shown) {
        const auto letter = static_cast<std::uint32_t>(shown - 'a');
        below[place] = (1U << letter) - 1;
        byte[place] = static_cast<std::uint8_t>(offsetof(Edge, letters) + letter / 8);
        bit[place] = static_cast<std::uint8_t>(1U << letter % 8);
    }
};

}  // namespace Quorle
