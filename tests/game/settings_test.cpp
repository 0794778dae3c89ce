// The four settings.
#include "game/settings.h"

#include <quorle/word_engine.h>

#include "support/game_fixture.h"

namespace {

class Settings : public GameFixture {};

TEST_F(Settings, OutOfRangeOrUnreadableFallBack) {
    struct Case {
        const char* text;
        int timeLimit, minimum;
        Boolean sounds;
    };
    for (const Case& stored :
         {Case{"1", 180, 3, True}, Case{"0", 180, 3, False}, Case{"15", 15, 15, False},
          Case{"300", 300, 3, False}, Case{"45", 180, 3, False}, Case{"17", 180, 3, False},
          Case{"16", 180, 16, False}, Case{"-5", 180, 3, False}, Case{"true", 180, 9, False},
          Case{"32768", 180, 9, False}, Case{"6 ", 180, 9, False}, Case{"10", 180, 10, False},
          Case{"0000000000015", 180, 9, True}, Case{"", 180, 9, True}}) {
        SCOPED_TRACE(stored.text);
        State.TimeLimit = 180;
        cSetMinWordSize(9);
        store("TimeLimit", stored.text);
        store("MinWordSize", stored.text);
        store("Sounds", stored.text);
        Common::LoadSettings();
        EXPECT_EQ(State.TimeLimit, stored.timeLimit);
        EXPECT_EQ(cMinWordSize(), stored.minimum);
        EXPECT_EQ(State.Sounds, stored.sounds);
    }
}

TEST_F(Settings, AreAllSavedAndReadAgain) {
    State.TimeLimit = 15;
    State.Sounds = False;
    cSetMinWordSize(2);
    cSetMaxWordSize(12);
    Common::SaveSettings();
    EXPECT_EQ(stored("TimeLimit") + "/" + stored("MinWordSize") + "/" + stored("MaxWordSize") +
                  "/" + stored("Sounds"),
              "15/2/12/0");
    State = GameState();
    cSetMinWordSize(3);
    Common::LoadSettings();
    EXPECT_EQ(State.TimeLimit, 15);
    EXPECT_EQ(State.Sounds, False);
    EXPECT_EQ(cMinWordSize(), 2);
}

}  // namespace
