// One game from Start to its end, and the clock.
#include "support/program_fixture.h"

namespace {

class GameFlow : public PlayedBoard {
  protected:
    std::string times() { return text("TimeRemLabel") + " " + text("TimeLeft"); }
};

TEST_F(GameFlow, AWholeGameRunsOutButNotInAPause) {
    State.TimeLimit = 15;
    start("QITAKENSHORDGLUB");
    enter({"ten"});
    clickTiles({0, 1});
    start();  // drops that game
    EXPECT_EQ(times() + text("PlayerWordLabel") + entry(), "Time Remaining 0:15 [] 0");
    EXPECT_EQ(text("DefinedWordCount"), "Quorle found 7 words");
    boxes_.expectPause([this] {
        EXPECT_FALSE(isShown("CubeFrame"));
        tick(3);
    });
    press("Pause");
    EXPECT_TRUE(isShown("CubeFrame"));
    enter({"cat"});
    type("bo");
    tick(14);
    EXPECT_EQ(times(), "Time Remaining 0:01");
    EXPECT_FALSE(isShown("Results"));
    tick(2);
    EXPECT_EQ(times(), "Game Over ");
    EXPECT_TRUE(isShown("Results"));
    EXPECT_EQ(words(), Words{"cat"});
    EXPECT_EQ(entry(), " [] 0");
}

TEST_F(GameFlow, TheClockCountsOnlyWithItsWindowInFront) {
    start();
    const auto inFront = std::exchange(Platform::WindowInFront, [] { return 0; });
    tick();  // no window of ours: counts, and records none
    Platform::WindowInFront = inFront;
    boxes_.expect("Wait.", QMessageBox::Ok, [this] { tick(2); });
    Platform::ShowMessage("Wait.", "Quorle");  // stands for its window once, when that is recorded
    EXPECT_EQ(times(), "Time Remaining 2:58");
    press("Main/End");
    start();
    bringToFront("Results");
    tick(3);
    EXPECT_EQ(times(), "Time Remaining 3:00");
    seconds_ += 3;
    press("Results/ResultsOK");
    EXPECT_TRUE(comesToFront("Main"));
    tick();
    EXPECT_EQ(times(), "Time Remaining 2:59");
}

}  // namespace
