// The interface as callers see it, through the library.
#include "quorle/word_engine.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "temp_folder.h"

namespace {

class WordEngine : public testing::Test {
  protected:
    void SetUp() override {
        cDictionaryClear();
        cSetMinWordSize(3);
        cSetMaxWordSize(16);
        for (const char* word : {"at", "cat", "cats", "scat", "sat", "quit", "suq"}) {
            ASSERT_EQ(cDictionaryAdd(word), 1);
        }
    }
    TempFolder folder_;
};

std::vector<std::string> Fetched() {
    std::vector<std::string> words;
    for (std::int32_t i = 0;; ++i) {
        std::string buffer(16, '?');
        std::int32_t n = -1;
        if (cGetDefinedWord(i, buffer.data(), &n) == 0) {
            EXPECT_EQ(n, 0);
            return words;
        }
        EXPECT_EQ(buffer.substr(static_cast<std::size_t>(n)),
                  std::string(16 - static_cast<std::size_t>(n), '?'));
        words.push_back(buffer.substr(0, static_cast<std::size_t>(n)));
    }
}

std::vector<std::string> RestOfListing() {
    std::vector<std::string> words;
    char buffer[16];
    while (const auto size = cDecodeNextWord(buffer)) {
        words.emplace_back(buffer, static_cast<std::size_t>(size));
    }
    return words;
}

std::pair<int, int> Check(const char* text) {
    std::string word = text;
    std::int32_t found = 7;
    std::int32_t other = 7;
    EXPECT_EQ(cDictionaryCheck(word.data(), &found, &other), found);
    EXPECT_EQ(word, text);
    return {found, other};
}

using Words = std::vector<std::string>;

TEST_F(WordEngine, TellsWordsFromBeginnings) {
    EXPECT_EQ(Check("cats"), std::pair(1, 1));
    EXPECT_EQ(Check("ca"), std::pair(0, 1));
    EXPECT_EQ(Check("catsup"), std::pair(0, 0));
    for (const char* text : {"", "Cat", "ca-", "catscatscatscatscats", "c\xc3\xa4t"}) {
        EXPECT_EQ(Check(text), std::pair(0, 0)) << text;
    }
    EXPECT_EQ(cDictionaryCheck(nullptr, nullptr, nullptr), 0);
}

TEST_F(WordEngine, RefusesWhatIsNoWord) {
    const int before = cNumberOfWords();
    const std::string longest(16, 'a');
    EXPECT_EQ(cDictionaryAdd("cat"), 1);
    for (const char* text : {"", "a", "Cat", "it's", "naïve", "aaaaaaaaaaaaaaaaa"}) {
        EXPECT_EQ(cDictionaryAdd(text), 0) << text;
        EXPECT_EQ(cDictionaryRemove(text), 0) << text;
    }
    EXPECT_EQ(cDictionaryAdd(nullptr), 0);
    EXPECT_EQ(cDictionaryRemove("dog"), 0);
    EXPECT_EQ(cNumberOfWords(), before);
    EXPECT_EQ(cDictionaryAdd(longest.c_str()), 1);
    EXPECT_EQ(cSetMaxWordSize(4), 1);
    EXPECT_EQ(cDictionaryAdd("catch"), 0);
    EXPECT_EQ(cDictionaryRemove(longest.c_str()), 1);
    EXPECT_EQ(cNumberOfWords(), before);
}

TEST_F(WordEngine, ListsAsItWasWhenTheListingBegan) {
    EXPECT_EQ(cDictIndex(2, 0), 1);
    EXPECT_EQ(cDictIndex(25, 25), -1);
    ASSERT_EQ(cStartDecodingWords(2, 0), 1);
    cDictionaryAdd("cab");
    cDictionaryRemove("cats");
    EXPECT_EQ(cStartDecodingWords(-1, 0), 0);
    EXPECT_EQ(cStartDecodingWords(0, 26), 0);
    EXPECT_EQ(cDictIndex(INT_MIN, INT_MAX), -1);
    EXPECT_EQ(cDecodeNextWord(nullptr), 0);
    EXPECT_EQ(RestOfListing(), (Words{"cat", "cats"}));
    ASSERT_EQ(cStartDecodingWords(2, 0), 1);
    cDictionaryClear();
    EXPECT_EQ(RestOfListing(), (Words{"cab", "cat"}));
    EXPECT_EQ(cStartDecodingWords(2, 0), 1);
    EXPECT_EQ(RestOfListing(), Words{});
}

TEST_F(WordEngine, KeepsResultsUntilTheNextSearch) {
    ASSERT_EQ(cCheckForAllDefinedWords("catsxxxxqxxxitxx"), 3);
    cDictionaryClear();
    cSetMaxWordSize(2);
    EXPECT_EQ(Fetched(), (Words{"cat", "cats", "quit"}));
    std::int32_t n = 5;
    EXPECT_EQ(cGetDefinedWord(-1, nullptr, &n), 0);
    EXPECT_EQ(n, 0);
    for (const char* board : {"", "cats", "CATSxxxxxxxxxxxx", "catsxxxxxxxxxxxxx"}) {
        EXPECT_EQ(cCheckForAllDefinedWords(board), 0);
        EXPECT_EQ(Fetched(), Words{});
    }
    EXPECT_EQ(cCheckForAllDefinedWords(nullptr), 0);
}

TEST_F(WordEngine, SearchesWithinTheLimits) {
    const char* board = "scatxxxxsuxxqxxx";
    EXPECT_EQ(cCheckForAllDefinedWords(board), 3);
    EXPECT_EQ(Fetched(), (Words{"cat", "scat", "suq"}));
    cSetMinWordSize(2);
    cSetMaxWordSize(3);
    EXPECT_EQ(cCheckForAllDefinedWords(board), 3);
    EXPECT_EQ(Fetched(), (Words{"at", "cat", "suq"}));
    cSetMinWordSize(4);
    EXPECT_EQ(cCheckForAllDefinedWords(board), 0);
    for (const int size : {1, 17, 0, INT_MIN, INT_MAX}) {
        EXPECT_EQ(cSetMinWordSize(size), 0);
        EXPECT_EQ(cSetMaxWordSize(size), 0);
    }
    EXPECT_EQ(cMinWordSize(), 4);
    EXPECT_EQ(cMaxWordSize(), 3);
}

TEST_F(WordEngine, SavesAndLoadsWithTheMaximum) {
    const std::string file = folder_ / "Dictionary.dat";
    cSetMaxWordSize(3);
    cSetMinWordSize(5);
    ASSERT_EQ(cWriteBinaryDictionary(file.c_str()), 1);
    cDictionaryClear();
    cSetMaxWordSize(9);
    for (const char* bad : {"/dev/zero", "/", "/no/such/file", "/proc/self/maps"}) {
        EXPECT_EQ(cReadBinaryDictionary(bad), 0) << bad;
    }
    EXPECT_EQ(cReadBinaryDictionary(nullptr), 0);
    EXPECT_EQ(cMaxWordSize(), 9);
    ASSERT_EQ(cReadBinaryDictionary(file.c_str()), 1);
    EXPECT_EQ(cMaxWordSize(), 3);
    EXPECT_EQ(cMinWordSize(), 5);
    EXPECT_EQ(cNumberOfWords(), 7);
    EXPECT_EQ(Check("scat"), std::pair(1, 1));
    EXPECT_EQ(cReduceWordSize(), 1);
    EXPECT_EQ(cNumberOfWords(), 4);
    EXPECT_EQ(Check("scat"), std::pair(0, 0));
    EXPECT_EQ(cWriteBinaryDictionary(nullptr), 0);
    EXPECT_EQ(cWriteBinaryDictionary("/no/such/folder/file"), 0);
}

}  // namespace
