#include <quorle/word_engine.h>

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>

#include "support/program_fixture.h"

namespace {

class OptionsTest : public ProgramFixture {
  protected:
    OptionsTest() {
        makeDictionary({"cat", "cats", "elephants"});
        store("MinWordSize", "2");
        launch();
        press("Options");
    }

    /// Chooses in the three boxes where a text is given, and presses OK.
    void apply(const char* time, const char* minimum, const char* maximum) {
        press("Options");
        choose("TimeCombo", time);
        choose("MinWordSizeCombo", minimum);
        choose("WordSizeCombo", maximum);
        press("OKButton");
    }
    void choose(const char* box, const char* entry) {
        if (*entry != 0) control<QComboBox>(box)->setCurrentText(entry);
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
    choose("TimeCombo", "4:00");
    press("CancelButton");
    press("Options");
    choose("MinWordSizeCombo", "16 letters");
    control<QCheckBox>("SoundsOption")->click();
    closeByTitleBar("OptionsDialog");
    EXPECT_EQ(settings(), "180 2 16 -1");
    EXPECT_EQ(allStored(), " 2  ");
    press("Options");
    press("OKButton");
    EXPECT_FALSE(isShown("OptionsDialog"));
    EXPECT_EQ(settings(), "240 16 16 0");
    EXPECT_EQ(allStored(), "240 16 16 0");
    start();
    EXPECT_EQ(text("TimeLeft"), "4:00");
}

TEST_F(OptionsTest, AnotherMinimumStopsTheGameOnlyWhenThePlayerAgrees) {
    start();
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        boxes_.expect(
            "Changing the minimum word size now will stop the current game.  Are you sure you want "
            "to do this?",
            answer);
        apply("5:00", "4 letters", answer == QMessageBox::No ? "8 letters" : "");
        EXPECT_EQ(settings(), answer == QMessageBox::No ? "300 2 16 -1" : "300 4 16 -1");
        EXPECT_FALSE(isShown("Results"));
        bringToFront("Main");
        tick();
        EXPECT_EQ(isShown("Results"), answer == QMessageBox::Yes);
    }
    apply("", "5 letters", "");  // no game: nothing is asked
}

TEST_F(OptionsTest, ASmallerMaximumRemovesWordsOnlyWhenThePlayerAgrees) {
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        EXPECT_EQ(cNumberOfWords(), 3);
        EXPECT_FALSE(State.DictionaryChanged);
        boxes_.expect(
            "Are you sure you want to remove words longer than 8 letters from the dictionary?",
            answer);
        apply("", "", "8 letters");
        EXPECT_EQ(stored("MaxWordSize"), answer == QMessageBox::No ? "16" : "8");
    }
    EXPECT_EQ(cNumberOfWords(), 2);
    EXPECT_TRUE(State.DictionaryChanged);
    apply("", "", "9 letters");
    EXPECT_EQ(cMaxWordSize(), 9);
}

TEST_F(OptionsTest, ABoxWithoutASelectedEntryLeavesItsSettingAlone) {
    EXPECT_EQ(control<QComboBox>("MinWordSizeCombo")->currentIndex(), -1);
    auto& times = *control<QComboBox>("TimeCombo");
    for (const char* time : {"4:000", "4:00"}) {  // no entry, and one
        press("Options");
        bringToFront("OptionsDialog");
        times.setFocus();
        replaceAll("");
        type(time);
        key(Qt::Key_Return);
        EXPECT_EQ(times.count(), 7);
        press("OKButton");
        EXPECT_EQ(settings(), times.currentText() == "4:000" ? "180 2 16 -1" : "240 2 16 -1");
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
