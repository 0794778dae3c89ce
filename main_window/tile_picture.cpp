#include "main_window/tile_picture.h"

#include <QHash>
#include <QImage>
#include <QPainter>
#include <QPainterPath>

#include "platform/layout.h"

namespace {

using MainWindow::TileSize;

// The artwork is drawn with hard edges at four times the resolution, combined
// there bit by bit and scaled down smoothly: combining soft edges bit by bit
// would leave a pale fringe. It is done in bands, for memory touched for the
// first time costs more than all the drawing.
constexpr int Oversampling = 4;
constexpr int BandHeight = 16;  // device pixels
constexpr qreal Margin = 1;
constexpr qreal CornerRadius = 17;
constexpr qreal OutlineWidth = 3;
constexpr qreal RingInset = 5.5;
constexpr qreal RingWidth = 2;
constexpr double LetterPoints = 48;

const QColor OutlineColour(128, 128, 128);
const QColor LetterColour(24, 12, 4);

struct Look {
    QColor face;
    QColor shadow;
    bool ring;  // tells a lit tile apart without its colour
};

const Look NormalLook{QColor(255, 128, 64), QColor(128, 64, 0), false};
const Look SelectedLook{QColor(0, 255, 128), QColor(0, 128, 0), true};

// Aims a painter at a band: a tile of TileSize is drawn, the band is seen.
void AimAt(QPainter& painter, int side, int top) {
    painter.translate(0, -top * Oversampling);
    const qreal scale = side * Oversampling / qreal(TileSize);
    painter.scale(scale, scale);
}

QPainterPath CubeShape(qreal inset) {
    const qreal from = Margin + inset;
    QPainterPath shape;
    shape.addRoundedRect(QRectF(from, from, TileSize - 2 * from, TileSize - 2 * from),
                         CornerRadius - inset, CornerRadius - inset);
    return shape;
}

void DrawOuterMask(QPainter& painter) {
    painter.fillRect(QRectF(0, 0, TileSize, TileSize), Qt::black);
    painter.fillPath(CubeShape(0), Qt::white);
}

QPainterPath TopLeftHalf() {
    QPainterPath half;
    half.addPolygon({QPointF(0, 0), QPointF(TileSize, 0), QPointF(0, TileSize)});
    return half;
}

// The outline lies along the top and left, the shadow along the bottom and right.
void DrawLook(QPainter& painter, const Look& look) {
    painter.fillRect(QRectF(0, 0, TileSize, TileSize), Qt::white);
    painter.fillPath(CubeShape(0), look.shadow);
    painter.setClipPath(TopLeftHalf());
    painter.fillPath(CubeShape(0), OutlineColour);
    painter.setClipping(false);
    painter.fillPath(CubeShape(OutlineWidth), look.face);
    if (look.ring) {
        painter.fillPath(CubeShape(RingInset), look.shadow);
        painter.fillPath(CubeShape(RingInset + RingWidth), look.face);
    }
}

void Combine(QImage& tile, const QImage& picture, QPainter::CompositionMode operation) {
    QPainter painter(&tile);
    painter.setCompositionMode(operation);
    painter.drawImage(0, 0, picture);
}

// One band of a blank tile at the artwork's resolution, drawn into `tile`;
// `artwork` is room to draw in.
void DrawBand(QImage& tile, QImage& artwork, int side, int top, const Look& look) {
    {
        QPainter painter(&artwork);
        AimAt(painter, side, top);
        DrawOuterMask(painter);
    }
    Combine(tile, artwork, QPainter::RasterOp_SourceOrDestination);
    {
        QPainter painter(&artwork);
        AimAt(painter, side, top);
        DrawLook(painter, look);
    }
    Combine(tile, artwork, QPainter::RasterOp_SourceAndDestination);
}

QPixmap BlankTile(bool selected, qreal pixelRatio, QColor background) {
    const int side = qRound(TileSize * pixelRatio);
    QImage tile(side * Oversampling, BandHeight * Oversampling, QImage::Format_RGB32);
    QImage artwork(tile.size(), tile.format());
    QPixmap picture(side, side);
    QPainter painter(&picture);
    for (int top = 0; top < side; top += BandHeight) {
        tile.fill(background);
        DrawBand(tile, artwork, side, top, selected ? SelectedLook : NormalLook);
        painter.drawImage(
            0, top, tile.scaled(side, BandHeight, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
    }
    painter.end();
    picture.setDevicePixelRatio(pixelRatio);
    return picture;
}

// Centred by what is seen of the letter, which its advance and ascent are not.
void PrintLetter(QPaintDevice* tile, const QString& letter) {
    QPainterPath glyphs;
    glyphs.addText(0, 0, Platform::LayoutFont(Platform::Typeface::Courier, LetterPoints), letter);
    const QPointF middle(TileSize / 2.0, TileSize / 2.0);
    QPainter painter(tile);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(middle - glyphs.boundingRect().center());
    painter.fillPath(glyphs, LetterColour);
}

}  // namespace

QPixmap MainWindow::TilePicture(bool selected, const QString& letter, qreal pixelRatio,
                                QColor background) {
    static auto& pictures = *new QHash<QString, QPixmap>;  // outlives the application
    const QString key =
        QStringLiteral("%1/%2/%3/").arg(selected).arg(pixelRatio).arg(background.rgb()) + letter;
    const auto kept = pictures.constFind(key);
    if (kept != pictures.constEnd()) return *kept;
    QPixmap picture = letter.isEmpty() ? BlankTile(selected, pixelRatio, background)
                                       : TilePicture(selected, QString(), pixelRatio, background);
    if (!letter.isEmpty()) PrintLetter(&picture, letter);
    pictures.insert(key, picture);
    return picture;
}
