#include "support/program_fixture.h"

namespace {

constexpr int ManyWords = 300'000;

class Merging : public OpenEditor {
  protected:
    // The engine outlives the program that a test has left during a merge.
    ~Merging() override {
        while (cReadTextFile("dummy") < 100) continue;
    }

    void merge(const std::string& name, const std::string& words) {
        folder_.write(name, words);
        Platform::ChooseFileToOpen = [path = folder_ / name](const auto&) { return path; };
        menu("DictionaryEditor/Merge");
    }
    /// Merges different words with one beginning. Few end alike, so that it takes many steps.
    void mergeMany(char beginning) {
        std::string words;
        for (int i = 0; i < ManyWords; ++i) {
            const std::string number = std::to_string(ManyWords + i);
            words += beginning + number + std::string(number.rbegin(), number.rend()) + "\n";
        }
        for (char& each : words) {
            if (std::isdigit(each) != 0) each = static_cast<char>(each - '0' + 'a');
        }
        merge({beginning}, words);
        EXPECT_TRUE(isShown("Progress") && !isShown("DictionaryEditor"));
    }
    bool ends() {
        return QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000);
    }
};

TEST_F(Merging, ASmallFileIsInAtOnce) {
    merge("empty", "");
    EXPECT_TRUE(ends() && State.DictionaryChanged);
    // On a busy machine not at the first try.
    EXPECT_TRUE(QTest::qWaitFor([this] {
        prefixes().setCurrentText("ZO");
        merge("small", "Dog\r\ncat  ant\nx-ray a1 abcdefghijklmnopq\nowl");
        return !isShown("Progress");
    }));
    EXPECT_EQ(shown(), "AN BO CA DO OW ZO | AN: ant | 7 words");
}

TEST_F(Merging, AGameGoesOnMeanwhileAndKeepsTheKeys) {
    for (const bool wayland : {false, true}) {  // there what is shown has the focus
        launch();
        Platform::OnWayland = [wayland] { return wayland; };
        press("Dictionary");
        start();
        bringToFront("DictionaryEditor");
        mergeMany('a');
        const int first = control("ProgressIndicator")->width();
        const QWindow& progress = *control("Progress")->windowHandle();
        EXPECT_EQ(progress.type() == Qt::ToolTip, wayland);
        EXPECT_EQ(progress.transientParent() == control("Main")->windowHandle(), wayland);
        bringToFront("Main");  // here, too, every window that is shown comes to the front
        type("ca");
        int widest = first;
        while (isShown("Progress")) {
            EXPECT_GE(control("ProgressIndicator")->width(), widest);
            widest = control("ProgressIndicator")->width();
            QTest::qWait(1);
        }
        EXPECT_TRUE(widest > first && widest < 265);
        EXPECT_EQ(isShown("DictionaryEditor"), !wayland);
        EXPECT_TRUE(comesToFront("Main"));
        enter({"t"});
        EXPECT_EQ(words("Main/WordList"), Words{"cat"});
        press("End");
        EXPECT_TRUE(isShown("DictionaryEditor"));
        EXPECT_TRUE(comesToFront("Results"));
        EXPECT_EQ(prefixes().currentText(), "AD");
    }
    EXPECT_EQ(std::count(told_.begin(), told_.end(), "merging"), 2);
    EXPECT_EQ(std::count(told_.begin(), told_.end(), "merged. 300004 words"), 2);
}

TEST_F(Merging, OutsideAGameTheEditorComesToTheFrontAlsoWhenFirstShownInAGame) {
    launch();
    start();
    press("Dictionary");
    EXPECT_TRUE(comesToFront("DictionaryEditor"));
    press("End");
    control("DictionaryEditor/Add")->setFocus();
    mergeMany('a');
    EXPECT_TRUE(ends());
    EXPECT_TRUE(comesToFront("DictionaryEditor"));
    EXPECT_FALSE(
        control("DictionaryEditor")->windowHandle()->property("_q_showWithoutActivating").toBool());
    type("word");
    EXPECT_EQ(text("DictionaryEditor/NewWord"), "word");
}

TEST_F(Merging, OnWaylandItsEndTakesNoKeysFromAnotherProgram) {
    Platform::OnWayland = [] { return true; };
    mergeMany('a');
    QWindow elsewhere;
    elsewhere.show();
    elsewhere.requestActivate();
    ASSERT_TRUE(QTest::qWaitFor([] { return QApplication::activeWindow() == nullptr; }));
    EXPECT_TRUE(ends() && !isShown("DictionaryEditor"));
    bringToFront("Main");
    EXPECT_TRUE(QTest::qWaitFor([this] { return isShown("DictionaryEditor"); }));
    EXPECT_TRUE(comesToFront("DictionaryEditor"));
}

TEST_F(Merging, ABoxThatIsUpAtItsEndStaysInFrontOfTheEditor) {
    mergeMany('a');
    EXPECT_FALSE(State.DictionaryChanged);
    boxes_.expectPause([this] {
        EXPECT_TRUE(ends());
        QTest::qWait(50);
        EXPECT_EQ(QApplication::activeWindow(), QApplication::activeModalWidget());
    });
    press("Main/Pause");
    EXPECT_EQ(text("WordCount"), "300004 words");
}

TEST_F(Merging, LeavingOffersTheWordsThatAreInAndStopsTheFileInLine) {
    mergeMany('m');
    press("Dictionary");
    mergeMany('a');
    EXPECT_TRUE(QTest::qWaitFor([] { return cNumberOfWords() > ManyWords; }, 60'000));
    boxes_.expectSaveQuestion(
        QMessageBox::Yes, [this] { EXPECT_FALSE(control<QTimer>("DictionaryTimer")->isActive()); });
    press("Main/Exit");
    EXPECT_EQ(wordsInFile(), ManyWords + 4);
}

}  // namespace
