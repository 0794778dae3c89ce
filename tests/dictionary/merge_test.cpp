#include <QApplication>
#include <QTimer>
#include <QWindow>

#include "dictionary/editor_fixture.h"
#include "platform/platform.h"

namespace {

constexpr int ManyWords = 300'000;
constexpr int FullBar = 265;  // pixels

class Merging : public OpenEditor {
  protected:
    // The engine outlives the program that a test has left during a merge.
    ~Merging() override {
        while (cReadTextFile("dummy") < 100) continue;
    }

    /// Merges different words with one beginning, too many for a single step.
    void mergeMany(char beginning) {
        std::string words;
        for (int i = 0; i < ManyWords; ++i) {
            words += beginning;
            for (int rest = i, k = 0; k < 5; ++k, rest /= 26) {
                words += static_cast<char>('a' + rest % 26);
            }
            words += '\n';
        }
        folder_.write(std::string(1, beginning), words);
        merge(folder_ / std::string(1, beginning));
        EXPECT_TRUE(isShown("Progress") && !isShown("DictionaryEditor"));
    }
    void merge(const std::string& path) {
        Platform::ChooseFileToOpen = [path](const std::string&) { return path; };
        menu("DictionaryEditor/Merge");
    }
    bool stepping() {
        return control("Progress")->findChild<QTimer*>("DictionaryTimer")->isActive();
    }
};

TEST_F(Merging, ASmallFileIsInAtOnce) {
    prefixes().setCurrentText("ZO");
    for (const std::string& path : {std::string(), folder_ / "missing", folder_ / "program"}) {
        merge(path);
        EXPECT_EQ(text("WordCount"), "4 words");
    }
    folder_.write("small", "Dog\r\ncat  ant\nx-ray a1 abcdefghijklmnopq\nowl");
    merge(folder_ / "small");
    EXPECT_FALSE(isShown("Progress"));
    EXPECT_EQ(shown(), "AN BO CA DO OW ZO | AN: ant | 7 words");
    EXPECT_TRUE(State.DictionaryChanged);
}

TEST_F(Merging, AGameGoesOnMeanwhileAndKeepsTheKeys) {
    bringToFront("Main");
    start("CATSBONEWILDHEFY");
    bringToFront("DictionaryEditor");
    mergeMany('a');
    EXPECT_EQ(text("ProgressLabel"), "Merging words...");
    bringToFront("Main");
    QWidget* bar = control("ProgressIndicator");
    int widest = 0;
    while (isShown("Progress")) {
        EXPECT_GE(bar->width(), widest);
        widest = bar->width();
        if (text("Main/NewWord").empty()) type("cat");
        QTest::qWait(1);
        if (isShown("Progress")) key(Qt::Key_Return);
    }
    EXPECT_GT(widest, 0);
    EXPECT_LT(widest, FullBar);
    EXPECT_EQ(bar->width(), 0);
    EXPECT_TRUE(isShown("DictionaryEditor"));
    EXPECT_EQ(prefixes().currentText().toStdString(), "AA");
    EXPECT_EQ(cNumberOfWords(), ManyWords + 4);
    EXPECT_EQ(std::count(told_.begin(), told_.end(), "merging"), 1);
    EXPECT_EQ(std::count(told_.begin(), told_.end(), "merged. 300004 words"), 1);
    EXPECT_TRUE(comesToFront("Main"));
    key(Qt::Key_Return);
    EXPECT_EQ(words("Main/WordList"), Words{"cat"});
}

TEST_F(Merging, OutsideAGameTheEditorComesToTheFrontAlsoWhenFirstShownInAGame) {
    Platform::ChooseFileToOpen = [](const std::string&) { return std::string(); };
    relaunch();
    start("CATSBONEWILDHEFY");
    press("Dictionary");
    EXPECT_TRUE(comesToFront("DictionaryEditor"));
    closeByTitleBar("DictionaryEditor");
    press("End");
    press("ResultsOK");
    press("Dictionary");
    control("DictionaryEditor/Add")->setFocus();
    mergeMany('a');
    EXPECT_TRUE(comesToFront("Main"));
    EXPECT_TRUE(QTest::qWaitFor([this] { return isShown("DictionaryEditor"); }, 60'000));
    EXPECT_TRUE(comesToFront("DictionaryEditor"));
    EXPECT_FALSE(
        control("DictionaryEditor")->windowHandle()->property("_q_showWithoutActivating").toBool());
    type("word");
    EXPECT_EQ(text("DictionaryEditor/NewWord"), "word");
}

// There a window that is shown gets the focus, as it does in these tests.
TEST_F(Merging, OnWaylandNothingThatWouldTakeTheFocusIsShownInAGame) {
    Platform::OnWayland = [] { return true; };
    bringToFront("Main");
    start("CATSBONEWILDHEFY");
    bringToFront("DictionaryEditor");
    mergeMany('a');
    EXPECT_EQ(control("Progress")->windowType(), Qt::ToolTip);
    EXPECT_EQ(control("Progress")->windowHandle()->transientParent(),
              control("Main")->windowHandle());
    bringToFront("Main");
    EXPECT_TRUE(QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000));
    EXPECT_FALSE(isShown("DictionaryEditor"));
    EXPECT_EQ(text("WordCount"), std::to_string(ManyWords + 4) + " words");
    EXPECT_TRUE(control("Main")->isActiveWindow());
    EXPECT_EQ(QApplication::focusWidget(), control("Main/NewWord"));
    enter({"cat"});
    EXPECT_EQ(words("Main/WordList"), Words{"cat"});
    press("End");
    EXPECT_TRUE(isShown("DictionaryEditor"));
    EXPECT_TRUE(comesToFront("Results"));
}

TEST_F(Merging, OnWaylandItsEndTakesNoKeysFromAnotherProgram) {
    Platform::OnWayland = [] { return true; };
    mergeMany('a');
    QWindow elsewhere;
    elsewhere.show();
    elsewhere.requestActivate();
    ASSERT_TRUE(QTest::qWaitFor([] { return QApplication::activeWindow() == nullptr; }));
    EXPECT_TRUE(QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000));
    EXPECT_FALSE(isShown("DictionaryEditor"));
    bringToFront("Main");
    EXPECT_TRUE(QTest::qWaitFor([this] { return isShown("DictionaryEditor"); }));
    EXPECT_TRUE(comesToFront("DictionaryEditor"));
}

TEST_F(Merging, ASecondFileWaitsInLine) {
    mergeMany('m');
    press("Dictionary");
    mergeMany('a');
    EXPECT_FALSE(State.DictionaryChanged);
    // A box that is up at the end stays in front of the editor.
    boxes_.expect("Game paused", "Hit OK when ready to resume.", QMessageBox::Ok, QMessageBox::Ok,
                  [this] {
                      const QWidget* box = QApplication::activeModalWidget();
                      EXPECT_TRUE(QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000));
                      QTest::qWait(50);
                      EXPECT_TRUE(box->isActiveWindow());
                  });
    press("Main/Pause");
    EXPECT_EQ(text("WordCount"), std::to_string(2 * ManyWords + 4) + " words");
    EXPECT_FALSE(stepping());
}

TEST_F(Merging, LeavingOffersTheWordsThatAreInWhileAnotherFileIsInLine) {
    mergeMany('m');
    press("Dictionary");
    mergeMany('a');
    EXPECT_TRUE(QTest::qWaitFor([] { return cNumberOfWords() > ManyWords; }, 60'000));
    EXPECT_TRUE(stepping());
    boxes_.expectQuestion("Dictionary has been updated, do you want to save it?", QMessageBox::Yes,
                          "Save dictionary?");
    press("Main/Exit");
    EXPECT_EQ(wordsOnDisk(), ManyWords + 4);
}

TEST_F(Merging, LeavingOffersWhatElseChanged) {
    enter({"apt"});
    mergeMany('a');
    boxes_.expect("Save dictionary?", "Dictionary has been updated, do you want to save it?",
                  QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes, [this] {
                      QTest::qWait(50);
                      EXPECT_FALSE(stepping());
                  });
    press("Main/Exit");
    EXPECT_EQ(wordsOnDisk(), 5);
}

}  // namespace
