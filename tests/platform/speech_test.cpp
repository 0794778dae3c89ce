// What a screen reader is told while a game is played without looking.
#include "support/program_fixture.h"

namespace {

const std::string Rows = "C, A, T, S. B, O, N, E. W, I, L, D. H, E, F, Y";

class Heard : public PlayedBoard {
  protected:
    /// What was told since the last call.
    Words heard() { return std::exchange(told_, {}); }
    Words entering(const std::string& word) {
        enter({word});
        return heard();
    }
};

TEST_F(Heard, TheBoardThenWhatBecomesOfEachLetterAndWord) {
    key(Qt::Key_F2);
    EXPECT_EQ(heard(), Words{"No game. Alt S starts one"});
    start();
    EXPECT_EQ(heard(), Words{Rows + ". Quorle found 7 words. 3 minutes"});
    EXPECT_EQ(entering("cat"), Words{"right. 1 word entered"});
    EXPECT_EQ(entering("cat"), Words{"already listed"});
    EXPECT_EQ(entering("sta"), Words{"not in dictionary. 2 words entered"});
    const auto& struck = *control<QTableWidget>("WordList")->item(0, 0);
    EXPECT_EQ(struck.data(Qt::AccessibleDescriptionRole), "not in dictionary");
    EXPECT_EQ(entering("ca"), Words{"too short"});
    type("x");
    EXPECT_EQ(heard(), Words{"x taken off"});
    for (int i = 0; i < 3; ++i) press("Clear");  // at the third, nothing is left
    EXPECT_EQ(heard(), (Words{"a taken off", "c taken off"}));
    tick();
    key(Qt::Key_F2);
    EXPECT_EQ(heard(), Words{"2 minutes 59 seconds left. 2 words entered. " + Rows});
    tick(178);
    EXPECT_EQ(heard(), (Words{"1 minute left", "30 seconds left", "10 seconds left"}));
}

TEST_F(Heard, TheSummaryThenAResultsPlaces) {
    start();
    enter({"cat", "sta"});
    tick(180);
    EXPECT_TRUE(comesToFront("Results"));
    EXPECT_TRUE(control("ResultsOK")->hasFocus());
    EXPECT_EQ(description("ResultsOK"), "Time is up. " + summary());
    select("BadWords", "sta");
    EXPECT_EQ(
        control<QListWidget>("BadWords")->selectedItems()[0]->data(Qt::AccessibleDescriptionRole),
        "not in dictionary, row 1 column 4, row 1 column 3, row 1 column 2");
    press("End");
    EXPECT_EQ(control("Results")->focusWidget(), control("ResultsOK"));
}

TEST_F(Heard, WhatIsChosenInABox) {
    constexpr bool ToolkitTellsBoxes = QT_VERSION >= QT_VERSION_CHECK(6, 8, 0);
    for (const auto& [opens, box] :
         {std::pair("Options", "MinWordSizeCombo"), {"Dictionary", "StartingLetters"}}) {
        press(opens);
        EXPECT_EQ(heard(), Words{});
        bringToFront(box);
        control(box)->setFocus();
        key(Qt::Key_Down);
        const std::string value = control<QComboBox>(box)->currentText().toStdString();
        EXPECT_EQ(heard(), ToolkitTellsBoxes ? Words{} : Words{value});
        EXPECT_TRUE(ToolkitTellsBoxes || description(box).starts_with(value + ". "));
    }
}

// A reader follows the current cell, so it must not move while words are typed; and
// it says a row that becomes the current one.
TEST_F(Heard, NoRowWhileTypingAndTheOnlyOneOfAListWhenReached) {
    start();
    const QSignalSpy moved(control<QTableWidget>("WordList")->selectionModel(),
                           &QItemSelectionModel::currentChanged);
    enter({"cat"});
    EXPECT_EQ(moved.count(), 0);
    EXPECT_TRUE(control("NewWord")->hasFocus());
    press("End");
    auto& words = *control<QListWidget>("UserWords");
    words.setFocus();
    QSignalSpy reached(&words, &QListWidget::currentRowChanged);
    key(Qt::Key_Down);
    EXPECT_EQ(reached.value(1).value(0), 0);  // after none was
    EXPECT_EQ(litResults(), (Tiles{0, 1, 2}));
    control("ResultsOK")->setFocus();
    reached.clear();
    words.setFocus();
    ASSERT_TRUE(QTest::qWaitFor([&] { return reached.count() == 2; }));
    EXPECT_EQ(reached.last().first(), 0);
}

}  // namespace
