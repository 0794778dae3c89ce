// The files that a dictionary is read from: its own, and those of words that are merged into it.
#include <gtest/gtest.h>

#include "engine/calls.h"
#include "engine/temp_folder.h"

namespace {

using namespace std::string_literals;

class Dictionary : public testing::Test {
  protected:
    Dictionary() {
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
    std::int32_t merge(const std::string& name, std::int32_t percent = 0) const {
        return Step(percent, (folder_ / name).c_str());
    }

    TempFolder folder_;
};

// A file that the first version wrote, byte by byte: it is read, and written the same. Whatever a
// byte is changed to is refused; with the checksum changed, too, it may be a sound dictionary.
TEST_F(Dictionary, HasAFileWhoseFormStaysAndWhoseDamageIsFound) {
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
        for (int byte = 0; byte <= 256; ++byte) {
            std::string changed = old;
            if (byte == 256) std::swap(changed[at], changed[(at + 1) % old.size()]);
            if (byte < 256) changed[at] = static_cast<char>(byte);
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
TEST_F(Dictionary, OfTooManyOrTooLongWordsIsRefused) {
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

// Edits at every step, too, do not keep the merge from ending.
TEST_F(Dictionary, TakesInAWordFileAllAtOnceAsItIsAtTheEnd) {
    Random random;
    std::string text;
    WordSet many;
    for (std::size_t i = 0; i < 270'000; ++i) {  // more than a few steps can take, in no order
        const std::string word = 'b' + Text(random, 1 + i % 15, "abcdefghijklmnopqrstuvwxyz");
        text += word + (random() % 2 == 0 ? "\n" : "\r\n");
        many.insert(word);
    }
    folder_.write("many", text);
    ASSERT_EQ(cDictionaryAdd("saved"), 1);
    const std::string file = saved();
    for (const int edits : {6, 10'000}) {
        ASSERT_TRUE(load(file));
        WordSet expected{"saved"};
        int steps = 0;
        for (std::int32_t percent = merge("many"); percent < 100; ++steps) {
            if (percent > 60) cSetMaxWordSize(9);
            if (steps == 2 && cDictionaryClear() == 1) expected.clear();
            if (steps == 4 && load(file)) expected = {"saved"};
            const std::string word(2 + random() % 7, 'z');
            if (steps < edits && cDictionaryRemove(word.c_str()) == 0) {
                EXPECT_TRUE(expected.insert(word).second && cDictionaryAdd(word.c_str()) == 1);
            } else if (steps < edits) {
                EXPECT_EQ(expected.erase(word), 1U);
            }
            EXPECT_EQ(cNumberOfWords(), static_cast<int>(expected.size()));
            percent = Step(percent, random() % 2 == 0 ? nullptr : "dummy");
        }
        EXPECT_TRUE(steps > 6 && steps < 10'000) << steps;
        const std::size_t max = edits == 6 ? 9 : 16;
        for (const std::string& word : many) {
            if (word.size() <= max) expected.insert(word);
        }
        EXPECT_TRUE(AllWords() == expected);
    }
}

TEST_F(Dictionary, TakesInALineOfWordFilesThatGrowAndShrinkMeanwhile) {
    const std::string filler(40'000'000, 'x');
    folder_.write("grows", "first " + filler + " whole");
    folder_.write("shrinks", "begin " + filler + " end");
    for (const char* name : {"second", "third"}) folder_.write(name, name);
    std::int32_t percent = merge("grows");
    ASSERT_LT(percent, 100);
    std::ofstream(folder_ / "grows", std::ios::app) << "ness later " << filler;
    for (const char* name : {"second", "missing", "third"}) percent = merge(name, percent);
    Finish(percent);
    percent = merge("shrinks");
    std::filesystem::resize_file(folder_ / "shrinks", 100);
    Finish(percent);
    EXPECT_EQ(AllWords(), (WordSet{"first", "wholeness", "second", "third", "begin"}));
}

}  // namespace
