// How the tiles look, and that they are drawn only when that changes.
#include <QCoreApplication>
#include <QEvent>
#include <QImage>

#include "board/draw_cubes.h"
#include "board/tile_picture.h"
#include "support/program_fixture.h"

namespace {

// Notes which tiles are painted.
class Paintings : public QObject {
  public:
    bool eventFilter(QObject* tile, QEvent* event) override {
        if (event->type() == QEvent::Paint) tiles.push_back(tile->objectName().mid(4).toInt());
        return false;
    }
    Tiles tiles;
};

class BoardTiles : public PlayedBoard {
  protected:
    BoardTiles() {
        start("CATSBONEWILDHEFY");
        QCoreApplication::processEvents();
        for (int k = 0; k < 16; ++k) {
            control("Cube" + std::to_string(k))->installEventFilter(&paintings_);
        }
    }
    /// The tiles painted since the last call, without the neighbours under their edges.
    Tiles painted() { return std::exchange(paintings_.tiles, {}); }

    Paintings paintings_;
};

TEST_F(BoardTiles, AreDrawnOnlyWhenTheyChange) {
    Common::DrawAllCubesNormal();
    EXPECT_EQ(painted(), Tiles{});
    Common::DrawCubeSelected(5);
    EXPECT_EQ(painted(), Tiles{5});  // at once
    Common::DrawCubeSelected(5);
    EXPECT_EQ(painted(), Tiles{});
    State.CubeLetters[3] = "Z";
    Common::DrawAllCubesNormal();
    EXPECT_EQ(painted(), (Tiles{3, 5}));
    EXPECT_EQ(State.CubeDrawState[5], 1);
}

TEST_F(BoardTiles, ShowTheirLetterInTheMiddleOfARoundedCube) {
    const QColor background(10, 20, 200);
    for (const double ratio : {1.0, 1.25, 2.0}) {
        for (const bool selected : {false, true}) {
            SCOPED_TRACE(testing::Message() << ratio << selected);
            const QImage blank = TilePicture(selected, "", ratio, background).toImage();
            EXPECT_EQ(blank.width(), qRound(97 * ratio));
            const QColor face = selected ? QColor(0, 255, 128) : QColor(255, 128, 64);
            EXPECT_EQ(blank.pixelColor(blank.rect().center()), face);
            EXPECT_EQ(blank.pixelColor(2, 2), background);
            EXPECT_EQ(blank.pixelColor(blank.width() - 3, blank.height() - 3), background);
            const QImage qu = TilePicture(selected, "Qu", ratio, background).toImage();
            QRect ink;
            for (int y = 0; y < qu.height(); ++y) {
                for (int x = 0; x < qu.width(); ++x) {
                    if (qu.pixelColor(x, y) != blank.pixelColor(x, y)) ink |= QRect(x, y, 1, 1);
                }
            }
            EXPECT_GT(ink.width(), 30 * ratio);
            EXPECT_LT((ink.center() - qu.rect().center()).manhattanLength(), 3);
        }
    }
}

}  // namespace
