#include "dictionary_file/dictionary_file.h"

#include <gtest/gtest.h>

#include <cstring>

#include "dictionary_file/file_form.h"
#include "graph/graph_copy.h"
#include "random_words.h"

using namespace Quorle;

namespace {

bool Accepts(const std::vector<std::byte>& file) {
    DictionaryContent content;
    return DecodeDictionary(file, content);
}

TEST(DictionaryFile, IsMinimalAndAnyDamageToItIsRefused) {
    WordGraph edited;
    for (const std::string& word : RandomWords(1).words(60, 5, 6)) edited.add(word);
    const auto whole = EncodeDictionary({CopyGraph(edited, 16), 16});
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

// A file that the first version wrote, byte by byte: it is read, and written the same.
TEST(DictionaryFile, KeepsItsForm) {
    constexpr unsigned char Bytes[] = {
        0x51, 0x75, 0x72, 0x64, 0xea, 0x8c, 0x6f, 0x3a, 1, 0, 16, 0, 5, 0, 0, 0, 6, 0,
        0,    0,    8,    0,    0,    0,    1,    0,    0, 0, 5,  0, 1, 0, 1, 0, 0, 0,
        16,   0,    0,    0,    0,    0,    4,    0,    0, 0, 8,  0, 6, 0, 8, 0, 0, 0,
        0,    0,    1,    0,    2,    1,    3,    0,    4, 2, 1,  1, 0, 5, 3, 1, 1};
    const auto old = std::as_bytes(std::span(Bytes));
    DictionaryContent content;
    ASSERT_TRUE(DecodeDictionary(old, content));
    for (const char* word : {"bat", "bats", "cat", "cats", "tea"}) {
        EXPECT_TRUE(content.words.find(word).isWord()) << word;
    }
    EXPECT_EQ(EncodeDictionary(content), std::vector(old.begin(), old.end()));
    content.words.add("teas");
    content.words.remove("teas");
    EXPECT_TRUE(content.words.isMinimal());
}

/// A file of these counts and this content, its checksum right.
std::vector<std::byte> Forged(std::uint32_t words, std::uint32_t nodes, std::uint32_t edges,
                              std::uint32_t shared, const std::string& content) {
    DictionaryHeader header{};
    header.maxWordSize = 16;
    header.words = words;
    header.nodes = nodes;
    header.edges = edges;
    header.shared = shared;
    std::vector<std::byte> file(HeaderSize + content.size());
    std::memcpy(file.data() + HeaderSize, content.data(), content.size());
    std::memcpy(file.data(), &header, HeaderSize);
    header.checksum = Checksum(file);
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

}  // namespace
