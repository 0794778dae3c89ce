// The dictionary's file: its bytes, and what is refused.
#include <gtest/gtest.h>

#include "engine/calls.h"
#include "engine/temp_folder.h"

namespace {

using namespace std::string_literals;

class DictionaryFile : public testing::Test {
  protected:
    DictionaryFile() {
        cDictionaryClear();
        cSetMaxWordSize(16);
    }
    std::string saved() const {
        EXPECT_EQ(cWriteBinaryDictionary((folder_ / "saved").c_str()), 1);
        return folder_.read("saved");
    }
    bool load(const std::string& bytes) const {
        return cReadBinaryDictionary(folder_.write("file", bytes).c_str()) == 1;
    }

    TempFolder folder_;
};

// A file that the first version wrote, byte by byte: it is read, and written the same. Whatever a
// byte is changed to is refused; with the checksum changed, too, it may be a sound dictionary.
TEST_F(DictionaryFile, KeepsItsFormAndAnyDamageToItDoesNone) {
    constexpr std::size_t MaxWordSizeAt = 10, NodesAt = 32;
    const std::string old =
        "Qurd\xea\x8c\x6f\x3a\1\0\20\0\5\0\0\0\6\0\0\0\10\0\0\0\1\0\0\0\5\0\1\0"  // header
        "\1\0\0\0\20\0\0\0\0\0\4\0\0\0\10\0\6\0\10\0\0\0\0\0"                     // masks, link
        "\1\0\2\1\3\0\4\2\1\1\0\5\3\1\1"s;
    ASSERT_TRUE(load(old));
    EXPECT_EQ(AllWords(), (WordSet{"bat", "bats", "cat", "cats", "tea"}));
    cDictionaryAdd("teas");
    cDictionaryRemove("teas");
    EXPECT_EQ(saved(), old);
    int loaded = 0;
    for (std::size_t at = 0; at < old.size(); ++at) {
        EXPECT_FALSE(load(old.substr(0, at)) || load(Sealed(old.substr(0, at)))) << at;
        for (int byte = 0; byte < 256; ++byte) {
            std::string changed = old;
            changed[at] = static_cast<char>(byte);
            SCOPED_TRACE("byte " + std::to_string(at) + " is " + std::to_string(byte));
            EXPECT_EQ(load(changed), changed == old);
            if (Sealed(changed) == old || !load(Sealed(changed))) continue;
            EXPECT_TRUE(at == MaxWordSizeAt || at >= NodesAt);
            EXPECT_TRUE(cMaxWordSize() >= 2 && cMaxWordSize() <= 16);
            EXPECT_NO_THROW(AllWords());
            ++loaded;
        }
    }
    EXPECT_GT(loaded, 50);
}

// Every node shared by the one above, 26 times or once: too many words, or too long ones. The
// counts are right, as far as 32 bits hold them.
TEST_F(DictionaryFile, OfTooManyOrTooLongWordsIsRefused) {
    for (const auto& [letters, levels, sound] :
         {std::tuple{26U, 6U, true}, {26U, 9U, false}, {1U, 16U, true}, {1U, 17U, false}}) {
        const std::uint32_t mask = (1U << letters) - 1;
        const std::string node =
            '\xff' + std::string(reinterpret_cast<const char*>(&mask), sizeof mask);
        std::string nodes = node + std::string(letters, '\0');
        std::uint32_t words = letters;
        for (std::uint32_t i = 1; i < levels; ++i, words *= letters) {
            nodes += "\0"s + node + "\1" + std::string(letters - 1, static_cast<char>(1 + 2 * i));
        }
        std::string file = "Qurd....\1\0\20\0"s;
        for (const std::uint32_t count : {words, levels, levels * letters, levels - 1, 0U}) {
            file.append(reinterpret_cast<const char*>(&count), sizeof count);
        }
        EXPECT_EQ(load(Sealed(file + nodes)), sound) << letters << " letters";
    }
}

}  // namespace
