#pragma once

/// Lets screen readers see our windows as windows, titles and all; a plain widget
/// is a mere container to them. Before the first window is made.
void MakeWindowsAccessible();
