#pragma once
// The player's settings: one small text file, a line a value, kept where the desktop keeps
// configuration.
#include <string>
#include <string_view>

namespace Quorle {

/// The value stored under `key` and `name`; false when there is none or the file cannot be read.
bool GetSetting(std::string_view key, std::string_view name, std::string& value);

/// Stores a value of 0..255 bytes; key and name have 1..255. No control characters. False when
/// refused or when the file could not be read or replaced; the old settings then stand.
bool SetSetting(std::string_view key, std::string_view name, std::string_view value);

}  // namespace Quorle
