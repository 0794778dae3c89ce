#pragma once
// The player's four settings in the word engine's store.
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace Common {

/// A stored text as a number of seconds or letters; none when it is no whole
/// number of 16 bits.
std::optional<std::int16_t> SettingNumber(std::string_view text);

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
