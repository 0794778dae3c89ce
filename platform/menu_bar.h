#pragma once
// Menu bars in windows that have no frame of their own for one.
#include <QMenuBar>

namespace Platform {

/// A menu bar within `window` on every desktop, so that a bare command stands on it.
QMenuBar* MakeMenuBar(QWidget* window);

/// Lets `client`, a child of the bar's window, fill the window below the bar.
void FillBelow(QMenuBar* bar, QWidget* client);

}  // namespace Platform
