// What the program asks when it starts and when it ends.
#include <quorle/word_engine.h>

#include <filesystem>

#include "support/program_fixture.h"

namespace {

namespace fs = std::filesystem;

constexpr auto YesNo = QMessageBox::Yes | QMessageBox::No;
constexpr const char* SaveQuestion = "Dictionary has been updated, do you want to save it?";

class StartAndExit : public ProgramFixture {
  protected:
    void expectAtStart(const std::string& text, QMessageBox::StandardButtons buttons,
                       QMessageBox::StandardButton answer) {
        boxes_.expect("Quorle", text, buttons, answer, [this] { EXPECT_FALSE(isShown("Main")); });
    }
    void expectSaveQuestion(QMessageBox::StandardButton answer) {
        boxes_.expect("Save dictionary?", SaveQuestion, YesNo, answer);
    }
    int wordsInFile() {
        cReadBinaryDictionary((folder_ / "program/Dictionary.dat").c_str());
        return cNumberOfWords();
    }
    bool hasSettings() { return fs::exists(folder_ / "config/quorle/settings"); }
    /// A bad word comes into the dictionary.
    void changeDictionary() {
        start("CATSBONEWILDHEFY");
        type("won");
        key(Qt::Key_Return);
        press("End");
        select("BadWords", "won");
        press("AddToDict");
    }
};

TEST_F(StartAndExit, NothingIsAskedOrWrittenWithoutAChange) {
    makeDictionary({"cat"}, 12);
    launch();
    EXPECT_EQ(State.MaxWordSizeOption, 12);
    EXPECT_EQ(State.LetterBase, 97);
    press("Exit");
    EXPECT_FALSE(isShown("Main"));
    EXPECT_FALSE(hasSettings());
}

TEST_F(StartAndExit, AStoredMaximumAboveTheDictionarysIsWarnedOf) {
    makeDictionary({"cat"}, 12);
    store("MaxWordSize", "40");
    expectAtStart(
        "WARNING - dictionary is limited to words that have no more than 12 letters, resetting "
        "Max Word Size option",
        QMessageBox::Ok, QMessageBox::Ok);
    launch();
    EXPECT_EQ(State.MaxWordSizeOption, 12);
    EXPECT_EQ(State.DictionaryChanged, False);
    EXPECT_EQ(stored("MaxWordSize"), "40");
}

TEST_F(StartAndExit, AStoredMaximumBelowTheDictionarysIsAsked) {
    makeDictionary({"cat", "cats"});
    store("MaxWordSize", "3");
    const std::string question =
        "Dictionary contains words longer than 3 letters, is it OK to remove the longer words "
        "from the dictionary?";
    expectAtStart(question, YesNo, QMessageBox::No);
    expectAtStart("Setting Max Word Size option to 16 letters", QMessageBox::Ok, QMessageBox::Ok);
    launch();
    EXPECT_EQ(State.MaxWordSizeOption, 16);
    EXPECT_EQ(cNumberOfWords(), 2);
    press("Exit");

    expectAtStart(question, YesNo, QMessageBox::Yes);
    relaunch();
    EXPECT_EQ(State.MaxWordSizeOption, 3);
    EXPECT_EQ(cNumberOfWords(), 1);
    expectSaveQuestion(QMessageBox::No);
    press("Exit");
    EXPECT_EQ(stored("MaxWordSize"), "3");
    EXPECT_EQ(wordsInFile(), 2);
}

TEST_F(StartAndExit, AMissingOrDamagedDictionaryIsAnEmptyOne) {
    for (const char* content : {"", "no dictionary"}) {
        if (*content != 0) folder_.write("program/Dictionary.dat", content);
        relaunch();
        start("CATSBONEWILDHEFY");
        EXPECT_EQ(text("DefinedWordCount"), "Quorle found 0 words");
        type("cat");
        key(Qt::Key_Return);
        EXPECT_EQ(struck(), Words{"cat"});
        press("End");
        EXPECT_EQ(text("WordsLabel"), "0 words found");
    }
}

TEST_F(StartAndExit, AChangeIsSavedWhenThePlayerAgrees) {
    makeDictionary({"cat"});
    launch();
    changeDictionary();
    expectSaveQuestion(QMessageBox::Yes);
    control("Main")->close();  // as the desktop closes it
    for (const char* window : {"Main", "Results"}) EXPECT_FALSE(isShown(window)) << window;
    EXPECT_FALSE(hasSettings());
    EXPECT_EQ(wordsInFile(), 2);
}

TEST_F(StartAndExit, ADroppedChangeWritesTheSettingsInstead) {
    makeDictionary({"cat"}, 12);
    store("TimeLimit", "60");
    launch();
    changeDictionary();
    bringToFront("Main");
    press("Start");  // a running game is dropped
    cSetMaxWordSize(5);
    expectSaveQuestion(QMessageBox::No);
    press("Exit");
    EXPECT_FALSE(isShown("Main"));
    EXPECT_EQ(stored("TimeLimit"), "60");
    EXPECT_EQ(stored("MaxWordSize"), "12");
    EXPECT_EQ(wordsInFile(), 1);
}

}  // namespace
