#include <quorle/word_engine.h>

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QTest>

#include "dictionary/dictionary.h"
#include "support/program_fixture.h"

namespace {

const char* const StopQuestion =
    "Changing the minimum word size now will stop the current game.  Are you sure you want to do "
    "this?";
const char* const RemoveQuestion =
    "Are you sure you want to remove words longer than 8 letters from the dictionary?";
const char* const Board = "CATSBONEWILDHEFY";

class OptionsTest : public ProgramFixture {
  protected:
    OptionsTest() { makeDictionary({"cat", "cats", "elephants"}); }

    void open() {
        launch();
        press("Options");
    }

    QComboBox& box(const char* name) { return *qobject_cast<QComboBox*>(control(name)); }

    std::string shown(const char* name) { return box(name).currentText().toStdString(); }

    QCheckBox& sounds() { return *qobject_cast<QCheckBox*>(control("SoundsOption")); }

    void expectQuestion(const char* question, QMessageBox::StandardButton answer) {
        boxes_.expect("Quorle", question, QMessageBox::Yes | QMessageBox::No, answer);
    }

    void typeTime(const std::string& text) {
        box("TimeCombo").setFocus();
        box("TimeCombo").lineEdit()->selectAll();
        type(text);
    }
};

TEST_F(OptionsTest, OKAppliesAndSavesAllFour) {
    open();
    typeTime("4:00");
    box("MinWordSizeCombo").setCurrentText("16 letters");
    sounds().click();
    press("OKButton");
    EXPECT_FALSE(isShown("OptionsDialog"));
    EXPECT_EQ(stored("TimeLimit"), "240");
    EXPECT_EQ(stored("MinWordSize"), "16");
    EXPECT_EQ(stored("MaxWordSize"), "16");
    EXPECT_EQ(stored("Sounds"), "0");
    start(Board);
    EXPECT_EQ(text("TimeLeft"), "4:00");
}

TEST_F(OptionsTest, CancelAppliesNothingAndKeepsTheChoices) {
    open();
    box("TimeCombo").setCurrentText("0:15");
    box("MinWordSizeCombo").setCurrentText("5 letters");
    press("CancelButton");
    press("Options");
    box("WordSizeCombo").setCurrentText("8 letters");
    sounds().click();
    closeByTitleBar("OptionsDialog");
    EXPECT_EQ(State.TimeLimit, 180);
    EXPECT_EQ(cMaxWordSize(), 16);
    EXPECT_EQ(stored("TimeLimit"), "");
    press("Options");
    EXPECT_EQ(shown("TimeCombo"), "0:15");
    EXPECT_EQ(shown("MinWordSizeCombo"), "5 letters");
    EXPECT_EQ(shown("WordSizeCombo"), "8 letters");
    EXPECT_FALSE(sounds().isChecked());
}

TEST_F(OptionsTest, AnotherMinimumStopsTheGameOnlyWhenThePlayerAgrees) {
    open();
    start(Board);
    box("TimeCombo").setCurrentText("5:00");
    box("MinWordSizeCombo").setCurrentText("4 letters");
    box("WordSizeCombo").setCurrentText("8 letters");
    expectQuestion(StopQuestion, QMessageBox::No);
    press("OKButton");
    EXPECT_EQ(cMinWordSize(), 3);
    EXPECT_EQ(cMaxWordSize(), 16);
    EXPECT_EQ(State.TimeLimit, 300);
    EXPECT_EQ(State.TimeRemaining, 180);
    press("Options");
    EXPECT_EQ(shown("MinWordSizeCombo"), "3 letters");
    press("OKButton");
    press("Options");
    box("MinWordSizeCombo").setCurrentText("4 letters");
    expectQuestion(StopQuestion, QMessageBox::Yes);
    press("OKButton");
    EXPECT_EQ(cMinWordSize(), 4);
    EXPECT_FALSE(isShown("Results"));
    bringToFront("Main");
    tick();
    EXPECT_TRUE(isShown("Results"));
}

TEST_F(OptionsTest, ASmallerMaximumRemovesWordsOnlyWhenThePlayerAgrees) {
    open();
    sounds().click();
    box("WordSizeCombo").setCurrentText("8 letters");
    expectQuestion(RemoveQuestion, QMessageBox::No);
    press("OKButton");
    EXPECT_EQ(cMaxWordSize(), 16);
    EXPECT_TRUE(Dictionary::IsInDictionary("elephants"));
    EXPECT_TRUE(State.Sounds);
    EXPECT_FALSE(State.DictionaryChanged);
    press("Options");
    box("WordSizeCombo").setCurrentText("8 letters");
    expectQuestion(RemoveQuestion, QMessageBox::Yes);
    press("OKButton");
    EXPECT_EQ(stored("MaxWordSize"), "8");
    EXPECT_FALSE(Dictionary::IsInDictionary("elephants"));
    EXPECT_TRUE(State.DictionaryChanged);
    press("Options");
    box("WordSizeCombo").setCurrentText("9 letters");
    press("OKButton");
    EXPECT_EQ(cMaxWordSize(), 9);
}

TEST_F(OptionsTest, ABoxWithoutASelectedEntryLeavesItsSettingAlone) {
    store("MinWordSize", "2");
    open();
    EXPECT_EQ(box("MinWordSizeCombo").currentIndex(), -1);
    start(Board);
    bringToFront("OptionsDialog");
    typeTime("4:000");
    key(Qt::Key_Return);
    EXPECT_EQ(shown("TimeCombo"), "4:000");
    EXPECT_EQ(box("TimeCombo").currentIndex(), -1);
    EXPECT_EQ(box("TimeCombo").count(), 7);
    sounds().click();
    press("OKButton");
    EXPECT_EQ(State.TimeLimit, 180);
    EXPECT_EQ(cMinWordSize(), 2);
    EXPECT_FALSE(State.Sounds);
}

TEST_F(OptionsTest, KeysWalkTheControlsAndPressNoButton) {
    open();
    for (const char* name : {"OKButton", "CancelButton", "TimeCombo", "WordSizeCombo",
                             "SoundsOption", "MinWordSizeCombo"}) {
        EXPECT_TRUE(control(name)->hasFocus()) << name;
        for (const Qt::Key pressed : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_Escape}) key(pressed);
        EXPECT_TRUE(isShown("OptionsDialog")) << name;
        key(Qt::Key_Tab);
    }
}

}  // namespace
