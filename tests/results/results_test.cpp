// The end of a game, and what the player does with its results.
#include <quorle/word_engine.h>

#include <QListWidget>
#include <QScreen>

#include "support/program_fixture.h"

namespace {

class GameResults : public PlayedBoard {
  protected:
    /// Plays these words on a board that has 7 words of the dictionary, 7 points.
    void play(const Words& entered) {
        start("CATSBONEWILDHEFY");
        enter(entered);
        press("End");
    }
    /// The three lists, the selected words in brackets.
    std::string lists() {
        std::string all;
        for (const char* name : {"UserWords", "BadWords", "DictWords"}) {
            const auto& list = *qobject_cast<QListWidget*>(control(name));
            for (int i = 0; i < list.count(); ++i) {
                const std::string word = list.item(i)->text().toStdString();
                all += list.item(i)->isSelected() ? "[" + word + "] " : word + " ";
            }
            all += "| ";
        }
        return all;
    }
    void pressAndExpect(const char* button, const std::string& list) {
        boxes_.expectMessage("You must select a word in the \'" + list + "\' list first");
        press(button);
    }
};

TEST_F(GameResults, SortThePlayersWordsByTheDictionaryOfTheEnd) {
    start("CATSBONEWILDHEFY");
    enter({"won", "sta", "cat", "con"});
    cDictionaryRemove("won");
    cDictionaryAdd("con");
    press("End");
    EXPECT_EQ(lists(), "cat con | sta won | bone cat cats coat ten tone won | ");
    EXPECT_EQ(summary(),
              "2 words found out of 7 (28%); Score is 2 out of 7 (28%); 2 words not in dictionary");
    EXPECT_EQ(control("Results")->windowTitle().toStdString(), "Gorvat Results");
    const QRect screen = control("Results")->screen()->availableGeometry();
    EXPECT_TRUE(screen.contains(control("Results")->frameGeometry()));
    EXPECT_TRUE(comesToFront("Results"));
}

TEST_F(GameResults, AddUpUntilTheWindowIsClosed) {
    press("End");  // while idle
    EXPECT_EQ(letters("ResultCubes"), std::string(16, '.'));
    EXPECT_EQ(summary(), "0 words found; Score is 0; 0 words not in dictionary");
    play({"cat", "boned"});
    start("QITAKENSHORDGLUB");
    EXPECT_EQ(letters("ResultCubes"), "CATSBONEWILDHEFY");
    enter({"ten"});
    press("End");
    EXPECT_EQ(lists(), "cat ten | boned | bone cat cats coat ten ten tone won | ");
    EXPECT_EQ(text("ResultCubes0") + letters("ResultCubes"), "QuQuITAKENSHORDGLUB");
    select("UserWords", "ten");
    EXPECT_EQ(litResults(), (Tiles{2, 5, 6}));
    select("BadWords", "boned");  // not on this board: its first letter stays marked
    EXPECT_EQ(litResults(), Tiles{15});
    select("UserWords", "cat");  // not even that: all as it was
    EXPECT_EQ(litResults(), Tiles{15});
    press("End");  // the last game once more
    EXPECT_EQ(words("UserWords"), (Words{"cat", "ten", "ten"}));
    EXPECT_EQ(litResults(), Tiles{});
    closeByTitleBar("Results");
    press("End");
    EXPECT_EQ(lists(), "ten | | ten | ");
    EXPECT_EQ(summary(),
              "1 word found out of 1 (100%); Score is 1 out of 1 (100%); "
              "0 words not in dictionary");
}

TEST_F(GameResults, SelectingAWordLightsItsChain) {
    play({"cat", "bone"});
    for (int i = 0; i < 2; ++i) {  // the second time it is selected already
        select("DictWords", "coat");
        EXPECT_EQ(litResults(), (Tiles{0, 1, 2, 5}));
        EXPECT_NE(control("ResultCubes5")->palette(), control("ResultCubes4")->palette());
        select("UserWords", "bone");
        EXPECT_EQ(litResults(), (Tiles{4, 5, 6, 7}));
    }
    control("DictWords")->setFocus();
    key(Qt::Key_Down);
    EXPECT_EQ(litResults(), (Tiles{2, 6, 7}));
}

TEST_F(GameResults, WordsGoIntoTheDictionaryAndOutOfIt) {
    play({"sta", "boned", "con", "cat"});
    control("BadWords")->setFocus();  // the first row is current then, but not selected
    pressAndExpect("AddToDict", "bad");
    EXPECT_EQ(State.DictionaryChanged, False);
    select("BadWords", "con");
    press("AddToDict");
    EXPECT_EQ(lists(), "cat con | boned [sta] | bone cat cats coat con ten tone won | ");
    EXPECT_EQ(litResults(), (Tiles{1, 2, 3}));
    EXPECT_EQ(State.DictionaryChanged, True);
    press("AddToDict");
    EXPECT_EQ(litResults(), (Tiles{4, 5, 6, 7, 11}));
    press("AddToDict");
    EXPECT_EQ(lists(), "boned cat con sta | | bone boned cat cats coat con sta ten tone won | ");
    EXPECT_EQ(summary(),
              "4 words found out of 10 (40%); Score is 5 out of 11 (45%); "
              "0 words not in dictionary");
    EXPECT_EQ(cNumberOfWords(), 9 + 3);
    pressAndExpect("AddToDict", "bad");
    control("DictWords")->setFocus();
    pressAndExpect("RemoveFromDict", "dictionary");
    for (const char* word : {"cat", "won"}) {
        select("UserWords", "con");
        select("DictWords", word);
        press("RemoveFromDict");
    }
    EXPECT_EQ(lists(), "boned [con] sta | cat won | bone boned cats coat con sta ten tone | ");
    EXPECT_EQ(cNumberOfWords(), 9 + 1);
    EXPECT_EQ(text("BadWordsLabel"), "2 words not in dictionary");
    pressAndExpect("RemoveFromDict", "dictionary");
    for (const char* word : {"won", "cat"}) {  // won was never entered
        select("BadWords", word);
        press("AddToDict");
    }
    EXPECT_EQ(lists(), "boned cat [con] sta | | bone boned cat cats coat con sta ten tone won | ");
}

TEST_F(GameResults, AWordTakenOutLeavesTheSelectionAsItWas) {
    play({"cat", "cats", "coat"});
    select("UserWords", "cat");
    for (const char* word : {"cat", "cats"}) {  // the second is the current one, unselected
        select("DictWords", word);
        press("RemoveFromDict");
        EXPECT_EQ(lists().find('['), std::string::npos) << lists();
    }
    select("UserWords", "coat");
    select("DictWords", "bone");
    press("RemoveFromDict");
    EXPECT_EQ(lists(), "[coat] | bone cat cats | coat ten tone won | ");
}

TEST_F(GameResults, CloseOnlyAfterTwoSeconds) {
    play({"cat", "sta"});
    key(Qt::Key_Escape);
    seconds_ += 2;
    key(Qt::Key_Return);
    press("ResultsOK");
    EXPECT_TRUE(isShown("Results"));
    seconds_ += 0.1;
    control("DictWords")->setFocus();
    key(Qt::Key_Return);
    EXPECT_FALSE(isShown("Results"));
    EXPECT_EQ(lists() + summary(), "| | | ; ; ");
    EXPECT_TRUE(comesToFront("Main"));
}

}  // namespace
