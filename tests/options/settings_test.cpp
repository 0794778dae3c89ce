// The four settings.
#include "options/settings.h"

#include <quorle/word_engine.h>

#include <map>

#include "support/game_fixture.h"

namespace {

class Settings : public GameFixture {
  protected:
    static std::string loaded(std::int16_t time, int minimum) {
        State = GameState();
        State.TimeLimit = time;
        cSetMinWordSize(minimum);
        Common::LoadSettings();
        return std::to_string(State.TimeLimit) + "/" + std::to_string(cMinWordSize()) + "/" +
               std::to_string(State.Sounds);
    }
};

TEST_F(Settings, OutOfRangeOrUnreadableFallBack) {
    const std::map<std::string, std::string> cases{
        {"1", "180/3/-1"}, {"15", "15/15/0"},    {"300", "300/3/0"}, {"45", "180/3/0"},
        {"", "180/9/-1"},  {"32768", "180/9/0"}, {"6 ", "180/9/0"},  {"-5", "180/3/0"}};
    for (const auto& [text, settings] : cases) {
        for (const char* name : {"TimeLimit", "MinWordSize", "Sounds"}) store(name, text);
        EXPECT_EQ(loaded(180, 9), settings) << text;
    }
    State.TimeLimit = 15;
    State.Sounds = False;
    cSetMinWordSize(2);
    cSetMaxWordSize(12);
    Common::SaveSettings();
    EXPECT_EQ(stored("MaxWordSize"), "12");
    EXPECT_EQ(loaded(180, 3), "15/2/0");
}

}  // namespace
