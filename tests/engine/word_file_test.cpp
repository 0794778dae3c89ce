// Merging and writing word files, through the interface.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <algorithm>
#include <random>

#include "quorle/word_engine.h"
#include "temp_folder.h"

namespace {

using Words = std::set<std::string>;

class WordFile : public testing::Test {
  protected:
    WordFile() {
        cDictionaryClear();
        cSetMaxWordSize(16);
    }
    /// Merging what a test has left unfinished must not reach the next one.
    ~WordFile() override { finish(0); }

    std::int32_t start(const std::string& name) const {
        return cReadTextFile((folder_ / name).c_str());
    }

    /// Steps to the end; percentages never fall. Returns the number of steps.
    static int finish(std::int32_t percent) {
        int steps = 0;
        while (percent < 100) {
            const std::int32_t next = cReadTextFile("dummy");
            EXPECT_GE(next, percent);
            percent = next;
            ++steps;
        }
        EXPECT_EQ(percent, 100);
        return steps;
    }

    Words held() const {
        EXPECT_EQ(cWriteTextFile((folder_ / "held").c_str()), 1);
        std::ifstream file(folder_ / "held");
        return {std::istream_iterator<std::string>(file), {}};
    }

    /// A file of many words "b..." in no order, more than one step can take.
    Words writeMany(const std::string& name, unsigned seed, std::size_t number = 200'000) const {
        std::minstd_rand random(seed);
        std::string text;
        Words words;
        while (words.size() < number) {
            std::string word(2 + random() % 15, 'b');
            for (char& c : word) c = static_cast<char>('a' + random() % 26);
            word[0] = 'b';
            text += word + (random() % 2 == 0 ? "\n" : "\r\n");
            words.insert(word);
        }
        folder_.write(name, text);
        return words;
    }

    TempFolder folder_;
};

Words With(Words words, const Words& more) {
    words.insert(more.begin(), more.end());
    return words;
}

Words UpTo(std::size_t size, Words words) {
    std::erase_if(words, [size](const auto& word) { return word.size() > size; });
    return words;
}

TEST_F(WordFile, TakesTheWordsAndNothingElse) {
    using namespace std::string_literals;
    folder_.write("words",
                  "\xEF\xBB\xBF"
                  "first\nSecond\r\n\tTHIRD  a don't caf\xC3\xA9 no1 nul\0nul\v"
                  "abcdefghijklmnop\fabcdefghijklmnopq [ab] {ab z@z \xEF\xBB\xBF"
                  "mark\n\nlast"s);
    finish(start("words"));
    EXPECT_EQ(held(), (Words{"first", "second", "third", "abcdefghijklmnop", "last"}));
    folder_.write("utf16",
                  "\xFF\xFE"
                  "c\0a\0t\0\n\0"s);
    folder_.write("empty", "");
    cSetMaxWordSize(5);
    folder_.write("short", "abcdef fives");
    for (const char* name : {"utf16", "empty", "short", "short"}) finish(start(name));
    EXPECT_EQ(held(), (Words{"first", "second", "third", "abcdefghijklmnop", "last", "fives"}));
}

TEST_F(WordFile, IsWrittenSortedAWordALine) {
    EXPECT_EQ(cWriteTextFile((folder_ / "file").c_str()), 1);
    EXPECT_EQ(folder_.read("file"), "");
    for (const char* word : {"zebra", "ab", "abcdefghijklmnop", "abc"}) cDictionaryAdd(word);
    EXPECT_EQ(cWriteTextFile((folder_ / "file").c_str()), 1);
    EXPECT_EQ(folder_.read("file"), "ab\nabc\nabcdefghijklmnop\nzebra\n");
    EXPECT_EQ(cWriteTextFile((folder_ / "no/file").c_str()), 0);
}

TEST_F(WordFile, IsMergedAllAtOnceWithTheEditsMadeMeanwhile) {
    cDictionaryAdd("removed");
    cDictionaryAdd("stays");
    const Words many = writeMany("many", 1, 270'000);  // runs are merged before the end
    std::int32_t percent = start("many");
    int steps = 0;
    for (; percent < 100; percent = cReadTextFile(nullptr), ++steps) {
        EXPECT_GE(percent, 0);
        EXPECT_EQ(cNumberOfWords(), 2 + std::min(steps, 1));
        if (steps == 0) cDictionaryAdd("added");
        if (steps == 6) {
            cDictionaryAdd("later");
            cDictionaryRemove("removed");
        }
    }
    EXPECT_GT(steps, 8);
    EXPECT_EQ(held(), With(many, {"stays", "added", "later"}));
}

TEST_F(WordFile, IsMergedIntoWhatTheDictionaryIsAtTheEnd) {
    const Words many = writeMany("many", 2);
    cDictionaryAdd("saved");
    ASSERT_EQ(cWriteBinaryDictionary((folder_ / "Dictionary.dat").c_str()), 1);
    for (const int moment : {0, 50}) {  // while reading, while building
        cSetMaxWordSize(4);
        std::int32_t percent = start("many");
        while (percent < moment) percent = cReadTextFile("dummy");
        ASSERT_LT(percent, 100);
        cDictionaryAdd("cleared");
        cDictionaryClear();
        EXPECT_EQ(cReadBinaryDictionary((folder_ / "Dictionary.dat").c_str()), 1);
        cSetMaxWordSize(9);
        finish(percent);
        EXPECT_EQ(held(), With(UpTo(9, many), {"saved"}));
    }
}

TEST_F(WordFile, EndsForAPlayerWhoEditsAtEveryStep) {
    const Words many = writeMany("many", 3);
    Words edits;
    for (std::int32_t percent = start("many"); percent < 100; percent = cReadTextFile("dummy")) {
        const std::string word = "zz" + std::string(edits.size() % 14, 'z');
        cDictionaryAdd(word.c_str());
        edits.insert(word);
        ASSERT_LT(edits.size(), 10'000U);
        cDictionaryRemove("zzz");
    }
    edits.erase("zzz");
    EXPECT_EQ(held(), With(many, edits));
}

TEST_F(WordFile, WaitsInLine) {
    const Words many = writeMany("many", 4);
    for (const char* name : {"second", "vanishes", "third"}) folder_.write(name, name);
    std::int32_t percent = start("many");
    ASSERT_LT(percent, 100);
    for (const char* name : {"second", "missing", "many", "vanishes", "third"}) {
        const std::int32_t next = start(name);
        EXPECT_TRUE(next >= percent && next < 100);
        percent = next;
    }
    EXPECT_EQ(cNumberOfWords(), 0);
    std::filesystem::remove(folder_ / "vanishes");
    std::filesystem::remove(folder_ / "many");  // open already, but gone when it comes again
    finish(percent);
    EXPECT_EQ(held(), With(many, {"second", "third"}));
}

TEST_F(WordFile, LeavesTheDictionaryAloneWhenItCannotBeRead) {
    cDictionaryAdd("stays");
    ASSERT_EQ(mkfifo((folder_ / "pipe").c_str(), 0600), 0);
    for (const char* name : {"pipe", "missing", "", "missing/file"}) {
        EXPECT_EQ(start(name), 100) << name;
    }
    EXPECT_EQ(cReadTextFile("/dev/zero"), 100);
    EXPECT_EQ(cReadTextFile(nullptr), 100);
    EXPECT_EQ(cReadTextFile("dummy"), 100);
    EXPECT_EQ(held(), Words{"stays"});
}

TEST_F(WordFile, MayGrowShrinkOrHaveALineWithoutEnd) {
    const std::string filler(40'000'000, 'x');
    folder_.write("grows", "first " + filler + " whole");
    std::int32_t percent = start("grows");
    ASSERT_LT(percent, 100);
    std::ofstream(folder_ / "grows", std::ios::app) << "ness later " << filler;
    finish(percent);
    EXPECT_EQ(held(), (Words{"first", "wholeness"}));
    folder_.write("shrinks", "begin " + filler + " end");
    percent = start("shrinks");
    std::filesystem::resize_file(folder_ / "shrinks", 100);
    finish(percent);
    EXPECT_EQ(held(), (Words{"first", "wholeness", "begin"}));
}

}  // namespace
