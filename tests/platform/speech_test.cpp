// What a screen reader is told while a game is played without looking.
#include <QAccessible>
#include <QApplication>
#include <QListWidget>
#include <QSignalSpy>
#include <QTableWidget>
#include <QTest>

#include "platform/platform.h"
#include "support/program_fixture.h"

namespace {

constexpr const char* Rows = "C, A, T, S. B, O, N, E. W, I, L, D. H, E, F, Y";

constexpr bool ToolkitTellsBoxes = QT_VERSION >= QT_VERSION_CHECK(6, 8, 0);

class Heard : public PlayedBoard {
  protected:
    /// What was told since the last call.
    Words heard() { return std::exchange(told_, {}); }
    Words entering(const std::string& word) {
        enter({word});
        return heard();
    }
    /// What is told of a box where the toolkit does not tell it already.
    static Words unlessToolkit(const std::string& value) {
        return ToolkitTellsBoxes ? Words{} : Words{value};
    }
    static std::string description(QWidget* control) {
        return QAccessible::queryAccessibleInterface(control)
            ->text(QAccessible::Description)
            .toStdString();
    }
    std::string selectedRow(const std::string& list) {
        auto& words = *qobject_cast<QListWidget*>(control(list));
        const auto selected = words.selectedItems();
        if (selected.isEmpty()) return "none";
        const QString places = selected.first()->data(Qt::AccessibleDescriptionRole).toString();
        return (selected.first()->text() + ": " + places).toStdString();
    }
};

TEST_F(Heard, TheBoardThenWhatBecomesOfEachLetterAndWord) {
    key(Qt::Key_F2);
    EXPECT_EQ(heard(), Words{"No game. Alt S starts one"});
    start("CATSBONEWILDHEFY");
    EXPECT_EQ(heard(), Words{std::string(Rows) + ". Quorle found 7 words. 3 minutes"});
    EXPECT_EQ(entering("cat"), Words{"right. 1 word entered"});
    EXPECT_EQ(entering("cat"), Words{"already listed"});
    EXPECT_EQ(entering("sta"), Words{"not in dictionary. 2 words entered"});
    EXPECT_EQ(entering("ca"), Words{"too short"});
    type("x");
    EXPECT_EQ(heard(), Words{"x taken off"});
    for (int i = 0; i < 3; ++i) press("Clear");  // at the third, nothing is left
    EXPECT_EQ(heard(), (Words{"a taken off", "c taken off"}));
    tick();
    key(Qt::Key_F2);
    EXPECT_EQ(heard(), Words{std::string("2 minutes 59 seconds left. 2 words entered. ") + Rows});
    EXPECT_EQ(typed(), "");
}

TEST_F(Heard, TheTimeAndAtItsEndTheSummary) {
    start("CATSBONEWILDHEFY");
    heard();
    tick(179);
    EXPECT_EQ(heard(), (Words{"1 minute left", "30 seconds left", "10 seconds left"}));
    tick();
    for (const char* game : {"first", "second"}) {
        SCOPED_TRACE(game);
        EXPECT_EQ(control("Results")->focusWidget(), control("ResultsOK"));
        select("DictWords", "cat");  // takes the focus along
        seconds_ += 3;
        press("ResultsOK");
        start("CATSBONEWILDHEFY");
        press("End");
    }
    EXPECT_EQ(description(control("ResultsOK")),
              "Game over. 0 words found out of 7 (0%). Score is 0 out of 7 (0%). "
              "0 words not in dictionary");
}

TEST_F(Heard, AResultsPlacesAndItsCorrection) {
    start("CATSBONEWILDHEFY");
    enter({"cat", "sta"});
    tick(180);
    EXPECT_TRUE(comesToFront("Results"));
    EXPECT_EQ(description(control("ResultsOK")).substr(0, 12), "Time is up. ");
    control("BadWords")->setFocus();
    key(Qt::Key_Down);
    EXPECT_EQ(selectedRow("BadWords"),
              "sta: not in dictionary, row 1 column 4, row 1 column 3, row 1 column 2");
    heard();
    press("AddToDict");
    EXPECT_EQ(heard(), Words{"sta added. 2 words found out of 8 (25%). Score is 2 out of 8 (25%). "
                             "0 words not in dictionary"});
    select("DictWords", "cat");
    EXPECT_EQ(selectedRow("DictWords"), "cat: row 1 column 1, row 1 column 2, row 1 column 3");
    press("RemoveFromDict");
    EXPECT_EQ(heard(), Words{"cat removed. 1 word found out of 7 (14%). Score is 1 out of 7 (14%). "
                             "1 word not in dictionary"});
}

TEST_F(Heard, OptionsAndTheEditorsWords) {
    press("Options");
    control("WordSizeCombo")->setFocus();
    key(Qt::Key_Up);
    EXPECT_EQ(heard(), unlessToolkit("15 letters"));
    if (!ToolkitTellsBoxes) {
        EXPECT_EQ(description(control("WordSizeCombo")).substr(0, 11), "15 letters.");
        EXPECT_EQ(description(control("MinWordSizeCombo")).substr(0, 10), "3 letters.");
    }
    press("Dictionary");
    EXPECT_EQ(heard(), Words{});
    control("StartingLetters")->setFocus();
    key(Qt::Key_Down);
    EXPECT_EQ(heard(), unlessToolkit("CA"));
    control("DictionaryEditor/NewWord")->setFocus();
    EXPECT_EQ(entering("zoo"), Words{"zoo added. 10 words"});
    select("DictionaryEditor/WordList", "cat");
    press("Remove");
    EXPECT_EQ(heard(), Words{"cat removed. 9 words"});
    folder_.write("words", "ant\nowl\n");
    Platform::ChooseFileToOpen = [this](const std::string&) { return folder_ / "words"; };
    menu("DictionaryEditor/Merge");
    EXPECT_EQ(heard(), Words{"merged. 11 words"});
    EXPECT_EQ(control("DictionaryEditor")->focusWidget(), control("DictionaryEditor/NewWord"));
}

// A reader follows the current cell, so it must not move while words are typed.
TEST_F(Heard, TheTextBoxKeepsTheReader) {
    start("CATSBONEWILDHEFY");
    const auto& cells = *qobject_cast<QTableWidget*>(control("WordList"))->selectionModel();
    const QSignalSpy moved(&cells, &QItemSelectionModel::currentChanged);
    enter({"cat", "cast"});
    EXPECT_EQ(moved.count(), 0);
    EXPECT_EQ(QApplication::focusWidget(), control("NewWord"));
}

// It says a row that becomes the current one.
TEST_F(Heard, TheOnlyWordOfAListIsReachedAndWithTheFocusReachedAgain) {
    start("CATSBONEWILDHEFY");
    enter({"cat"});
    press("End");
    auto& words = *qobject_cast<QListWidget*>(control("UserWords"));
    control("UserWords")->setFocus();
    QCoreApplication::processEvents();
    QSignalSpy reached(&words, &QListWidget::currentRowChanged);
    key(Qt::Key_Down);
    EXPECT_EQ(reached.last().first(), 0);
    control("ResultsOK")->setFocus();
    reached.clear();
    words.setFocus();
    EXPECT_TRUE(QTest::qWaitFor([&] { return reached.count() == 2; }));
    EXPECT_EQ(reached.last().first(), 0);
    EXPECT_EQ(selectedRow("UserWords").substr(0, 4), "cat:");
}

TEST_F(Heard, TheLinksOfTheHelp) {
    folder_.write("program/Quorle.htm", "<p>Help</p><p><a href=\"#end\">the end</a></p>");
    press("HelpButton");
    bringToFront("HelpBrowser");
    key(Qt::Key_Tab);
    EXPECT_EQ(heard(), Words{"link the end"});
}

}  // namespace
