// What the program asks when it starts and when it ends.
#include <quorle/word_engine.h>

#include <unistd.h>

#include <QApplication>
#include <QSessionManager>
#include <csignal>

#include "platform/session_end.h"
#include "support/program_fixture.h"

// Without a session the platform would say no.
bool QSessionManager::allowsInteraction() {
    return true;
}

namespace {

class StartAndExit : public ProgramFixture {
  protected:
    void expectSaveQuestion(QMessageBox::StandardButton answer) {
        boxes_.expectQuestion("Dictionary has been updated, do you want to save it?", answer,
                              "Save dictionary?");
    }
    int wordsInFile() {
        cReadBinaryDictionary((folder_ / "program/Dictionary.dat").c_str());
        return cNumberOfWords();
    }

    /// A bad word comes into the dictionary, and another game is begun.
    void changeDictionary() {
        start("CATSBONEWILDHEFY");
        enter({"won"});
        press("End");
        select("BadWords", "won");
        press("AddToDict");
        bringToFront("Main");
        press("Start");
    }
};

TEST_F(StartAndExit, AStoredMaximumAboveTheDictionarysIsWarnedOf) {
    makeDictionary({"cat"}, 12);
    store("MaxWordSize", "40");
    boxes_.expectMessage(
        "WARNING - dictionary is limited to words that have no more than 12 letters, resetting "
        "Max Word Size option",
        [this] { EXPECT_FALSE(isShown("Main")); });
    launch();
    EXPECT_EQ(State.MaxWordSizeOption, 12);
    press("Exit");  // nothing has changed: nothing is asked, nothing written
    EXPECT_FALSE(isShown("Main"));
    EXPECT_EQ(stored("MaxWordSize"), "40");
}

TEST_F(StartAndExit, AStoredMaximumBelowTheDictionarysIsAsked) {
    makeDictionary({"cat", "cats"});
    store("MaxWordSize", "3");
    const std::string question =
        "Dictionary contains words longer than 3 letters, is it OK to remove the longer words "
        "from the dictionary?";
    boxes_.expectQuestion(question, QMessageBox::No);
    boxes_.expectMessage("Setting Max Word Size option to 16 letters");
    launch();
    EXPECT_EQ(State.MaxWordSizeOption, 16);
    EXPECT_EQ(cNumberOfWords(), 2);
    press("Exit");

    boxes_.expectQuestion(question, QMessageBox::Yes);
    relaunch();
    EXPECT_EQ(State.MaxWordSizeOption, 3);
    EXPECT_EQ(cNumberOfWords(), 1);
    expectSaveQuestion(QMessageBox::No);
    press("Exit");
    EXPECT_EQ(wordsInFile(), 2);
}

TEST_F(StartAndExit, AMissingOrDamagedDictionaryIsAnEmptyOne) {
    for (const char* content : {"", "no dictionary"}) {
        if (*content != 0) folder_.write("program/Dictionary.dat", content);
        relaunch();
        start("CATSBONEWILDHEFY");
        enter({"cat"});
        EXPECT_EQ(struck(), Words{"cat"});
        EXPECT_EQ(text("DefinedWordCount"), "Quorle found 0 words");
    }
}

TEST_F(StartAndExit, AChangeIsSavedOrDropped) {
    makeDictionary({"cat"}, 12);
    launch();
    changeDictionary();
    expectSaveQuestion(QMessageBox::Yes);
    control("Main")->close();  // as the desktop closes it
    EXPECT_FALSE(isShown("Main") || isShown("Results"));
    EXPECT_FALSE(std::filesystem::exists(folder_ / "config/quorle/settings"));
    EXPECT_EQ(wordsInFile(), 2);

    makeDictionary({"cat"}, 12);
    store("TimeLimit", "60");
    relaunch();
    changeDictionary();
    cSetMaxWordSize(5);
    expectSaveQuestion(QMessageBox::No);
    press("Exit");
    EXPECT_EQ(stored("TimeLimit") + "/" + stored("MaxWordSize"), "60/12");
    EXPECT_EQ(wordsInFile(), 1);
}

TEST_F(StartAndExit, ASessionThatEndsAsksOnceAndBelowAnOpenBoxNotAtAll) {
    makeDictionary({"cat"});
    launch();
    Platform::FollowSessionEnd([this] { control("Main")->close(); });
    const auto endSession = [] {
        emit qApp->commitDataRequest(*qApp->findChild<QSessionManager*>());
    };
    changeDictionary();
    const auto endBelowTheQuestion = [&] {
        alarm(5);  // a second question below the first would wait for ever
        boxes_.expectModal([&](QWidget& /*question*/) { endSession(); });
        press("Exit");
    };
    EXPECT_EXIT(endBelowTheQuestion(), testing::KilledBySignal(SIGTERM), "");
    EXPECT_EQ(stored("MaxWordSize"), "");

    expectSaveQuestion(QMessageBox::Yes);
    endSession();
    EXPECT_FALSE(isShown("Main"));
    EXPECT_EQ(wordsInFile(), 2);
}

}  // namespace
