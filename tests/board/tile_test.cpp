// How the tiles look, and that they are drawn only when that changes.
#include <QCoreApplication>
#include <QEvent>

#include "board/draw_cubes.h"
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

}  // namespace
