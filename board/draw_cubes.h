#pragma once
// The board on the main window. A tile is drawn anew only when its letter or its
// look changes.
#include <cstdint>

namespace Common {

/// Show tile k (board index 0..15) with CubeLetters(k), orange or green.
void DrawCubeNormal(std::int16_t k);
void DrawCubeSelected(std::int16_t k);

void DrawAllCubesNormal();

}  // namespace Common

namespace Board {

/// Shows the tiles that TracedPath marks selected, the others normal.
void DrawTracedPath();

}  // namespace Board
