// The cubes, the order of the draws, and the board they fill.
#include "board/dice.h"

#include "support/game_fixture.h"

namespace {

class ShakenCubes : public GameFixture {};

TEST_F(ShakenCubes, DrawACubeAndThenItsFaceForEachPlace) {
    Dice::FillCubeFaces();
    draws_.assign(32, 0x1.fffffep-1F);
    EXPECT_EQ(Dice::ShakeCubes(), "YLCNISBDUERRNBBP");
    EXPECT_TRUE(draws_.empty());
    // The tenth cube, just, and as that is taken the eleventh.
    draws_ = {9.05F / 16, 1.05F / 6, 9.05F / 15};
    draws_.resize(32);
    EXPECT_EQ(Dice::ShakeCubes(), "QIETISSOYWOVAATI");
}

}  // namespace
