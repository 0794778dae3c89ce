#include "dictionary_file.h"

#include <gtest/gtest.h>

#include "graph_builder.h"
#include "random_words.h"
#include "word_cursor.h"

namespace {

using Words = std::set<std::string>;

WordGraph Built(const Words& words) {
    GraphBuilder builder;
    for (const std::string& word : words) builder.add(word);
    return builder.finish();
}

Words Listed(const WordGraph& graph) {
    Words words;
    WordCursor cursor(graph);
    for (std::string_view word; cursor.next(word);) words.emplace_hint(words.end(), word);
    return words;
}

TEST(DictionaryFile, RoundTrip) {
    for (std::uint32_t seed = 0; seed < 50; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        RandomWords random(seed);
        const int letters = 1 + random.below(26);
        const Words words = random.words(random.below(1000), letters, 2 + random.below(15));
        WordGraph graph = Built(words);
        const auto minimal = EncodeDictionary({graph, 9});
        DictionaryContent content;
        ASSERT_TRUE(DecodeDictionary(minimal, content));
        EXPECT_EQ(Listed(content.words), words);
        EXPECT_EQ(content.maxWordSize, 9);
        // The same words by edits, in the order of the set, make the same file.
        WordGraph edited;
        for (const std::string& word : words) edited.add(word);
        EXPECT_EQ(EncodeDictionary({edited, 9}), minimal);
    }
}

TEST(DictionaryFile, DamageIsRefused) {
    const auto whole = EncodeDictionary({Built(RandomWords(1).words(60, 5, 6)), 16});
    DictionaryContent content;
    for (std::size_t i = 0; i < whole.size(); ++i) {
        auto damaged = whole;
        damaged.resize(i);
        EXPECT_FALSE(DecodeDictionary(damaged, content)) << "cut to " << i;
        damaged = whole;
        for (int bit = 0; bit < 8; ++bit) {
            damaged[i] = whole[i] ^ std::byte(1 << bit);
            EXPECT_FALSE(DecodeDictionary(damaged, content)) << "byte " << i << " bit " << bit;
        }
    }
}

}  // namespace
