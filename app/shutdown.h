#pragma once

namespace Common {

/// Offers to save a changed dictionary and closes every window, the main window
/// last. Runs twice when it is what closes the main window: nothing is left to
/// do the second time.
void ExitProgram();

}  // namespace Common

namespace App {

/// Deletes every window, the main window last. Before the QApplication goes.
void DestroyWindows();

}  // namespace App
