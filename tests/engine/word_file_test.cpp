// Merging word files in steps.
#include <gtest/gtest.h>

#include "engine/calls.h"
#include "engine/temp_folder.h"

namespace {

class WordFile : public testing::Test {
  protected:
    WordFile() {
        cDictionaryClear();
        cSetMaxWordSize(16);
    }
    /// Merging what a test has left unfinished must not reach the next one.
    ~WordFile() override { Finish(0); }

    std::int32_t start(const std::string& name, std::int32_t percent = 0) const {
        return Step(percent, (folder_ / name).c_str());
    }
    /// A file of many words "b..." in no order, more than a few steps can take.
    WordSet writeMany() {
        WordSet words;
        std::string text;
        for (std::size_t i = 0; i < 270'000; ++i) {
            const std::string word = 'b' + Text(random_, 1 + i % 15, "abcdefghijklmnopqrstuvwxyz");
            words.insert(word);
            text += word + (random_() % 2 == 0 ? "\n" : "\r\n");
        }
        folder_.write("many", text);
        return words;
    }

    TempFolder folder_;
    Random random_;
};

// Edits at every step, too, do not keep the merge from ending.
TEST_F(WordFile, IsMergedAllAtOnceIntoWhatTheDictionaryIsAtTheEnd) {
    const std::string saved = folder_ / "Dictionary.dat";
    cDictionaryAdd("saved");
    ASSERT_EQ(cWriteBinaryDictionary(saved.c_str()), 1);
    const WordSet many = writeMany();
    WordSet expected{"saved"};
    int steps = 0;
    for (std::int32_t percent = start("many"); percent < 100; ++steps) {
        if (steps == 3 && cDictionaryClear() == 1) expected.clear();
        if (steps == 6 && cReadBinaryDictionary(saved.c_str()) == 1) expected = {"saved"};
        if (steps == 6) cSetMaxWordSize(9);
        const std::string word(2 + random_() % 7, 'z');
        const bool held = !expected.insert(word).second;
        EXPECT_EQ(held ? cDictionaryRemove(word.c_str()) : cDictionaryAdd(word.c_str()), 1);
        if (held) expected.erase(word);
        EXPECT_EQ(cNumberOfWords(), static_cast<int>(expected.size()));
        percent = Step(percent, random_() % 2 == 0 ? nullptr : "dummy");
    }
    EXPECT_TRUE(steps > 8 && steps < 10'000) << steps;
    for (const auto& word : many) {
        if (word.size() <= 9) expected.insert(word);
    }
    EXPECT_TRUE(AllWords() == expected);
}

TEST_F(WordFile, WaitsInLine) {
    WordSet expected = writeMany();
    for (const char* name : {"second", "vanishes", "third"}) folder_.write(name, name);
    std::int32_t percent = start("many");
    for (const char* name : {"second", "missing", "many", "vanishes", "third"}) {
        percent = start(name, percent);
    }
    ASSERT_LT(percent, 100);
    // The one is open already, but gone when it comes again.
    for (const char* name : {"many", "vanishes"}) std::filesystem::remove(folder_ / name);
    Finish(percent);
    expected.insert({"second", "third"});
    EXPECT_TRUE(AllWords() == expected);
}

TEST_F(WordFile, MayGrowShrinkOrHaveALineWithoutEnd) {
    const std::string filler(40'000'000, 'x');
    folder_.write("grows", "first " + filler + " whole");
    folder_.write("shrinks", "begin " + filler + " end");
    std::int32_t percent = start("grows");
    ASSERT_LT(percent, 100);
    std::ofstream(folder_ / "grows", std::ios::app) << "ness later " << filler;
    Finish(percent);
    percent = start("shrinks");
    std::filesystem::resize_file(folder_ / "shrinks", 100);
    Finish(percent);
    EXPECT_EQ(AllWords(), (WordSet{"first", "wholeness", "begin"}));
}

}  // namespace
