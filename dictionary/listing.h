#pragma once
// What the dictionary editor shows: the prefixes that have words, and the words of
// the prefix selected. The word engine holds the words; no copy is kept.
#include "state/game_state.h"

namespace Dictionary {

/// Lists the prefixes anew and shows the editor. True selects the first, False
/// keeps the one selected where it still has words. The caller goes on with
/// ListWords.
void ListStartingLetters(Boolean ResetSelection);

/// Counts the dictionary's words and lists those of the prefix selected; shows
/// the editor.
void ListWords();

/// Shows the editor where it is hidden. During a game, a message box or behind
/// another program it takes no focus: what the player types belongs there. Where
/// it cannot but take it, it waits for the game's end and for the program's return to
/// the front.
void ShowEditor();

/// Shows the editor where it waits and need not wait any longer.
void ShowWaitingEditor();

}  // namespace Dictionary
