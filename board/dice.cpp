#include "board/dice.h"

#include <cmath>

#include "platform/platform.h"
#include "state/game_state.h"

namespace {

constexpr std::int16_t FaceCount = 6;

// The index of the free cube that `count` other free cubes stand before.
std::size_t FindFreeCube(const std::array<bool, CubeCount>& taken, std::int16_t count) {
    std::size_t cube = 0;
    while (taken[cube] || count > 0) {
        if (!taken[cube]) --count;
        ++cube;
    }
    return cube;
}

}  // namespace

namespace Dice {

void FillCubeFaces() {
    State.CubeFaces = {"EDAMCP", "TAYILB", "IROFXB", "SEWODN", "SACELR", "OSAHMR",
                       "YLGKUE", "WGLRIU", "OKUTND", "OQAMJB", "IPENHS", "VGTNEI",
                       "AZEVDN", "AOIATC", "TUSEPL", "IFEHEY"};
}

std::int16_t RandomBelow(std::int16_t n) {
    return static_cast<std::int16_t>(std::floor(Platform::RandomNumber() * static_cast<float>(n)));
}

std::string ShakeCubes() {
    std::array<bool, CubeCount> taken{};
    std::string shake;
    for (std::int16_t i = 0; i < CubeCount; ++i) {
        const std::size_t cube =
            FindFreeCube(taken, RandomBelow(static_cast<std::int16_t>(CubeCount - i)));
        taken[cube] = true;
        shake += State.CubeFaces[cube][static_cast<std::size_t>(RandomBelow(FaceCount))];
    }
    return shake;
}

void PutOnBoard(std::int16_t k, char letter) {
    const auto index = static_cast<std::size_t>(k);
    std::string& cell = State.BoardGrid[index / BoardSize][index % BoardSize];
    if (letter == 'Q') {
        State.CubeLetters[index] = "Qu";
        cell = "qu";
    } else {
        State.CubeLetters[index] = std::string(1, letter);
        cell = std::string(1, static_cast<char>(letter - 'A' + 'a'));
    }
}

}  // namespace Dice
