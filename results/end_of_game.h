#pragma once
// The computer's side of a game, and its end.
#include <QString>

namespace Common {

/// Has the word engine count the dictionary's words on the board.
void SolveBoard();

/// Ends the game and shows its results; what the results window still holds of
/// an earlier game stays. A screen reader says why before it reads the results.
void EndGame(const char* why);

/// Rewrites the three summary lines from the three lists.
void UpdateResultLabels();

}  // namespace Common

namespace GameResults {

/// The three summary lines in one.
QString SummaryText();

}  // namespace GameResults
