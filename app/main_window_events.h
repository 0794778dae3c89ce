#pragma once
// The roof over the main window: which of its events runs which procedure.

class Main;

namespace App {

/// Makes the main window, connects its events and runs the program's start-up; the
/// window is not yet shown. Once, before any procedure.
Main& LoadMainWindow();

}  // namespace App
