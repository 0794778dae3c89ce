#pragma once
// Modal message boxes, centred on our window in front.
#include <string>

namespace Platform {

/// Waits until the player has pressed OK or Escape.
void ShowMessageBox(const std::string& text, const std::string& title);

/// True for Yes, false for No. Nothing else closes the box.
bool AskInMessageBox(const std::string& text, const std::string& title);

}  // namespace Platform
