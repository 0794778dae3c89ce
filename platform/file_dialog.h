#pragma once
// The dialogs for word files.
#include <string>

namespace Platform {

/// The full path of the file chosen, empty when cancelled. Starts in `folder`
/// with text files shown.
std::string ChooseInOpenDialog(const std::string& folder);

/// The same for saving: a name without a suffix gets ".txt", and a file that
/// stands is replaced only when the player agrees.
std::string ChooseInSaveDialog(const std::string& folder);

}  // namespace Platform
