#pragma once
// Which window of ours is in front, and how windows come there and leave. Not
// every desktop gives the front back when a box closes or a window hides, and
// with no window in front the game's clock stands still; so we do it ourselves.
#include <QWidget>

namespace Platform {

/// Follows a window, known by its object name, from now until it is deleted.
void FollowWindow(QWidget* window);

/// Shows a window, or brings it back: restored, raised and activated.
void BringToFront(QWidget& window);

/// Hides a window, which keeps its place; when it was in front, gives the front back.
void HideWindow(QWidget& window);

/// Shows a hidden window behind what is in front, which keeps the focus; with
/// another program in front it calls for attention.
void ShowBehind(QWidget& window);

/// Whether the front is ours, or has been asked for.
bool FrontIsOurs();

/// Whether windows are tiled. Those with an owner float.
bool DesktopTiles();

/// Where windows are tiled, lets this one float above the main window.
void FloatWindow(QWidget& window);

/// Activates the window that was in front last and is still shown, else the
/// main window. For when something in front has gone.
void GiveFrontBack();

/// The followed window that is or last was in front and is shown; may be null.
QWidget* LatestInFront();

}  // namespace Platform
