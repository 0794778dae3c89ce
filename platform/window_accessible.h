#pragma once

namespace Platform {

/// Lets screen readers see our windows as windows, titles and all (a plain widget
/// is a mere container to them), and press tool buttons whatever opens. Before the
/// first window is made.
void MakeWindowsAccessible();

}  // namespace Platform
