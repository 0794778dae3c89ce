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
    std::int32_t start(const std::string& name, std::int32_t percent = 0) const {
        return Step(percent, (folder_ / name).c_str());
    }
    TempFolder folder_;
};

// Edits at every step, too, do not keep the merge from ending.
TEST_F(WordFile, IsMergedAllAtOnceIntoWhatTheDictionaryIsAtTheEnd) {
    Random random;
    std::string text;
    WordSet many, expected{"saved"};
    for (std::size_t i = 0; i < 270'000; ++i) {  // more than a few steps can take, in no order
        const std::string word = 'b' + Text(random, 1 + i % 15, "abcdefghijklmnopqrstuvwxyz");
        text += word + (random() % 2 == 0 ? "\n" : "\r\n");
        if (word.size() <= 9) many.insert(word);
    }
    folder_.write("many", text);
    ASSERT_EQ(cDictionaryAdd("saved"), 1);
    ASSERT_EQ(cWriteBinaryDictionary((folder_ / "saved").c_str()), 1);
    int steps = 0;
    for (std::int32_t percent = start("many"); percent < 100; ++steps) {
        if (steps == 3 && cDictionaryClear() == 1) expected.clear();
        if (steps == 6 && cReadBinaryDictionary((folder_ / "saved").c_str()) == 1)
            expected = {"saved"};
        if (steps == 6) cSetMaxWordSize(9);
        const std::string word(2 + random() % 7, 'z');
        const bool held = expected.erase(word) == 1;
        EXPECT_EQ(held ? cDictionaryRemove(word.c_str()) : cDictionaryAdd(word.c_str()), 1);
        if (!held) expected.insert(word);
        EXPECT_EQ(cNumberOfWords(), static_cast<int>(expected.size()));
        percent = Step(percent, random() % 2 == 0 ? nullptr : "dummy");
    }
    EXPECT_TRUE(steps > 6 && steps < 10'000) << steps;
    expected.merge(many);
    EXPECT_TRUE(AllWords() == expected);
}

TEST_F(WordFile, WaitsInLineAndMayGrowOrShrinkMeanwhile) {
    const std::string filler(40'000'000, 'x');
    folder_.write("grows", "first " + filler + " whole");
    folder_.write("shrinks", "begin " + filler + " end");
    for (const char* name : {"second", "third"}) folder_.write(name, name);
    std::int32_t percent = start("grows");
    ASSERT_LT(percent, 100);
    std::ofstream(folder_ / "grows", std::ios::app) << "ness later " << filler;
    for (const char* name : {"second", "missing", "third"}) percent = start(name, percent);
    Finish(percent);
    percent = start("shrinks");
    std::filesystem::resize_file(folder_ / "shrinks", 100);
    Finish(percent);
    EXPECT_EQ(AllWords(), (WordSet{"first", "wholeness", "second", "third", "begin"}));
}

}  // namespace
