#pragma once
// One game, from Start to its end: the clock, pausing and stopping.

namespace Common {

/// Shakes a new board and starts the clock. A running game is dropped.
void StartGame();

/// Hides the board behind a message until the player is ready.
void PauseGame();

/// Ends the game now.
void StopGame();

/// Counts one second, while the game's window is in front and no pause is shown.
void ClockTick();

}  // namespace Common
