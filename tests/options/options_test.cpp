#include <quorle/word_engine.h>

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>

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
    OptionsTest() {
        makeDictionary({"cat", "cats", "elephants"});
        store("MinWordSize", "2");
        launch();
        press("Options");
    }
    QComboBox& box(const char* name) { return *qobject_cast<QComboBox*>(control(name)); }
    void toggleSounds() { qobject_cast<QCheckBox*>(control("SoundsOption"))->click(); }

    /// Chooses where a text is given, and presses a button.
    void answer(const char* button, const char* time, const char* minimum, const char* maximum) {
        box("TimeCombo").setCurrentText(time);
        if (*minimum != 0) box("MinWordSizeCombo").setCurrentText(minimum);
        if (*maximum != 0) box("WordSizeCombo").setCurrentText(maximum);
        press(button);
    }
    std::string choices() {
        std::string all;
        for (const char* name : {"TimeCombo", "MinWordSizeCombo", "WordSizeCombo"}) {
            all += box(name).currentText().toStdString() + " ";
        }
        return all + std::to_string(control("SoundsOption")->property("checked").toBool());
    }
    static std::string settings() {
        return std::to_string(State.TimeLimit) + " " + std::to_string(cMinWordSize()) + " " +
               std::to_string(cMaxWordSize()) + " " + std::to_string(State.Sounds);
    }
    static std::string allStored() {
        return stored("TimeLimit") + " " + stored("MinWordSize") + " " + stored("MaxWordSize") +
               " " + stored("Sounds");
    }
};

TEST_F(OptionsTest, CancelAppliesNothingAndKeepsTheChoicesForOK) {
    answer("CancelButton", "0:15", "16 letters", "");
    press("Options");
    box("WordSizeCombo").setCurrentText("8 letters");
    toggleSounds();
    closeByTitleBar("OptionsDialog");
    EXPECT_EQ(settings(), "180 2 16 -1");
    EXPECT_EQ(allStored(), " 2  ");
    press("Options");
    EXPECT_EQ(choices(), "0:15 16 letters 8 letters 0");
    answer("OKButton", "4:00", "", "16 letters");
    EXPECT_FALSE(isShown("OptionsDialog"));
    EXPECT_EQ(settings(), "240 16 16 0");
    EXPECT_EQ(allStored(), "240 16 16 0");
    start(Board);
    EXPECT_EQ(text("TimeLeft"), "4:00");
}

TEST_F(OptionsTest, AnotherMinimumStopsTheGameOnlyWhenThePlayerAgrees) {
    start(Board);
    boxes_.expectQuestion(StopQuestion, QMessageBox::No);
    answer("OKButton", "5:00", "4 letters", "8 letters");
    EXPECT_EQ(settings(), "300 2 16 -1");
    EXPECT_EQ(State.TimeRemaining, 180);
    press("Options");
    boxes_.expectQuestion(StopQuestion, QMessageBox::Yes);
    answer("OKButton", "5:00", "4 letters", "");
    EXPECT_EQ(settings(), "300 4 16 -1");
    EXPECT_FALSE(isShown("Results"));
    bringToFront("Main");
    tick();
    EXPECT_TRUE(isShown("Results"));
    press("Options");
    press("OKButton");  // the same minimum: nothing is asked
}

TEST_F(OptionsTest, ASmallerMaximumRemovesWordsOnlyWhenThePlayerAgrees) {
    toggleSounds();
    boxes_.expectQuestion(RemoveQuestion, QMessageBox::No);
    answer("OKButton", "3:00", "", "8 letters");
    EXPECT_EQ(settings(), "180 2 16 -1");
    EXPECT_EQ(cNumberOfWords(), 3);
    EXPECT_FALSE(State.DictionaryChanged);
    press("Options");
    boxes_.expectQuestion(RemoveQuestion, QMessageBox::Yes);
    answer("OKButton", "3:00", "", "8 letters");
    EXPECT_EQ(stored("MaxWordSize"), "8");
    EXPECT_EQ(cNumberOfWords(), 2);
    EXPECT_TRUE(State.DictionaryChanged);
    press("Options");
    answer("OKButton", "3:00", "", "9 letters");
    EXPECT_EQ(cMaxWordSize(), 9);
}

TEST_F(OptionsTest, ABoxWithoutASelectedEntryLeavesItsSettingAlone) {
    EXPECT_EQ(box("MinWordSizeCombo").currentIndex(), -1);
    bringToFront("OptionsDialog");
    for (const char* time : {"4:000", "4:00"}) {  // no entry, and one
        box("TimeCombo").setFocus();
        box("TimeCombo").lineEdit()->selectAll();
        type(time);
        key(Qt::Key_Return);
        EXPECT_EQ(box("TimeCombo").currentText().toStdString(), time);
        EXPECT_EQ(box("TimeCombo").count(), 7);
        press("OKButton");
        EXPECT_EQ(settings(), time[4] == '0' ? "180 2 16 -1" : "240 2 16 -1");
        press("Options");
        bringToFront("OptionsDialog");
    }
}

TEST_F(OptionsTest, KeysWalkTheControlsAndPressNoButton) {
    for (const char* name : {"OKButton", "CancelButton", "TimeCombo", "WordSizeCombo",
                             "SoundsOption", "MinWordSizeCombo"}) {
        EXPECT_TRUE(control(name)->hasFocus()) << name;
        for (const Qt::Key pressed : {Qt::Key_Return, Qt::Key_Enter, Qt::Key_Escape}) key(pressed);
        EXPECT_TRUE(isShown("OptionsDialog")) << name;
        key(Qt::Key_Tab);
    }
}

}  // namespace
