#pragma once
// What a screen reader is told of the game's board and time.

namespace Game {

/// The board that has just been shaken.
void TellNewBoard();

/// Time, words and board, when the player asks.
void TellGame();

/// The time left, at a minute, 30 and 10 seconds.
void TellTimeLeft();

}  // namespace Game
