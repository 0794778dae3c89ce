#pragma once
// The game's dealings with the dictionary that the word engine holds.
#include <string>

#include "state/game_state.h"

namespace Dictionary {

/// Loads Dictionary.dat; where that fails, the engine keeps what it holds: nothing, or the
/// installed words where a copy of them could not be written.
void LoadDictionary();

/// Saves Dictionary.dat.
void SaveDictionary();

/// True when the dictionary holds the word (lower case).
Boolean IsInDictionary(const std::string& word);

/// Change the dictionary and mark it changed.
void AddToDictionary(const std::string& word);
void RemoveFromDictionary(const std::string& word);

/// Makes `letters` (2..16) the maximum word size, drops the longer words and marks
/// the dictionary changed.
void ShortenDictionary(std::int16_t letters);

}  // namespace Dictionary
