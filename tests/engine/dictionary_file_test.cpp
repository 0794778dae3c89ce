#include "dictionary_file.h"

#include <gtest/gtest.h>

#include <cstring>

#include "crc32c.h"
#include "dictionary_codes.h"
#include "graph_builder.h"
#include "random_words.h"

namespace {

bool Accepts(const std::vector<std::byte>& file) {
    DictionaryContent content;
    return DecodeDictionary(file, content);
}

TEST(DictionaryFile, IsMinimalAndAnyDamageToItIsRefused) {
    GraphBuilder builder;
    WordGraph edited;
    for (const std::string& word : RandomWords(1).words(60, 5, 6)) {
        builder.add(word);
        edited.add(word);
    }
    const auto whole = EncodeDictionary({builder.finish(), 16});
    EXPECT_EQ(EncodeDictionary({edited, 16}), whole);
    EXPECT_TRUE(Accepts(whole));
    for (std::size_t i = 0; i < whole.size(); ++i) {
        EXPECT_FALSE(Accepts({whole.begin(), whole.begin() + static_cast<int>(i)})) << i;
        for (int bit = 0; bit < 8; ++bit) {
            auto damaged = whole;
            damaged[i] ^= std::byte(1 << bit);
            EXPECT_FALSE(Accepts(damaged)) << "byte " << i << " bit " << bit;
        }
    }
}

/// A file of these counts and this content, its checksum right.
std::vector<std::byte> Forged(std::uint32_t words, std::uint32_t nodes, std::uint32_t edges,
                              std::uint32_t shared, const std::string& content) {
    DictionaryHeader header{};
    header.magic = 0x64727551;
    header.version = 1;
    header.maxWordSize = 16;
    header.words = words;
    header.nodes = nodes;
    header.edges = edges;
    header.shared = shared;
    std::vector<std::byte> file(HeaderSize + content.size());
    std::memcpy(file.data() + HeaderSize, content.data(), content.size());
    std::memcpy(file.data(), &header, HeaderSize);
    const std::span<const std::byte> all(file);
    header.checksum = Crc32c(Crc32c(0, all.first(4)), all.subspan(8));
    std::memcpy(file.data(), &header, HeaderSize);
    return file;
}

/// A node without a table: its mask, then a code for each letter.
std::string Node(std::uint32_t mask, const std::string& codes) {
    std::string bytes(1, '\xff');
    for (; bytes.size() < 5; mask >>= 8) bytes += static_cast<char>(mask & 255);
    return bytes + codes;
}

// What a file of the right checksum may still claim. The first one is sound: "ab".
TEST(DictionaryFile, HostileContentIsRefused) {
    const std::string none(1, '\0');
    const std::string end = Node(2, none);
    const std::string root = Node(1, "\1");
    EXPECT_TRUE(Accepts(Forged(1, 2, 2, 0, end + root)));
    EXPECT_FALSE(Accepts(Forged(2, 2, 2, 0, end + root))) << "words";
    EXPECT_FALSE(Accepts(Forged(1, 3, 2, 0, end + root))) << "nodes";
    EXPECT_FALSE(Accepts(Forged(1, ~0U, ~0U, ~0U, end + root))) << "sizes";
    EXPECT_FALSE(Accepts(Forged(1, 2, 2, 0, root + end))) << "a child that never came";
    EXPECT_FALSE(Accepts(Forged(1, 1, 1, 0, end))) << "a word of one letter";
    EXPECT_FALSE(Accepts(Forged(2, 3, 3, 0, end + end + root))) << "a node without parent";
    EXPECT_FALSE(Accepts(Forged(1, 2, 1, 0, end + Node(0, "")))) << "a node without letters";
    EXPECT_FALSE(Accepts(Forged(1, 2, 2, 0, end + Node(1U << 26, "\1")))) << "no letter";
    EXPECT_FALSE(Accepts(Forged(1, 2, 2, 1, none + end + root))) << "sharing nothing";
    // Every node shared by the one above, 26 times or once: too many words, or too long ones.
    for (const std::uint32_t letters : {26U, 1U}) {
        const std::uint32_t levels = letters == 26 ? 9 : 18;
        const std::uint32_t mask = (1U << letters) - 1;
        std::string content = Node(mask, std::string(letters, '\0'));
        for (std::uint32_t i = 1; i < levels; ++i) {
            const std::string numbers(letters - 1, static_cast<char>(1 + 2 * i));
            content += none + Node(mask, "\1" + numbers);
        }
        EXPECT_FALSE(Accepts(
            Forged(letters == 26 ? ~0U >> 1 : 1, levels, levels * letters, levels - 1, content)));
    }
}

TEST(Crc32c, IsTheSameBothWays) {
    for (std::size_t size = 0; size < 40; ++size) {
        const std::vector<std::byte> bytes(size, std::byte(7));
        EXPECT_EQ(Crc32c(7, bytes), Crc32cByTables(7, bytes));
    }
}

}  // namespace
