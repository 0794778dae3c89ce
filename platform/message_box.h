#pragma once
// Modal message boxes, centred on our window in front.
#include <string>

namespace MessageBox {

/// Waits until the player has pressed OK or Escape.
void Show(const std::string& text, const std::string& title);

/// True for Yes; No and Escape are false.
bool Ask(const std::string& text, const std::string& title);

}  // namespace MessageBox
