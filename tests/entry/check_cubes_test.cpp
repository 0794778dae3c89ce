// Whether a word lies on the board, and what stays marked.
#include "entry/check_cubes.h"

#include <quorle/word_engine.h>

#include <algorithm>

#include "support/boards.h"
#include "support/game_fixture.h"

namespace {

using CheckCubes::IsOnBoard;

class Tracing : public GameFixture {
  protected:
    static Chain marked() {
        Chain cells;
        for (int k = 0; k < CubeCount; ++k) {
            const auto index = static_cast<std::size_t>(k);
            if (State.TracedPath[index / 4][index % 4]) cells.push_back(k);
        }
        return cells;
    }

    int below(int n) { return static_cast<int>(randomness_() % static_cast<unsigned>(n)); }

    std::string randomText(const std::string& letters, int length) {
        std::string text;
        for (int i = 0; i < length; ++i) {
            text += letters[static_cast<std::size_t>(below(static_cast<int>(letters.size())))];
        }
        return text;
    }

    // Few letters, so that most words have many chains; at most one Qu cube.
    std::string randomBoard() {
        std::string board = randomText("AIRTU", CubeCount);
        if (below(4) != 0) board[static_cast<std::size_t>(below(CubeCount))] = 'Q';
        putOnBoard(board);
        return board;
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
        const std::string board = randomBoard();
        const std::string word = randomText("airtuq", 1 + below(6)) + (below(3) != 0 ? "" : "qu");
        const Chain before = marked();
        const std::vector<Chain> chains = ChainsOf(board, word);
        SCOPED_TRACE(word + " on " + board);
        ASSERT_EQ(IsOnBoard(word) == True, !chains.empty());
        Chain expected = AfterFailure(board, word, before);
        if (!chains.empty()) {
            expected = chains.front();
            std::sort(expected.begin(), expected.end());
            ++onBoard;
        }
        ASSERT_EQ(marked(), expected);
    }
    EXPECT_GT(onBoard, 400);
}

TEST_F(Tracing, TakesTheSmallestChainAndExactLetters) {
    putOnBoard("CATSATQICXXAAXIR");
    EXPECT_TRUE(IsOnBoard("cat"));
    EXPECT_EQ(marked(), (Chain{0, 1, 2}));
    EXPECT_TRUE(IsOnBoard("iraq"));
    EXPECT_EQ(marked(), (Chain{6, 11, 14, 15}));
    EXPECT_TRUE(IsOnBoard("quit"));
    EXPECT_EQ(marked(), (Chain{2, 6, 7}));
    EXPECT_FALSE(IsOnBoard("qis"));
    for (const char* word : {"q", "qu"}) {
        EXPECT_TRUE(IsOnBoard(word)) << word;
        EXPECT_EQ(marked(), (Chain{6})) << word;
    }
    EXPECT_TRUE(IsOnBoard("siq"));
    EXPECT_EQ(marked(), (Chain{3, 6, 7}));
    for (const char* word : {"Cat", "ca t", "c4t", "cat ", "x\xC3\xA9", "sts"}) {
        EXPECT_FALSE(IsOnBoard(word)) << word;
    }
    EXPECT_TRUE(IsOnBoard(""));
    EXPECT_EQ(marked(), Chain{});
}

TEST_F(Tracing, AndTheEnginesSearchFindTheSameWords) {
    ASSERT_EQ(cReadBinaryDictionary(QUORLE_DEFAULT_DICTIONARY), 1);
    std::vector<std::string> words{"suq", "talaq", "qaid", "tariqat", "qua"};
    for (const std::string& word : words) cDictionaryAdd(word.c_str());
    for (std::int32_t first = 0; first < 26; ++first) {
        for (std::int32_t second = 0; second < 26; ++second) {
            cStartDecodingWords(first, second);
            std::array<char, 16> buffer{};
            while (const int length = cDecodeNextWord(buffer.data())) {
                words.emplace_back(buffer.data(), static_cast<std::size_t>(length));
            }
        }
    }
    ASSERT_GT(words.size(), 100000U);
    std::sort(words.begin(), words.end());
    words.erase(std::unique(words.begin(), words.end()), words.end());
    for (int i = 0; i < 5; ++i) {
        std::string board = randomText("AAEEIIOUUSTRNLDQ", CubeCount);
        std::replace(board.begin() + static_cast<int>(board.find('Q') + 1), board.end(), 'Q', 'S');
        putOnBoard(board);
        std::vector<std::string> traced;
        std::copy_if(words.begin(), words.end(), std::back_inserter(traced),
                     [](const auto& word) { return word.size() > 2 && IsOnBoard(word); });
        std::transform(board.begin(), board.end(), board.begin(), ::tolower);
        std::vector<std::string> found;
        const int count = cCheckForAllDefinedWords(board.c_str());
        for (int word = 0; word < count; ++word) {
            std::array<char, 16> buffer{};
            std::int32_t length = 0;
            cGetDefinedWord(word, buffer.data(), &length);
            found.emplace_back(buffer.data(), static_cast<std::size_t>(length));
        }
        EXPECT_EQ(found, traced) << board;
    }
}

}  // namespace
