#include <gtest/gtest.h>

#include <deque>
#include <vector>

#include "graph_builder.h"
#include "random_words.h"
#include "word_cursor.h"
#include "word_reader.h"

namespace {

using Words = std::set<std::string>;

WordGraph Built(const Words& words) {
    GraphBuilder builder;
    for (const std::string& word : words) builder.add(word);
    return builder.finish();
}

std::vector<std::string> Listed(WordCursor cursor) {
    std::vector<std::string> words;
    for (std::string_view word; cursor.next(word);) words.emplace_back(word);
    return words;
}

/// The graph holds exactly these words, and everything it says about them is so.
void ExpectHolds(const WordGraph& graph, const Words& words) {
    ASSERT_EQ(graph.size(), words.size());
    const std::vector<std::string> sorted(words.begin(), words.end());
    ASSERT_EQ(Listed(WordCursor(graph)), sorted);
    WordReader reader(graph);
    for (std::uint32_t i = 0; i < sorted.size(); ++i) {
        ASSERT_EQ(graph.rank(sorted[i]), i);
        ASSERT_EQ(reader.word(i), sorted[i]);
    }
}

void ExpectPrefixesRight(const WordGraph& graph, const Words& words, const std::string& prefix) {
    std::vector<std::string> below;
    for (const std::string& word : words) {
        if (word.starts_with(prefix)) below.push_back(word);
    }
    const auto before = std::distance(words.begin(), words.lower_bound(prefix));
    EXPECT_EQ(Listed(WordCursor(graph, prefix)), below);
    EXPECT_EQ(graph.wordsBelow(prefix), below.size());
    EXPECT_EQ(graph.hasPrefix(prefix), !below.empty());
    EXPECT_EQ(graph.firstIndex(prefix), below.empty() ? -1 : before);
    EXPECT_EQ(graph.rank(prefix), before);
    EXPECT_EQ(graph.contains(prefix), words.contains(prefix));
}

// Edits by chance, with a listing begun now and then, against a plain set. Few letters make words
// that share much; the base is built, so that edits copy its nodes and give them up again.
TEST(WordGraph, EditsLeaveOlderSnapshotsWhole) {
    for (std::uint32_t seed = 0; seed < 40; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        RandomWords random(seed);
        const int letters = 2 + random.below(6);
        const int longest = 3 + random.below(14);
        Words words = random.words(random.below(300), letters, longest);
        WordGraph graph = Built(words);
        std::deque<std::pair<WordGraph, Words>> snapshots;
        for (int i = 0; i < 400; ++i) {
            const std::string word = random.word(letters, longest);
            const bool held = words.contains(word);
            if (random.below(2) == 0) {
                EXPECT_EQ(graph.add(word), !held);
                words.insert(word);
            } else {
                EXPECT_EQ(graph.remove(word), held);
                words.erase(word);
            }
            if (random.below(30) == 0) snapshots.emplace_back(graph, words);
            if (snapshots.size() > 4) snapshots.pop_front();
        }
        ExpectHolds(graph, words);
        for (int i = 0; i < 20; ++i) ExpectPrefixesRight(graph, words, random.word(letters, 3));
        ExpectPrefixesRight(graph, words, "");
        for (const auto& [snapshot, then] : snapshots) ExpectHolds(snapshot, then);
    }
}

TEST(WordGraph, EditsThatAreTakenBackLeaveNothing) {
    RandomWords random(7);
    const Words words = random.words(2000, 8, 9);
    const Words others = random.words(2000, 8, 9);
    WordGraph graph = Built(words);
    Words changed;
    for (const std::string& word : others) {
        if (!graph.add(word)) graph.remove(word);
    }
    EXPECT_FALSE(graph.isMinimal());
    for (const std::string& word : others) {
        if (!graph.remove(word)) graph.add(word);
    }
    EXPECT_TRUE(graph.isMinimal());
    ExpectHolds(graph, words);
}

}  // namespace
