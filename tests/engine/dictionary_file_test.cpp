#include "dictionary_file.h"

#include <gtest/gtest.h>

#include <cstring>

#include "crc32c.h"
#include "dictionary_codes.h"
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

/// A file of these counts and this content, its checksum right.
std::vector<std::byte> Forged(DictionaryHeader header, const std::vector<int>& content) {
    std::vector<std::byte> bytes(HeaderSize);
    for (const int byte : content) bytes.push_back(static_cast<std::byte>(byte));
    header.magic = 0x64727551;
    header.version = 1;
    header.maxWordSize = 16;
    std::memcpy(bytes.data(), &header, HeaderSize);
    std::span<const std::byte> all(bytes);
    header.checksum = Crc32c(Crc32c(0, all.first(4)), all.subspan(8));
    std::memcpy(bytes.data(), &header, HeaderSize);
    return bytes;
}

bool Accepts(std::uint32_t words, std::uint32_t nodes, std::uint32_t edges, std::uint32_t shared,
             const std::vector<int>& content) {
    DictionaryHeader header{};
    header.words = words;
    header.nodes = nodes;
    header.edges = edges;
    header.shared = shared;
    DictionaryContent read;
    return DecodeDictionary(Forged(header, content), read);
}

/// A node without a table: its mask, then a code for each letter.
std::vector<int> Node(std::uint32_t mask, int codes, int code) {
    std::vector<int> bytes{255, static_cast<int>(mask & 255), static_cast<int>(mask >> 8 & 255),
                           static_cast<int>(mask >> 16 & 255), static_cast<int>(mask >> 24)};
    bytes.insert(bytes.end(), static_cast<std::size_t>(codes), code);
    return bytes;
}

std::vector<int> Joined(const std::vector<std::vector<int>>& parts) {
    std::vector<int> all;
    for (const auto& part : parts) all.insert(all.end(), part.begin(), part.end());
    return all;
}

// What a file of the right checksum may still claim. The first one is sound: "ab".
TEST(DictionaryFile, HostileContentIsRefused) {
    const auto end = Node(2, 1, 0);
    const auto root = Node(1, 1, 1);
    EXPECT_TRUE(Accepts(1, 2, 2, 0, Joined({end, root})));
    EXPECT_TRUE(Accepts(0, 0, 0, 0, {}));
    EXPECT_FALSE(Accepts(1, 0, 0, 0, {}));
    EXPECT_FALSE(Accepts(2, 2, 2, 0, Joined({end, root}))) << "words";
    EXPECT_FALSE(Accepts(1, 3, 2, 0, Joined({end, root}))) << "nodes";
    EXPECT_FALSE(Accepts(1, 2, 2, 1, Joined({end, root}))) << "shared";
    EXPECT_FALSE(Accepts(1, 0xffffffff, 0xffffffff, 0xffffffff, Joined({end, root})));
    EXPECT_FALSE(Accepts(1, 2, 2, 0, Joined({root, end}))) << "a child that never came";
    EXPECT_FALSE(Accepts(1, 1, 1, 0, end)) << "a word of one letter";
    EXPECT_FALSE(Accepts(2, 3, 3, 0, Joined({end, end, root}))) << "a node without parent";
    EXPECT_FALSE(Accepts(1, 2, 1, 0, Joined({end, Node(0, 0, 0)}))) << "a node without letters";
    EXPECT_FALSE(Accepts(1, 2, 2, 0, Joined({end, Node(1U << 26, 1, 1)}))) << "no letter";
    EXPECT_FALSE(Accepts(1, 2, 2, 0, Joined({end, Node(1, 1, 3)}))) << "number 0 of none";
    EXPECT_FALSE(Accepts(1, 2, 2, 0, Joined({end, {1, 1}}))) << "mask 0 of none";
    EXPECT_FALSE(Accepts(1, 2, 2, 1, Joined({{0}, end, root}))) << "sharing nothing";

    // Every node doubled or more on the one below: too many words, and too long ones.
    for (const bool wide : {true, false}) {
        std::vector<std::vector<int>> nodes{wide ? Node(0x3ffffff, 26, 0) : end};
        const std::uint32_t levels = wide ? 9 : 18;
        const std::uint32_t letters = wide ? 26 : 1;
        for (std::uint32_t i = 1; i < levels; ++i) {
            nodes.push_back({0});
            // The newest node for the first letter, its number for the others.
            auto node =
                Node(wide ? 0x3ffffff : 1, static_cast<int>(letters), static_cast<int>(1 + 2 * i));
            node[5] = 1;
            nodes.push_back(node);
        }
        EXPECT_FALSE(
            Accepts(wide ? 0x7fffffff : 1, levels, levels * letters, levels - 1, Joined(nodes)));
    }
}

// Every byte changed at random, with the checksum made right: refused, or sound through and
// through.
TEST(DictionaryFile, WhateverIsReadCanBeUsed) {
    for (std::uint32_t seed = 0; seed < 3000; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        RandomWords random(seed);
        auto bytes = EncodeDictionary({Built(random.words(30, 4, 5)), 16});
        for (int i = random.below(3); i >= 0; --i) {
            const auto at =
                static_cast<std::size_t>(8 + random.below(static_cast<int>(bytes.size()) - 8));
            bytes[at] = static_cast<std::byte>(random.below(random.below(2) == 0 ? 8 : 256));
        }
        std::span<const std::byte> all(bytes);
        const std::uint32_t checksum = Crc32c(Crc32c(0, all.first(4)), all.subspan(8));
        std::memcpy(bytes.data() + 4, &checksum, 4);
        DictionaryContent content;
        if (!DecodeDictionary(bytes, content) || content.words.size() > 100000) continue;
        EXPECT_EQ(Listed(content.words).size(), content.words.size());
    }
}

TEST(Crc32c, IsTheKnownOneBothWays) {
    const std::string text = "123456789";
    EXPECT_EQ(Crc32c(0, std::as_bytes(std::span(text))), 0xe3069283U);
    for (std::size_t size = 0; size < 40; ++size) {
        const std::string letters(size, 'x');
        const auto bytes = std::as_bytes(std::span(letters));
        EXPECT_EQ(Crc32c(7, bytes), Crc32cByTables(7, bytes));
    }
}

}  // namespace
