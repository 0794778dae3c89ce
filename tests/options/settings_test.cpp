// What the stored settings may be.
#include "options/settings.h"

#include <quorle/word_engine.h>

#include "support/game_fixture.h"

namespace {

class Settings : public GameFixture {};

TEST_F(Settings, OutOfRangeOrUnreadableFallBack) {
    const std::pair<const char*, const char*> cases[] = {
        {"1", "180/3/-1"}, {"15", "15/15/0"},    {"300", "300/3/0"}, {"45", "180/3/0"},
        {"", "180/9/-1"},  {"32768", "180/9/0"}, {"6 ", "180/9/0"},  {"-5", "180/3/0"}};
    for (const auto& [text, settings] : cases) {
        for (const char* name : {"TimeLimit", "MinWordSize", "Sounds"}) store(name, text);
        State = GameState();
        cSetMinWordSize(9);
        Common::LoadSettings();
        const std::string loaded = std::to_string(State.TimeLimit) + "/" +
                                   std::to_string(cMinWordSize()) + "/" +
                                   std::to_string(State.Sounds);
        EXPECT_EQ(loaded, settings) << text;
    }
}

}  // namespace
