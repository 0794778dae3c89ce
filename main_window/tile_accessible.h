#pragma once

namespace MainWindow {

/// Lets screen readers see a tile as a box that is checked while it is lit and
/// that their users can press.
void MakeTilesAccessible();

}  // namespace MainWindow
