// Building a word by keys and clicks, on the real window.
#include "support/program_fixture.h"

namespace {

class WordEntry : public PlayedBoard {};

TEST_F(WordEntry, PasteKeepsItsLongestTraceableBeginning) {
    start("CATSBONEWILDHEFY");
    paste("catsXYZ");
    EXPECT_EQ(typed(), "cats");
    EXPECT_EQ(litTiles(), (Tiles{0, 1, 2, 3}));
    EXPECT_EQ(warnings(), 3);
    clickTiles({7});
    EXPECT_EQ(typed(), "catse");
}

}  // namespace
