#pragma once
// Submitting the word in NewWord to the player's list.

namespace Entry {

/// Checks the word against the word sizes, the board and the words entered, and
/// lists it on top, struck through when the dictionary does not hold it.
void Submit();

}  // namespace Entry
