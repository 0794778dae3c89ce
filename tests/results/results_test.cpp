// The end of a game, and what the player does with its results.
#include "support/program_fixture.h"

namespace {

class GameResults : public PlayedBoard {
  protected:
    /// Plays these words on a board that has 7 words of the dictionary, 7 points.
    void play(const Words& entered) {
        start();
        enter(entered);
        press("End");
    }
    /// The three lists, the selected words in brackets.
    std::string lists() {
        std::string all;
        for (const char* name : {"UserWords", "BadWords", "DictWords"}) {
            for (auto* item : control<QListWidget>(name)->findItems("*", Qt::MatchWildcard)) {
                const std::string word = item->text().toStdString();
                all += item->isSelected() ? "[" + word + "] " : word + " ";
            }
            all += "| ";
        }
        return all;
    }
    void take(const char* list, const char* word) {
        select(list, word);
        press(list == std::string("BadWords") ? "AddToDict" : "RemoveFromDict");
    }
};

TEST_F(GameResults, SortThePlayersWordsByTheDictionaryOfTheEnd) {
    start();
    enter({"won", "sta", "cat", "con"});
    cDictionaryRemove("won");
    cDictionaryAdd("con");
    press("End");
    EXPECT_EQ(lists(), "cat con | sta won | bone cat cats coat ten tone won | ");
    EXPECT_EQ(summary(),
              "2 words found out of 7 (28%). Score is 2 out of 7 (28%). 2 words not in dictionary");
}

TEST_F(GameResults, AddUpUntilTheWindowIsClosed) {
    play({"cat", "boned"});
    start("QITAKENSHORDGLUB");
    enter({"ten"});
    press("End");
    EXPECT_EQ(lists(), "cat ten | boned | bone cat cats coat ten ten tone won | ");
    EXPECT_EQ(text("ResultCubes0") + letters("ResultCubes"), "QuQITAKENSHORDGLUB");
    select("UserWords", "ten");
    EXPECT_EQ(litResults(), (Tiles{2, 5, 6}));
    select("BadWords", "boned");  // not on this board: its first letter stays marked
    EXPECT_EQ(litResults(), Tiles{15});
    select("UserWords", "cat");  // not even that: all as it was
    EXPECT_EQ(litResults(), Tiles{15});
    press("End");  // the last game once more
    EXPECT_EQ(litResults(), Tiles{});
    closeByTitleBar("Results");
    press("End");
    EXPECT_EQ(lists(), "ten | | ten | ");
}

TEST_F(GameResults, WordsGoIntoTheDictionaryAndOutOfIt) {
    play({"sta", "boned", "con", "cat"});
    control("BadWords")->setFocus();  // the first row is current then, but not selected
    for (const auto& [button, list] :
         {std::pair("AddToDict", "bad"), {"RemoveFromDict", "dictionary"}}) {
        boxes_.expect(std::string("You must select a word in the '") + list + "' list first");
        press(button);
    }
    take("BadWords", "con");
    EXPECT_EQ(lists(), "cat con | boned [sta] | bone cat cats coat con ten tone won | ");
    EXPECT_EQ(litResults(), (Tiles{1, 2, 3}));
    EXPECT_EQ(State.DictionaryChanged, True);
    EXPECT_EQ(lastTold(), "con added. " + summary());
    press("AddToDict");
    EXPECT_EQ(litResults(), (Tiles{4, 5, 6, 7, 11}));
    press("AddToDict");
    EXPECT_EQ(summary(),
              "4 words found out of 10 (40%). Score is 5 out of 11 (45%). "
              "0 words not in dictionary");
    take("DictWords", "cat");
    take("DictWords", "won");
    EXPECT_EQ(lastTold(), "won removed. " + summary());
    EXPECT_EQ(lists(), "boned con sta | cat won | bone boned cats coat con sta ten tone | ");
    EXPECT_EQ(cNumberOfWords(), 9 + 1);
    take("BadWords", "won");  // which was never entered
    EXPECT_EQ(lists(), "boned con sta | [cat] | bone boned cats coat con sta ten tone won | ");
}

TEST_F(GameResults, AWordTakenOutLeavesTheSelectionAsItWas) {
    play({"bone", "cat", "cats", "coat"});
    select("UserWords", "cat");
    take("DictWords", "cat");
    take("DictWords", "cats");  // the current one, unselected
    EXPECT_EQ(lists(), "bone coat | cat cats | bone coat ten tone won | ");
    select("UserWords", "coat");
    take("DictWords", "bone");
    EXPECT_EQ(lists(), "[coat] | bone cat cats | coat ten tone won | ");
}

TEST_F(GameResults, CloseOnlyAfterTwoSeconds) {
    play({"cat", "sta"});
    seconds_ += 2;
    key(Qt::Key_Return);
    EXPECT_TRUE(isShown("Results"));
    seconds_ += 0.1;
    control("DictWords")->setFocus();
    key(Qt::Key_Return);
    EXPECT_FALSE(isShown("Results"));
    EXPECT_EQ(lists() + summary(), "| | | . . ");
    EXPECT_TRUE(comesToFront("Main"));
}

}  // namespace
