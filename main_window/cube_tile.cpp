#include "main_window/cube_tile.h"

#include <QAccessible>
#include <QMouseEvent>
#include <QPainter>
#include <QVariant>

#include "main_window/tile_picture.h"

namespace {

// The toolkit goes by time and place alone and calls two quick clicks beside a
// border between tiles a double click on the second.
const CubeTile* LastPressed = nullptr;

}  // namespace

CubeTile::CubeTile(QWidget* parent) : QWidget(parent) {
    setAttribute(Qt::WA_OpaquePaintEvent);
    setProperty("selected", false);
}

void CubeTile::draw(bool selected, const QString& letter) {
    selected_ = selected;
    letter_ = letter;
    setProperty("selected", selected);
    setAccessibleName(letter);
    if (QAccessible::isActive()) tellLit();
    repaint();
}

void CubeTile::tellLit() {
    QAccessible::State changed;
    changed.checked = true;
    QAccessibleStateChangeEvent event(this, changed);
    QAccessible::updateAccessibility(&event);
}

// The screen's resolution and the palette may change under a tile, so both are
// asked for at each painting; the picture itself is kept elsewhere.
void CubeTile::paintEvent(QPaintEvent*) {
    const QColor background = palette().color(QPalette::Window);
    QPainter painter(this);
    painter.fillRect(rect(), background);
    painter.drawPixmap(
        0, 0, MainWindow::TilePicture(selected_, letter_, devicePixelRatioF(), background));
}

void CubeTile::mousePressEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton) return;
    pressed_ = true;
    LastPressed = this;
}

void CubeTile::mouseReleaseEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton || !pressed_) return;
    pressed_ = false;
    if (rect().contains(event->position().toPoint())) emit clicked();
}

void CubeTile::mouseDoubleClickEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton) return;
    if (LastPressed != this) return mousePressEvent(event);
    pressed_ = false;
    emit doubleClicked();
}
