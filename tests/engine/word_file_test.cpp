// Merging word files in steps, through the interface.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include "quorle/word_engine.h"
#include "random_words.h"
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
    static std::int32_t step(std::int32_t percent, const char* path = "dummy") {
        const std::int32_t next = cReadTextFile(path);
        EXPECT_TRUE(next >= percent && next <= 100);
        return next;
    }
    static void finish(std::int32_t percent) {
        while (percent < 100) percent = step(percent);
    }
    Words held() const {
        EXPECT_EQ(cWriteTextFile((folder_ / "held").c_str()), 1);
        std::ifstream file(folder_ / "held");
        return {std::istream_iterator<std::string>(file), {}};
    }
    std::size_t below(std::size_t n) { return random_() % n; }

    /// A file of many words "b..." in no order, more than a few steps can take.
    Words writeMany(const std::string& name) {
        Words words;
        RandomWords random(1);
        std::string text;
        while (words.size() < 270'000) {
            const std::string word = 'b' + random.word(26, 15);
            if (words.insert(word).second) text += word + (word.size() % 2 == 0 ? "\n" : "\r\n");
        }
        folder_.write(name, text);
        return words;
    }

    TempFolder folder_;
    std::minstd_rand random_;
};

TEST_F(WordFile, IsMergedAllAtOnceIntoWhatTheDictionaryIsAtTheEnd) {
    const std::string saved = folder_ / "Dictionary.dat";
    ASSERT_EQ(cDictionaryAdd("saved"), 1);
    ASSERT_EQ(cWriteBinaryDictionary(saved.c_str()), 1);
    const Words many = writeMany("many");
    for (int run = 0; run < 3; ++run) {
        cDictionaryClear();
        Words expected;
        std::size_t max = 16;
        cSetMaxWordSize(16);
        int steps = 0;
        for (std::int32_t percent = start("many"); percent < 100; ++steps) {
            const std::string word(2 + below(9), 'z');
            if (below(3) == 0) {
                EXPECT_EQ(cDictionaryRemove(word.c_str()), static_cast<int>(expected.erase(word)));
            } else if (cDictionaryAdd(word.c_str()) == 1) {
                expected.insert(word);
            }
            if (run > 0 && below(3) == 0) {
                const bool clear = below(2) == 0;
                EXPECT_EQ(clear ? cDictionaryClear() : cReadBinaryDictionary(saved.c_str()), 1);
                expected = clear ? Words{} : Words{"saved"};
                cSetMaxWordSize(static_cast<int>(max = 5 + below(9)));
            }
            EXPECT_EQ(cNumberOfWords(), static_cast<int>(expected.size()));
            percent = step(percent, below(2) == 0 ? nullptr : "dummy");
        }
        EXPECT_TRUE(steps > 8 && steps < 10'000) << steps;
        for (const auto& word : many) {
            if (word.size() <= max) expected.insert(expected.end(), word);
        }
        EXPECT_TRUE(held() == expected);
    }
}

TEST_F(WordFile, WaitsInLine) {
    Words expected = writeMany("many");
    for (const char* name : {"second", "vanishes", "third"}) folder_.write(name, name);
    std::int32_t percent = start("many");
    for (const char* name : {"second", "missing", "many", "vanishes", "third"}) {
        percent = step(percent, (folder_ / name).c_str());
        EXPECT_LT(percent, 100);
    }
    std::filesystem::remove(folder_ / "vanishes");
    std::filesystem::remove(folder_ / "many");  // open already, but gone when it comes again
    finish(percent);
    expected.insert({"second", "third"});
    EXPECT_TRUE(held() == expected);
}

TEST_F(WordFile, LeavesTheDictionaryAloneWhenItCannotBeRead) {
    cDictionaryAdd("stays");
    ASSERT_EQ(mkfifo((folder_ / "pipe").c_str(), 0600), 0);
    for (const std::string& path :
         {folder_ / "pipe", folder_ / "", folder_ / "missing/file", std::string("/dev/zero")}) {
        EXPECT_EQ(cReadTextFile(path.c_str()), 100) << path;
        EXPECT_EQ(cReadBinaryDictionary(path.c_str()), 0) << path;
    }
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
