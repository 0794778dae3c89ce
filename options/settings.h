#pragma once
// The player's four settings in the word engine's store.
#include <cstdint>

namespace Common {

/// Reads the settings into the game state and the engine. May show the messages
/// of ReconcileMaxWordSize.
void LoadSettings();

/// Writes all four from the game state and the engine.
void SaveSettings();

/// Settles a stored maximum word size (2..16) with the loaded dictionary: warns
/// when it is above the dictionary's, asks whether to drop longer words when it
/// is below.
void ReconcileMaxWordSize(std::int16_t size);

}  // namespace Common
