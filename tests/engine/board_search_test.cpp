#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

#include "graph/graph_builder.h"
#include "random_words.h"
#include "search/board_search.h"
#include "support/chains.h"

using namespace Quorle;

namespace {

using Words = std::set<std::string>;

Words OnBoard(const Words& words, const std::string& board, WordLimits limits) {
    Words found;
    for (const std::string& word : words) {
        const auto size = static_cast<int>(word.size());
        const bool counts = size >= limits.shortest && size <= limits.longest;
        if (counts && Lies(board, word)) found.insert(word);
    }
    return found;
}

WordGraph Built(const Words& words) {
    GraphBuilder builder(0);
    for (const std::string& word : words) {
        PackedWord packed = 0;
        for (std::size_t i = 0; i < word.size(); ++i) packed |= PackedLetter(word[i] - 'a', i);
        builder.add(packed);
    }
    return builder.finish();
}

class BoardSearchTest : public testing::TestWithParam<Matching> {
  protected:
    void SetUp() override {
        if (!CanMatch(GetParam())) GTEST_SKIP() << "not on this machine";
        search_ = std::make_unique<BoardSearch>(GetParam());
    }
    Words found(const WordGraph& graph, const std::string& letters, WordLimits limits) {
        Board board{};
        std::copy(letters.begin(), letters.end(), board.begin());
        FoundWords found;
        search_->search(graph, board, limits, found);
        found.finish(board);
        Words words;
        for (std::size_t i = 0; i < found.size(); ++i) {
            std::array<char, 16> word{};
            const std::string spelled(word.data(), found.spell(i, word.data()));
            EXPECT_TRUE(words.empty() || *words.rbegin() < spelled) << spelled;
            words.insert(spelled);
        }
        return words;
    }
    std::unique_ptr<BoardSearch> search_;
};

TEST_P(BoardSearchTest, FindsWhatTryingEveryWordFinds) {
    for (std::uint32_t seed = 0; seed < 60; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        RandomWords random(seed);
        const int letters = 3 + random.below(12);
        Words words = random.words(2000, letters, 3 + random.below(5));
        words.insert({"suq", "quit", "iraq", "qq", "qi", "quq", "uqu"});
        WordGraph graph = Built(words);
        for (int board = 0; board < 20; ++board) {
            std::string cubes = random.board(letters);
            if (board % 2 == 0) std::replace(cubes.begin(), cubes.end(), 'q', 'a');
            const WordLimits limits{2 + random.below(3), 2 + random.below(15)};
            ASSERT_EQ(found(graph, cubes, limits), OnBoard(words, cubes, limits)) << cubes;
            for (int i = 0; i < 20; ++i) {
                const std::string word = random.word(letters, 6);
                if (random.below(2) == 0 ? graph.add(word) : graph.remove(word)) {
                    if (!words.insert(word).second) words.erase(word);
                }
            }
        }
    }
}

// Boards of few letters and words that are everywhere on them: more chains than are ever followed
// twice. The limits leave words that are never found, the dead end is a word that does not fit.
TEST_P(BoardSearchTest, HardBoards) {
    Words words;
    for (std::size_t size = 2; size <= 16; ++size) words.insert(std::string(size, 'a'));
    words.insert({"aaaaaaaaaaaaab", "aaaaaaaaaaaaaaab"});
    for (int i = 0; i < 512; ++i) {
        std::string word;
        for (int bit = 0; bit < 9; ++bit) word += "ab"[i >> bit & 1];
        words.insert(word);
    }
    const WordGraph graph = Built(words);
    for (const std::string board : {"aaaaaaaaaaaaaaaa", "aaaaaaaaaaaaaaab", "abababbaababbaab"}) {
        for (const WordLimits limits : {WordLimits{3, 16}, {2, 9}}) {
            EXPECT_EQ(found(graph, board, limits), OnBoard(words, board, limits)) << board;
        }
    }
}

INSTANTIATE_TEST_SUITE_P(All, BoardSearchTest, testing::Values(Matching::Plain, Matching::Avx2));

}  // namespace
