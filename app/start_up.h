#pragma once

namespace Common {

/// Makes the program ready for the first game. Once, when the main window is made.
void StartUp();

}  // namespace Common
