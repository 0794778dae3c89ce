#pragma once
// Building a word in NewWord by typing and clicking, its chain lit on the board.
#include <cstdint>

namespace Entry {

/// The typing handler: runs on every change of NewWord's text, whatever its cause.
void WordTyped();

/// A click on tile k (board index 0..15), and a double click.
void CubeClick(std::int16_t k);
void CubeDoubleClick(std::int16_t k);

/// The Clear button: takes the last letter off, "qu" as one.
void ClearLetter();

/// Plays the warning sound when the player wants sounds.
void PlayWarning();

}  // namespace Entry
