#pragma once

namespace Common {

/// Opens the options window.
void ShowOptions();

/// Fills the boxes anew from the current settings.
void LoadOptions();

/// Applies the choices, asking where a game or longer words are at stake, saves
/// the settings and hides the window. A box without a selected entry leaves its
/// setting as it is.
void ApplyOptions();

/// Hides the window and keeps the choices on show.
void CancelOptions();

}  // namespace Common
