// The cubes, the order of the draws, and the board they fill.
#include "board/dice.h"

#include <set>

#include "support/boards.h"
#include "support/game_fixture.h"

namespace {

class ShakenCubes : public GameFixture {
  protected:
    ShakenCubes() { Dice::FillCubeFaces(); }
};

TEST_F(ShakenCubes, DrawACubeAndThenItsFaceForEachPlace) {
    draws_.assign(32, 0.0F);
    EXPECT_EQ(Dice::ShakeCubes(), "ETISSOYWOOIVAATI");
    draws_.assign(32, 0x1.fffffep-1F);
    EXPECT_EQ(Dice::ShakeCubes(), "YLCNISBDUERRNBBP");
    EXPECT_EQ(drawn_, 64);

    draws_.assign(32, 0.0F);
    draws_[0] = 9.5F / 16;  // the tenth cube first, its second face
    draws_[1] = 1.5F / 6;
    draws_[2] = 9.5F / 15;  // and now the eleventh, the tenth being taken
    EXPECT_EQ(Dice::ShakeCubes(), "QIETISSOYWOVAATI");
}

TEST_F(ShakenCubes, ComeFromSixteenCubesInEveryOrder) {
    std::set<char> corner;
    for (int i = 0; i < 1000; ++i) {
        const std::string shake = Dice::ShakeCubes();
        ASSERT_NO_THROW(DrawsFor(shake)) << shake;
        corner.insert(shake.back());
    }
    EXPECT_EQ(corner.size(), 26U);  // every letter of the cubes comes to the last place
}

TEST_F(ShakenCubes, DrawsStayBelowTheirBound) {
    for (std::int16_t n = 1; n <= 16; ++n) {
        draws_ = {0x1.fffffep-1F, 0.0F};
        EXPECT_EQ(Dice::RandomBelow(n), n - 1);
        EXPECT_EQ(Dice::RandomBelow(n), 0);
    }
    std::array<int, 16> seen{};
    useDesktopRandomness();
    for (int i = 0; i < 16000; ++i) ++seen.at(static_cast<std::size_t>(Dice::RandomBelow(16)));
    for (const int count : seen) EXPECT_NEAR(count, 1000, 200);
}

TEST_F(ShakenCubes, ShowQuForQ) {
    putOnBoard("QABCDEFGHIJKLMNO");
    EXPECT_EQ(State.CubeLetters[0], "Qu");
    EXPECT_EQ(State.BoardGrid[0][0], "qu");
    EXPECT_EQ(State.CubeLetters[6], "F");
    EXPECT_EQ(State.BoardGrid[1][2], "f");
}

}  // namespace
