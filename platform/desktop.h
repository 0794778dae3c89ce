#pragma once
// What UseDesktop puts behind the replaceable functions.
#include <cstdint>
#include <string>

namespace Platform {

/// Message boxes, centred on our window in front. The first is closed by OK or Escape,
/// the second by Yes and No alone.
void ShowMessageBox(const std::string& text, const std::string& title);
bool AskInMessageBox(const std::string& text, const std::string& title);

std::string ChooseInOpenDialog(const std::string& folder);
std::string ChooseInSaveDialog(const std::string& folder);

/// What piles up while a sound is being started is played once.
void PlayWarningSound();

/// Says a text soon. What one event tells is said in one breath.
void TellScreenReader(const std::string& text);

std::int32_t NumberInFront();

/// The executable's own folder, or, for an installed copy, the player's data folder,
/// furnished on first use with the installed dictionary and links to the help page and
/// its picture.
std::string FindProgramFolder();

}  // namespace Platform
