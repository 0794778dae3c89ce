#pragma once
// What the desktop gives the game. Every function here can be replaced by an
// assignment; nothing else in the program needs to be.
#include <cstdint>
#include <functional>
#include <string>

namespace Platform {

/// The program's name, and the title of boxes that have none of their own.
constexpr const char* ProgramTitle = "Quorle";

/// Shows a text in a modal box with an OK button and waits for it.
extern std::function<void(const std::string& text, const std::string& title)> ShowMessage;

/// Asks with Yes and No buttons and waits; true for Yes.
extern std::function<bool(const std::string& text, const std::string& title)> AskYesNo;

/// Let the player choose a file, starting in `folder`, text files shown first.
/// Return its full path, empty when cancelled. The second adds ".txt" to a name
/// without a suffix and asks before a file is replaced.
extern std::function<std::string(const std::string& folder)> ChooseFileToOpen;
extern std::function<std::string(const std::string& folder)> ChooseFileToSave;

/// Plays the warning sound; never waits for it.
extern std::function<void()> WarningSound;

/// Has a screen reader say a text, wherever the focus is; nothing where none is active.
extern std::function<void(const std::string& text)> Tell;

/// The number of our window in front: 1 for the main window, others above, 0
/// when none is; negative while a message or file dialog of that window is.
extern std::function<std::int32_t()> WindowInFront;

/// Whether a Wayland compositor shows the windows: it alone decides which has the
/// focus, and gives it to what is shown.
extern std::function<bool()> OnWayland;

/// Seeds the random source from the time of day; draws a number in [0, 1).
extern std::function<void()> SeedRandom;
extern std::function<float()> RandomNumber;

/// Seconds on a clock that never jumps back.
extern std::function<double()> SteadySeconds;

/// The folder of Dictionary.dat and Quorle.htm, without a slash at its end.
extern std::function<std::string()> ProgramFolder;

/// Puts the desktop's own functions in place. Needs a QApplication.
void UseDesktop();

}  // namespace Platform
