#pragma once
// What the player can do in the results window.
#include <QString>

namespace Common {

/// Lights the chain of a word on the small board.
void ShowResultPath(const QString& word);

/// Moves the selected bad word into the dictionary and the other lists.
void AcceptBadWord();

/// Takes the selected computer's word out of the dictionary, to the bad list.
void RejectDictWord();

/// Hides and empties the window, once it has been shown for 2 seconds: a player
/// still typing would close it unseen.
void CloseResults();

}  // namespace Common
