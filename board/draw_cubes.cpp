#include "board/draw_cubes.h"

#include "main_window/cube_tile.h"
#include "main_window/main_window.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

constexpr std::int16_t DrawnNormal = 1;
constexpr std::int16_t DrawnSelected = 2;

void DrawCube(std::int16_t k, std::int16_t look) {
    const auto index = static_cast<std::size_t>(k);
    CubeTile& tile = *Windows::Shared<Main>().Cube[index];
    const QString letter = QString::fromStdString(State.CubeLetters[index]);
    if (tile.letter() == letter && State.CubeDrawState[index] == look) return;
    State.CubeDrawState[index] = look;
    tile.draw(look == DrawnSelected, letter);
}

}  // namespace

namespace Common {

void DrawCubeNormal(std::int16_t k) {
    DrawCube(k, DrawnNormal);
}

void DrawCubeSelected(std::int16_t k) {
    DrawCube(k, DrawnSelected);
}

void DrawAllCubesNormal() {
    for (std::int16_t k = 0; k < CubeCount; ++k) DrawCubeNormal(k);
}

}  // namespace Common

void Board::DrawTracedPath() {
    for (std::int16_t k = 0; k < CubeCount; ++k) {
        const auto index = static_cast<std::size_t>(k);
        const bool traced = State.TracedPath[index / BoardSize][index % BoardSize];
        DrawCube(k, traced ? DrawnSelected : DrawnNormal);
    }
}
