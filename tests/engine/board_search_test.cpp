#include "search/board_search.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

#include "engine/calls.h"
#include "graph/graph_builder.h"
#include "graph/word_cursor.h"
#include "support/chains.h"

using namespace Quorle;

namespace {

class BoardSearchTest : public testing::TestWithParam<Matching> {
  protected:
    void edit(const std::string& word) {
        if (words_.erase(word) == 0) words_.insert(word);
        graph_.set(word, words_.contains(word));
    }
    /// Searches, and tries every word.
    void search(const std::string& letters, WordLimits limits) {
        ASSERT_EQ(graph_.size(), words_.size());
        std::vector<std::string> expected, spelled;
        for (const std::string& word : words_) {
            const auto size = static_cast<int>(word.size());
            const bool counts = size >= limits.shortest && size <= limits.longest;
            if (counts && Lies(letters, word)) expected.push_back(word);
        }
        Board board{};
        std::copy(letters.begin(), letters.end(), board.begin());
        search_->search(graph_, board, limits, found_);
        for (std::size_t i = 0; i < found_.size(); ++i) {
            char word[LongestWord];
            spelled.emplace_back(word, found_.spell(i, word));
        }
        ASSERT_EQ(spelled, expected) << letters;
    }

    std::unique_ptr<BoardSearch> search_ = std::make_unique<BoardSearch>(GetParam());
    FoundWords found_;
    WordSet words_;
    WordGraph graph_;
    Random random_;
};

// First boards of few letters and words that are everywhere on them: more chains than are ever
// followed twice. The limits leave words that are never found, the dead end is a word that does
// not fit. Then edited graphs, now and then copied without their longest words, or built anew of
// more words than are stored at once.
TEST_P(BoardSearchTest, FindsWhatTryingEveryWordFinds) {
    for (std::size_t size = 2; size <= 16; ++size) edit(std::string(size, 'a'));
    for (const char* deadEnd : {"aaaaaaaaaaaaab", "aaaaaaaaaaaaaaab"}) edit(deadEnd);
    for (int i = 0; i < 500; ++i) edit(Text(random_, 8 + random_() % 2, "ab"));
    graph_ = CopyGraph(graph_, 16);
    for (const char* board : {"aaaaaaaaaaaaaaaa", "aaaaaaaaaaaaaaab", "abababbaababbaab"}) {
        search(board, {3, 16});
        search(board, {2, 9});
    }
    for (const char* qu : {"suq", "quit", "iraq", "qq", "qi", "quq", "uqu"}) edit(qu);
    for (std::size_t board = 0; board < 1000; ++board) {
        const auto letters = std::string_view("uaqzeistrnlodcm").substr(0, 3 + board / 80);
        for (int i = 0; i < 40; ++i) edit(Text(random_, 2 + random_() % 5, letters));
        const int shortest = 2 + static_cast<int>(random_() % 3);
        const int longest = 2 + static_cast<int>(random_() % 15);
        search(Text(random_, 16, letters), {shortest, longest});
        const std::size_t most = 16 - board / 100;
        if (board % 100 == 0) graph_ = CopyGraph(graph_, most);
        std::erase_if(words_, [most](const std::string& word) { return word.size() > most; });
        if (board % 100 != 50) continue;
        GraphBuilder builder(0);
        WordCursor cursor(graph_);
        for (auto word = cursor.next(); word != NoWord; word = cursor.next()) builder.add(word);
        graph_ = builder.finish();
    }
}

// Where the machine has but the one way, it is tested twice.
const auto Best = CanMatch(Matching::Avx2) ? Matching::Avx2 : Matching::Plain;
INSTANTIATE_TEST_SUITE_P(All, BoardSearchTest, testing::Values(Matching::Plain, Best));

}  // namespace
