#pragma once
// The pictures of the board's tiles.
#include <QColor>
#include <QPixmap>
#include <QString>

namespace MainWindow {

constexpr int TileSize = 97;  ///< logical pixels

/// A tile in its normal (orange) or selected (green) look with a letter, "Qu" or
/// nothing on it, at the resolution of the screen. `background` shows around it.
/// Pictures are kept: the same one again costs nothing.
QPixmap TilePicture(bool selected, const QString& letter, qreal pixelRatio, QColor background);

}  // namespace MainWindow
