#pragma once
#include <QString>

class QComboBox;

namespace Platform {

/// Has a box without typing say its value when it gets the focus and whenever the player
/// changes it. `description` is said with it.
void TellValueOf(QComboBox* box, const QString& description);

}  // namespace Platform
