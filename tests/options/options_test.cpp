#include <map>

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

    /// Opens the window, chooses in the boxes named and presses a button.
    void choose(const std::map<std::string, const char*>& choices, const char* button) {
        press("Options");
        for (const auto& [box, entry] : choices) control<QComboBox>(box)->setCurrentText(entry);
        press(button);
    }
    static std::string settings() {
        return std::to_string(State.TimeLimit) + " " + std::to_string(cMinWordSize()) + " " +
               std::to_string(cMaxWordSize()) + " " + std::to_string(State.Sounds);
    }
};

TEST_F(OptionsTest, CancelAppliesNothingAndKeepsTheChoicesForOK) {
    choose({{"TimeCombo", "4:00"}}, "CancelButton");
    choose({{"MinWordSizeCombo", "16 letters"}}, "SoundsOption");
    closeByTitleBar("OptionsDialog");
    EXPECT_EQ(settings() + stored("TimeLimit"), "180 2 16 -1");
    choose({}, "OKButton");
    EXPECT_FALSE(isShown("OptionsDialog"));
    EXPECT_EQ(settings(), "240 16 16 0");
    EXPECT_EQ(stored("TimeLimit") + " " + stored("MinWordSize") + " " + stored("Sounds"),
              "240 16 0");
    start();
    EXPECT_EQ(text("TimeLeft"), "4:00");
}

TEST_F(OptionsTest, AnotherMinimumStopsTheGameOnlyWhenThePlayerAgrees) {
    start();
    for (const bool agrees : {false, true}) {
        boxes_.expect(
            "Changing the minimum word size now will stop the current game.  Are you sure you want "
            "to do this?",
            agrees ? QMessageBox::Yes : QMessageBox::No);
        choose({{"TimeCombo", "5:00"},
                {"MinWordSizeCombo", "4 letters"},
                {"WordSizeCombo", agrees ? "16 letters" : "8 letters"}},
               "OKButton");
        EXPECT_EQ(settings(), agrees ? "300 4 16 -1" : "300 2 16 -1");
        EXPECT_FALSE(isShown("Results"));
        bringToFront("Main");
        tick();
        EXPECT_EQ(isShown("Results"), agrees);
    }
}

TEST_F(OptionsTest, ASmallerMaximumRemovesWordsOnlyWhenThePlayerAgrees) {
    for (const bool agrees : {false, true}) {
        EXPECT_EQ(cNumberOfWords(), 3);
        EXPECT_FALSE(State.DictionaryChanged);
        boxes_.expect(
            "Are you sure you want to remove words longer than 8 letters from the dictionary?",
            agrees ? QMessageBox::Yes : QMessageBox::No);
        choose({{"WordSizeCombo", "8 letters"}}, "OKButton");
        EXPECT_EQ(stored("MaxWordSize"), agrees ? "8" : "16");
        EXPECT_EQ(text("WordSizeCombo", "currentText"), agrees ? "8 letters" : "16 letters");
    }
    EXPECT_EQ(cNumberOfWords(), 2);
    EXPECT_TRUE(State.DictionaryChanged);
    choose({{"WordSizeCombo", "9 letters"}}, "OKButton");
    EXPECT_EQ(cMaxWordSize(), 9);
}

TEST_F(OptionsTest, ABoxWithoutASelectedEntryLeavesItsSettingAlone) {
    for (const std::string time : {"4:0", "4:00"}) {  // no entry, and one
        press("Options");
        bringToFront("OptionsDialog");
        control("TimeCombo")->setFocus();
        replaceAll("");
        enter({time});
        press("OKButton");
        EXPECT_EQ(settings(), time == "4:00" ? "240 2 16 -1" : "180 2 16 -1");
    }
    EXPECT_EQ(control<QComboBox>("TimeCombo")->count(), 7);
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
