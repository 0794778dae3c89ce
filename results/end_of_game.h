#pragma once
// The computer's side of a game, and its end.

namespace Common {

/// Has the word engine count the dictionary's words on the board.
void SolveBoard();

/// Ends the game and shows its results; what the results window still holds of
/// an earlier game stays.
void EndGame();

/// Rewrites the three summary lines from the three lists.
void UpdateResultLabels();

}  // namespace Common
