// The end of a game, and what the player does with its results.
#include <quorle/word_engine.h>

#include <QLabel>
#include <QListWidget>
#include <QScreen>

#include "support/program_fixture.h"

namespace {

class GameResults : public PlayedBoard {
  protected:
    /// Plays these words on a board that has 7 words of the dictionary, 7 points.
    void play(const Words& entered) {
        start("CATSBONEWILDHEFY");
        for (const std::string& word : entered) {
            type(word);
            key(Qt::Key_Return);
        }
        EXPECT_EQ(words().size(), entered.size());
    }
    void playToTheEnd(const Words& entered) {
        play(entered);
        press("End");
    }
    std::string summary() {
        return text("WordsLabel") + "; " + text("ScoreLabel") + "; " + text("BadWordsLabel");
    }
    std::string selectedIn(const std::string& list) {
        const auto selected = qobject_cast<QListWidget*>(control(list))->selectedItems();
        return selected.isEmpty() ? "" : selected.first()->text().toStdString();
    }
    void expectMessage(const std::string& text) {
        boxes_.expect("Quorle", text, QMessageBox::Ok, QMessageBox::Ok);
    }
};

const Words ComputersWords{"bone", "cat", "cats", "coat", "ten", "tone", "won"};

TEST_F(GameResults, SortThePlayersWordsByTheDictionaryOfTheEnd) {
    play({"won", "sta", "cat", "con"});
    cDictionaryRemove("won");
    cDictionaryAdd("con");
    press("End");
    EXPECT_EQ(words("UserWords"), (Words{"cat", "con"}));
    EXPECT_EQ(words("BadWords"), (Words{"sta", "won"}));
    EXPECT_EQ(words("DictWords"), ComputersWords);
    EXPECT_EQ(summary(),
              "2 words found out of 7 (28%); Score is 2 out of 7 (28%); 2 words not in dictionary");
    EXPECT_EQ(control("Results")->windowTitle().toStdString(), "Gorvat Results");
    EXPECT_EQ(control("Results")->size(), QSize(632, 562));
    const QRect screen = control("Results")->screen()->availableGeometry();
    EXPECT_TRUE(screen.contains(control("Results")->frameGeometry()));
    EXPECT_TRUE(comesToFront("Results"));
}

TEST_F(GameResults, EndWhileIdleShowsWhatThereIs) {
    press("End");
    EXPECT_EQ(letters("ResultCubes"), std::string(16, '.'));
    EXPECT_EQ(summary(), "0 words found; Score is 0; 0 words not in dictionary");
    start("QITAKENSHORDGLUB");
    EXPECT_EQ(letters("ResultCubes"), std::string(16, '.'));
    press("End");
    EXPECT_EQ(letters("ResultCubes"), "QuITAKENSHORDGLUB");
    EXPECT_EQ(dynamic_cast<QLabel*>(control("ResultCubes0"))->text(), "Qu");
}

TEST_F(GameResults, TwoGamesAddUpUntilTheWindowIsClosed) {
    playToTheEnd({"cat", "boned"});
    start("QITAKENSHORDGLUB");
    type("ten");
    key(Qt::Key_Return);
    press("End");
    EXPECT_EQ(words("UserWords"), (Words{"cat", "ten"}));
    EXPECT_EQ(words("DictWords"),
              (Words{"bone", "cat", "cats", "coat", "ten", "ten", "tone", "won"}));
    EXPECT_EQ(letters("ResultCubes"), "QuITAKENSHORDGLUB");
    select("DictWords", "tone");
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
    EXPECT_EQ(words("UserWords"), Words{"ten"});
    EXPECT_EQ(
        summary(),
        "1 word found out of 1 (100%); Score is 1 out of 1 (100%); 0 words not in dictionary");
}

TEST_F(GameResults, SelectingAWordLightsItsChain) {
    playToTheEnd({"cat", "bone"});
    select("DictWords", "coat");
    EXPECT_EQ(litResults(), (Tiles{0, 1, 2, 5}));
    select("UserWords", "bone");
    EXPECT_EQ(litResults(), (Tiles{4, 5, 6, 7}));
    const auto colour = [this](int k) {
        return control("ResultCubes" + std::to_string(k))->palette().color(QPalette::Window);
    };
    EXPECT_EQ(colour(4), QColor(128, 255, 128));
    EXPECT_EQ(colour(0), QColor(255, 192, 128));
    select("DictWords", "coat");  // selected already
    EXPECT_EQ(litResults(), (Tiles{0, 1, 2, 5}));
    key(Qt::Key_Down);
    EXPECT_EQ(selectedIn("DictWords"), "ten");
    EXPECT_EQ(litResults(), (Tiles{2, 6, 7}));
    EXPECT_EQ(litTiles(), Tiles{});
}

TEST_F(GameResults, BadWordsGoIntoTheDictionary) {
    playToTheEnd({"sta", "boned", "con"});
    control("BadWords")->setFocus();  // the first row is current then, but not selected
    expectMessage("You must select a word in the 'bad' list first");
    press("AddToDict");
    EXPECT_EQ(State.DictionaryChanged, False);
    select("BadWords", "con");
    press("AddToDict");
    EXPECT_EQ(selectedIn("BadWords"), "sta");
    EXPECT_EQ(litResults(), (Tiles{1, 2, 3}));
    EXPECT_EQ(words("UserWords"), Words{"con"});
    EXPECT_EQ(State.DictionaryChanged, True);
    press("AddToDict");
    EXPECT_EQ(selectedIn("BadWords"), "boned");
    EXPECT_EQ(litResults(), (Tiles{4, 5, 6, 7, 11}));
    press("AddToDict");
    EXPECT_EQ(words("BadWords"), Words{});
    EXPECT_EQ(words("UserWords"), (Words{"boned", "con", "sta"}));
    EXPECT_EQ(words("DictWords"),
              (Words{"bone", "boned", "cat", "cats", "coat", "con", "sta", "ten", "tone", "won"}));
    EXPECT_EQ(
        summary(),
        "3 words found out of 10 (30%); Score is 4 out of 11 (36%); 0 words not in dictionary");
    EXPECT_EQ(cNumberOfWords(), 9 + 3);
    expectMessage("You must select a word in the 'bad' list first");
    press("AddToDict");
}

TEST_F(GameResults, ComputersWordsGoOutOfTheDictionaryAndBack) {
    playToTheEnd({"cat", "ten"});
    control("DictWords")->setFocus();
    expectMessage("You must select a word in the 'dictionary' list first");
    press("RemoveFromDict");
    select("UserWords", "ten");
    select("DictWords", "cat");
    press("RemoveFromDict");
    EXPECT_EQ(words("UserWords"), Words{"ten"});
    EXPECT_EQ(selectedIn("UserWords"), "ten");
    EXPECT_EQ(selectedIn("DictWords"), "");
    EXPECT_EQ(words("BadWords"), Words{"cat"});
    select("DictWords", "won");
    press("RemoveFromDict");
    EXPECT_EQ(words("BadWords"), (Words{"cat", "won"}));
    EXPECT_EQ(cNumberOfWords(), 9 - 2);
    EXPECT_EQ(State.DictionaryChanged, True);
    EXPECT_EQ(summary(),
              "1 word found out of 5 (20%); Score is 1 out of 5 (20%); 2 words not in dictionary");
    expectMessage("You must select a word in the 'dictionary' list first");
    press("RemoveFromDict");
    for (const char* word : {"won", "cat"}) {
        select("BadWords", word);
        press("AddToDict");
    }
    EXPECT_EQ(words("UserWords"), (Words{"cat", "ten"}));  // won was never entered
    EXPECT_EQ(words("DictWords"), ComputersWords);
}

TEST_F(GameResults, CloseOnlyAfterTwoSeconds) {
    playToTheEnd({"cat", "sta"});
    key(Qt::Key_Escape);
    seconds_ += 2;
    key(Qt::Key_Return);
    press("ResultsOK");
    EXPECT_TRUE(isShown("Results"));
    EXPECT_EQ(words("UserWords"), Words{"cat"});
    seconds_ += 0.1;
    control("DictWords")->setFocus();
    key(Qt::Key_Return);
    EXPECT_FALSE(isShown("Results"));
    for (const char* list : {"UserWords", "BadWords", "DictWords"}) {
        EXPECT_EQ(words(list), Words{}) << list;
    }
    EXPECT_EQ(summary(), "; ; ");
    EXPECT_EQ(letters("ResultCubes"), "CATSBONEWILDHEFY");
    EXPECT_TRUE(comesToFront("Main"));
    playToTheEnd({"won"});
    EXPECT_EQ(words("UserWords"), Words{"won"});
}

}  // namespace
