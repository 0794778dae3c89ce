#include <QApplication>
#include <QTest>
#include <QTimer>

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

    /// Different words with one beginning, too many for a single step.
    std::string manyWords(char beginning) {
        QByteArray words;
        for (int i = 0; i < ManyWords; ++i) {
            words += beginning;
            for (int rest = i, k = 0; k < 5; ++k, rest /= 26) {
                words += static_cast<char>('a' + rest % 26);
            }
            words += '\n';
        }
        return writeFile(std::string(1, beginning), words);
    }

    std::string writeFile(const std::string& name, const QByteArray& content) {
        QFile file(QString::fromStdString(folder_ / name));
        EXPECT_TRUE(file.open(QFile::WriteOnly));
        file.write(content);
        return folder_ / name;
    }

    void merge(const std::string& path) {
        Platform::ChooseFileToOpen = [path](const std::string&) { return path; };
        menu("Merge");
    }

    bool stepping() {
        return control("Progress")->findChild<QTimer*>("DictionaryTimer")->isActive();
    }

    void waitForTheEnd() {
        EXPECT_TRUE(QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000));
    }
};

TEST_F(Merging, ASmallFileIsInAtOnce) {
    prefixes().setCurrentText("ZO");
    merge(writeFile("small", "Dog\r\ncat  ant\nx-ray a1 abcdefghijklmnopq\nowl"));
    EXPECT_FALSE(isShown("Progress"));
    EXPECT_TRUE(isShown("DictionaryEditor"));
    EXPECT_EQ(offered(), "AN BO CA DO OW ZO");
    EXPECT_EQ(listed(), Words{"ant"});
    EXPECT_EQ(text("WordCount"), "7 words");
    EXPECT_TRUE(State.DictionaryChanged);
}

TEST_F(Merging, NothingIsMergedWithoutAFile) {
    merge("");
    EXPECT_FALSE(State.DictionaryChanged);
    for (const std::string& path : {folder_ / "missing", folder_ / "program"}) {
        merge(path);
        EXPECT_FALSE(isShown("Progress"));
        EXPECT_EQ(text("WordCount"), "4 words");
    }
}

TEST_F(Merging, AGameGoesOnMeanwhileAndKeepsTheKeys) {
    bringToFront("Main");
    start("CATSBONEWILDHEFY");
    bringToFront("DictionaryEditor");
    merge(manyWords('a'));
    EXPECT_FALSE(isShown("DictionaryEditor"));
    EXPECT_EQ(text("ProgressLabel"), "Merging words...");
    EXPECT_EQ(control("Progress")->geometry().center(), control("Main")->frameGeometry().center());
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
    EXPECT_EQ(State.ProgressFullWidth, 3975);
    EXPECT_EQ(bar->width(), 0);
    EXPECT_TRUE(isShown("DictionaryEditor"));
    EXPECT_EQ(selectedPrefix(), "AA");
    EXPECT_EQ(cNumberOfWords(), ManyWords + 4);
    EXPECT_TRUE(QTest::qWaitForWindowActive(control("Main")));
    key(Qt::Key_Return);
    EXPECT_EQ(words("Main/WordList"), Words{"cat"});
}

TEST_F(Merging, ASecondFileWaitsInLine) {
    merge(manyWords('m'));
    press("Dictionary");
    EXPECT_EQ(text("WordCount"), "4 words");
    merge(manyWords('a'));
    EXPECT_TRUE(isShown("Progress"));
    EXPECT_TRUE(stepping());
    EXPECT_FALSE(State.DictionaryChanged);
    waitForTheEnd();
    EXPECT_FALSE(stepping());
    EXPECT_TRUE(State.DictionaryChanged);
    EXPECT_EQ(text("WordCount"), std::to_string(2 * ManyWords + 4) + " words");
}

TEST_F(Merging, LeavingOffersWhatElseChanged) {
    enter("apt");
    merge(manyWords('a'));
    boxes_.expect("Save dictionary?", "Dictionary has been updated, do you want to save it?",
                  QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes, [this] {
                      QTest::qWait(50);
                      EXPECT_FALSE(stepping());
                  });
    press("Main/Exit");
    EXPECT_EQ(wordsOnDisk(), 5);
}

}  // namespace
