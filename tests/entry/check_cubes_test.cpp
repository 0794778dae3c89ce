// Whether a word lies on the board, and what stays marked.
#include "entry/check_cubes.h"

#include <quorle/word_engine.h>

#include <algorithm>

#include "support/chains.h"
#include "support/game_fixture.h"

namespace {

using CheckCubes::IsOnBoard;

class Tracing : public GameFixture {
  protected:
    static Chain marked() {
        Chain cells;
        for (std::size_t k = 0; k < CubeCount; ++k) {
            if (State.TracedPath[k / 4][k % 4]) cells.push_back(static_cast<int>(k));
        }
        return cells;
    }

    std::size_t below(std::size_t n) { return randomness_() % n; }

    std::string randomText(const std::string& letters, std::size_t length) {
        std::string text;
        while (text.size() < length) text += letters[below(letters.size())];
        return text;
    }
};

// What a failure leaves: the last cube of the first letter, or everything as it was.
Chain AfterFailure(const std::string& board, const std::string& word, const Chain& before) {
    const bool qu = word == "q" || word.starts_with("qu");
    const bool lone = !qu && word[0] == 'q';
    const auto last = board.rfind(static_cast<char>(word[0] & ~0x20));
    return lone || last == board.npos ? before : Chain{static_cast<int>(last)};
}

TEST_F(Tracing, AgreesWithEveryChainSpelledOut) {
    int onBoard = 0;
    for (int i = 0; i < 4000; ++i) {
        std::string board = randomText("AIRTU", CubeCount);  // most words have many chains
        if (below(4) != 0) board[below(CubeCount)] = 'Q';
        putOnBoard(board);
        const std::string word = randomText("airtuq", 1 + below(6)) + (below(3) != 0 ? "" : "qu");
        const Chain before = marked();
        const Chain chain = FirstChain(board, word);
        SCOPED_TRACE(word + " on " + board);
        ASSERT_EQ(IsOnBoard(word) == True, !chain.empty());
        Chain expected = AfterFailure(board, word, before);
        if (!chain.empty()) {
            expected = chain;
            std::sort(expected.begin(), expected.end());
            ++onBoard;
        }
        ASSERT_EQ(marked(), expected);
    }
    EXPECT_GT(onBoard, 400);
    for (const char* word : {"Air", "a r", "a1r", "air ", "x\xC3\xA9"}) {
        EXPECT_FALSE(IsOnBoard(word)) << word;
    }
    EXPECT_TRUE(IsOnBoard(""));
    EXPECT_EQ(marked(), Chain{});
}

TEST_F(Tracing, AndTheEnginesSearchFindTheSameWords) {
    ASSERT_EQ(cReadBinaryDictionary(QUORLE_DEFAULT_DICTIONARY), 1);
    for (const char* word : {"suq", "talaq", "qaid", "tariqat", "qua"}) cDictionaryAdd(word);
    ASSERT_EQ(cWriteTextFile((folder_ / "words").c_str()), 1);
    ASSERT_GT(cNumberOfWords(), 100000);
    for (int i = 0; i < 5; ++i) {
        std::string board = randomText("AAEEIIOUUSTRNLDQ", CubeCount);
        std::replace(board.begin() + static_cast<int>(board.find('Q') + 1), board.end(), 'Q', 'S');
        putOnBoard(board);
        std::vector<std::string> traced;
        std::ifstream words(folder_ / "words");
        for (std::string word; words >> word;) {
            if (word.size() > 2 && IsOnBoard(word)) traced.push_back(word);
        }
        std::transform(board.begin(), board.end(), board.begin(), ::tolower);
        std::vector<std::string> found;
        const int count = cCheckForAllDefinedWords(board.c_str());
        for (int word = 0; word < count; ++word) {
            char buffer[17] = {};
            std::int32_t length = 0;
            cGetDefinedWord(word, buffer, &length);
            found.emplace_back(buffer);
        }
        EXPECT_EQ(found, traced) << board;
    }
}

}  // namespace
