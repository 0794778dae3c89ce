#pragma once
// Windows of one size. A Wayland compositor may maximise a window whatever the size
// that it allows, and ends the connection of a program that does not follow.
#include <QSize>

class QLayout;
class QWidget;

namespace Platform {

/// Gives a window its only size. Where it can be maximised all the same it grows,
/// and its contents stay as they are.
void SetOnlySize(QWidget& window, QSize size);

/// The same for the layout's window, which has the size that the layout wants.
void SetOnlySize(QLayout& layout);

/// The same for a window that settles its own only size, and again with its layout.
void LetGrow(QWidget& window);

}  // namespace Platform
