// Whether a word lies on the board, and what stays marked.
#include "entry/check_cubes.h"

#include <algorithm>

#include "board/dice.h"
#include "engine/calls.h"
#include "support/chains.h"
#include "support/game_fixture.h"

namespace {

using CheckCubes::IsOnBoard;

class Tracing : public GameFixture {};

Chain Marked() {
    Chain cells;
    for (std::size_t k = 0; k < CubeCount; ++k) {
        if (State.TracedPath[k / 4][k % 4]) cells.push_back(static_cast<int>(k));
    }
    return cells;
}

// A failure leaves the last cube of the first letter marked, or everything as it was.
TEST_F(Tracing, AgreesWithEveryChainSpelledOut) {
    Random random;
    for (int i = 0; i < 4000; ++i) {
        std::string board = Text(random, CubeCount, "AIRTU");  // most words have many chains
        if (i % 4 != 0) board[random() % CubeCount] = 'Q';
        for (std::size_t k = 0; k < CubeCount; ++k) {
            Dice::PutOnBoard(static_cast<std::int16_t>(k), board[k]);
        }
        const std::string word = Text(random, 1 + random() % 6, "airtuq") + (i % 3 ? "" : "qu");
        SCOPED_TRACE(word + " on " + board);
        Chain expected = Marked();
        const Chain chain = FirstChain(board, word);
        const auto last = board.rfind(static_cast<char>(std::toupper(word[0])));
        const bool isLoneQ = word[0] == 'q' && word != "q" && word[1] != 'u';
        if (!isLoneQ && last != board.npos) expected = {static_cast<int>(last)};
        if (!chain.empty()) {
            expected = chain;
            std::sort(expected.begin(), expected.end());
        }
        ASSERT_EQ(IsOnBoard(word) == True, !chain.empty());
        ASSERT_EQ(Marked(), expected);
    }
    for (const char* word : {"Air", "a r", "a1r", "air ", "\xC3\xA9"})
        EXPECT_FALSE(IsOnBoard(word));
    EXPECT_TRUE(IsOnBoard(""));
    EXPECT_EQ(Marked(), Chain{});
}

}  // namespace
