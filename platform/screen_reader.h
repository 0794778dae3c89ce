#pragma once
// Speech through the player's screen reader, where one is active.
#include <QString>
#include <string>

class QComboBox;

namespace Platform {

/// Has a text said soon, wherever the focus is. What one event tells is said in one breath.
void TellScreenReader(const std::string& text);

/// Has a box without typing say its value when it gets the focus and whenever the player
/// changes it. `description` is said with it.
void TellValueOf(QComboBox* box, const QString& description);

}  // namespace Platform
