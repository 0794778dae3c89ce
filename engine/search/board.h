#pragma once
// A board of 4 by 4 letter cubes, as places that chains go along.
//
// Places 0 to 15 are the cubes. A Qu cube i shows "q" and touches place 16 + i alone, which shows
// "u", touches the cube's neighbours and is never used up: so each place is one letter, and a word
// may end in a lone "q".
#include <array>
#include <cstdint>

namespace Quorle {

inline constexpr std::uint32_t Cubes = 16;
inline constexpr std::uint32_t Places = 2 * Cubes;
inline constexpr std::uint32_t MostTouching = 8;

/// The letters "a" to "z" of the cubes, row by row; "q" stands for the Qu cube.
using Board = std::array<char, Cubes>;

inline constexpr std::uint32_t NoLetter = 1U << 30;  // in no edge

/// Bit i of each cube's: cube i touches it.
inline constexpr auto Around = [] {
    std::array<std::uint32_t, Cubes> around{};
    for (std::uint32_t cube = 0; cube < Cubes; ++cube) {
        const std::uint32_t row = (cube % 4 > 0 ? 1U : 0) | 2 | (cube % 4 < 3 ? 4U : 0);
        const std::uint32_t rows = (row | row << 4 | row << 8) << cube % 4 >> 1;
        const std::uint32_t all = cube < 4 ? rows >> 4 : rows << (cube / 4 - 1) * 4;
        around[cube] = all & 0xffff & ~(1U << cube);
    }
    return around;
}();

struct BoardPlaces {
    std::array<std::uint32_t, Places> shown;       ///< the letter of each place, as a bit
    std::array<std::uint32_t, Places> touching{};  ///< bit i: place i can follow

    explicit BoardPlaces(const Board& board) {
        shown.fill(NoLetter);
        for (std::uint32_t cube = 0; cube < Cubes; ++cube) {
            shown[cube] = 1U << (board[cube] - 'a');
            touching[cube] = Around[cube];
            if (board[cube] != 'q') continue;
            shown[Cubes + cube] = 1U << ('u' - 'a');
            touching[Cubes + cube] = Around[cube];
            touching[cube] = 1U << (Cubes + cube);
        }
    }
};

}  // namespace Quorle
