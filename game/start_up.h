#pragma once

namespace Common {

/// Makes the program ready for the first game. Once, from the loading of Main.
void StartUp();

}  // namespace Common
