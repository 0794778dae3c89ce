#pragma once
#include <QIcon>

class QPalette;

namespace MainWindow {

/// The pictures of the toolbar's buttons, drawn for a palette, crisp at any scale.
enum class ToolbarPicture { Start, Pause, End, Options, Dictionary, Exit };
QIcon ToolbarIcon(ToolbarPicture picture, const QPalette& palette);

}  // namespace MainWindow
