// What the program asks when it starts and when it ends.
#include <unistd.h>

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
    /// A bad word comes into the dictionary, and another game is begun.
    void changeDictionary() {
        start();
        enter({"won"});
        press("End");
        select("BadWords", "won");
        press("AddToDict");
        start();
    }
};

TEST_F(StartAndExit, AStoredMaximumAboveTheDictionarysIsWarnedOf) {
    makeDictionary({"cat"}, 12);
    store("MaxWordSize", "40");
    boxes_.expect(
        "WARNING - dictionary is limited to words that have no more than 12 letters, resetting "
        "Max Word Size option");
    launch();
    EXPECT_EQ(cMaxWordSize(), 12);
    press("Exit");  // nothing has changed: nothing is asked, nothing written
    EXPECT_EQ(stored("MaxWordSize"), "40");
}

TEST_F(StartAndExit, AStoredMaximumBelowTheDictionarysIsAsked) {
    makeDictionary({"cat", "cats"});
    store("MaxWordSize", "3");
    for (const bool remove : {false, true}) {
        boxes_.expect(
            "Dictionary contains words longer than 3 letters, is it OK to remove the longer words "
            "from the dictionary?",
            remove ? QMessageBox::Yes : QMessageBox::No);
        if (!remove) boxes_.expect("Setting Max Word Size option to 16 letters");
        launch();
        EXPECT_EQ(cMaxWordSize(), remove ? 3 : 16);
        EXPECT_EQ(cNumberOfWords(), remove ? 1 : 2);
    }
    boxes_.expectSaveQuestion(QMessageBox::No);
    press("Exit");
}

TEST_F(StartAndExit, AChangeIsSavedOrDropped) {
    for (const auto answer : {QMessageBox::Yes, QMessageBox::No}) {
        makeDictionary({"cat"}, 12);
        launch();
        changeDictionary();
        cSetMaxWordSize(5);
        boxes_.expectSaveQuestion(answer);
        control("Main")->close();  // as the desktop closes it
        EXPECT_FALSE(isShown("Main") || isShown("Results"));
        EXPECT_EQ(stored("MaxWordSize"), answer == QMessageBox::Yes ? "" : "12");
        EXPECT_EQ(wordsInFile(), answer == QMessageBox::Yes ? 2 : 1);
    }
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

    boxes_.expectSaveQuestion(QMessageBox::Yes);
    endSession();
    EXPECT_FALSE(isShown("Main"));
    EXPECT_EQ(wordsInFile(), 2);
}

}  // namespace
