#include "main_window/toolbar_pictures.h"

#include <QIconEngine>
#include <QPainter>
#include <QPainterPath>
#include <QPalette>
#include <array>

namespace {

using MainWindow::ToolbarPicture;

// All pictures are drawn on a square of 16 units, edges on whole units where it
// matters at 16 pixels.
constexpr qreal Units = 16;

struct Colours {
    QColor line;
    QColor paper;
    QColor go;
    QColor halt;
    QColor accent;
};

Colours ColoursFor(const QPalette& palette) {
    const QColor line = palette.color(QPalette::ButtonText);
    const QColor paper = palette.color(QPalette::Base);
    const bool dark = palette.color(QPalette::Button).lightness() < 128;
    if (dark) {
        return {line, paper, QColor(72, 208, 112), QColor(255, 110, 96), QColor(255, 168, 88)};
    }
    return {line, paper, QColor(0, 128, 48), QColor(196, 32, 24), QColor(196, 88, 8)};
}

void DrawStart(QPainter& painter, const Colours& colours) {
    QPainterPath triangle;
    triangle.addPolygon({QPointF(4, 2), QPointF(14, 8), QPointF(4, 14)});
    triangle.closeSubpath();
    painter.fillPath(triangle, colours.go);
}

void DrawPause(QPainter& painter, const Colours& colours) {
    painter.fillRect(QRectF(3, 2, 4, 12), colours.accent);
    painter.fillRect(QRectF(9, 2, 4, 12), colours.accent);
}

void DrawEnd(QPainter& painter, const Colours& colours) {
    painter.fillRect(QRectF(3, 3, 10, 10), colours.halt);
}

// Three sliders.
void DrawOptions(QPainter& painter, const Colours& colours) {
    constexpr std::array Knobs{10, 4, 8};
    int y = 2;
    for (const int knob : Knobs) {
        painter.fillRect(QRectF(1, y + 1, 14, 1), colours.line);
        painter.fillRect(QRectF(knob, y - 1, 3, 5), colours.accent);
        y += 5;
    }
}

// An open book.
void DrawDictionary(QPainter& painter, const Colours& colours) {
    QPainterPath leaf;
    leaf.moveTo(8, 4);
    leaf.cubicTo(6, 2.5, 4, 2, 1.5, 2);
    leaf.lineTo(1.5, 12.5);
    leaf.cubicTo(4, 12.5, 6, 13, 8, 14.5);
    leaf.closeSubpath();
    const QPainterPath mirrored = QTransform(-1, 0, 0, 1, Units, 0).map(leaf);
    painter.setPen(QPen(colours.line, 1));
    painter.setBrush(colours.paper);
    painter.drawPath(leaf);
    painter.drawPath(mirrored);
    for (const int y : {5, 8}) {
        painter.fillRect(QRectF(3, y, 3, 1), colours.accent);
        painter.fillRect(QRectF(10, y, 3, 1), colours.accent);
    }
}

// An arrow that leaves by a door.
void DrawExit(QPainter& painter, const Colours& colours) {
    painter.fillRect(QRectF(1, 1, 8, 1), colours.line);
    painter.fillRect(QRectF(1, 14, 8, 1), colours.line);
    painter.fillRect(QRectF(1, 1, 1, 14), colours.line);
    painter.fillRect(QRectF(5, 7, 6, 2), colours.halt);
    QPainterPath head;
    head.addPolygon({QPointF(10, 4), QPointF(15, 8), QPointF(10, 12)});
    head.closeSubpath();
    painter.fillPath(head, colours.halt);
}

void Draw(ToolbarPicture picture, QPainter& painter, const Colours& colours) {
    switch (picture) {
        case ToolbarPicture::Start:
            return DrawStart(painter, colours);
        case ToolbarPicture::Pause:
            return DrawPause(painter, colours);
        case ToolbarPicture::End:
            return DrawEnd(painter, colours);
        case ToolbarPicture::Options:
            return DrawOptions(painter, colours);
        case ToolbarPicture::Dictionary:
            return DrawDictionary(painter, colours);
        case ToolbarPicture::Exit:
            return DrawExit(painter, colours);
    }
}

// Draws at the size asked for, so that no scale blurs a picture.
class PictureEngine : public QIconEngine {
  public:
    PictureEngine(ToolbarPicture picture, const Colours& colours)
        : picture_(picture), colours_(colours) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode, QIcon::State) override {
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        painter->translate(rect.topLeft());
        painter->scale(rect.width() / Units, rect.height() / Units);
        Draw(picture_, *painter, colours_);
        painter->restore();
    }

    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
        QPixmap pixmap(size);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        paint(&painter, QRect(QPoint(0, 0), size), mode, state);
        return pixmap;
    }

    QIconEngine* clone() const override { return new PictureEngine(*this); }

  private:
    ToolbarPicture picture_;
    Colours colours_;
};

}  // namespace

QIcon MainWindow::ToolbarIcon(ToolbarPicture picture, const QPalette& palette) {
    return QIcon(new PictureEngine(picture, ColoursFor(palette)));
}
