#include "support/program_fixture.h"

namespace {

using Editor = OpenEditor;

TEST_F(Editor, AddsTypedWordsOneAfterAnotherButNoneThatIsNoWord) {
    prefixes().setCurrentText("CA");
    enter({"Apt", "CAPE", "sixteenlettersab"});
    EXPECT_EQ(shown(), "AP BO CA SI ZO | CA: cab cape cat | 7 words");
    EXPECT_TRUE(State.DictionaryChanged);
    for (const std::string word : {"at", "seventeenlettersx", "don't", "caf\u00e9"}) {
        const bool fits = word.size() >= 3 && word.size() <= 16;
        boxes_.expect(fits ? "Word has a non-alphabetic character, no added."
                           : "Words must be 3 to 16 letters long.");
        enter({word});
        EXPECT_EQ(text("DictionaryEditor/NewWord"), "");
    }
    type("cow");
    select("DictionaryEditor/WordList", "cat");
    key(Qt::Key_Enter, Qt::KeypadModifier);
    EXPECT_EQ(lastTold(), "cow added. 8 words");
}

TEST_F(Editor, RemovesTheSelectedWordAndKeepsThePrefixWhileItLasts) {
    prefixes().setCurrentText("CA");
    select("DictionaryEditor/WordList", "cat");
    press("Remove");
    EXPECT_EQ(shown(), "BO CA ZO | CA: cab | 3 words");
    EXPECT_EQ(lastTold(), "cat removed. 3 words");
    EXPECT_TRUE(State.DictionaryChanged);
    EXPECT_TRUE(control("DictionaryEditor/WordList")->hasFocus());
    boxes_.expect("You must select a word to remove.");
    press("Remove");
    select("DictionaryEditor/WordList", "cab");
    press("Remove");
    EXPECT_EQ(shown(), "BO ZO | BO: bone | 2 words");
}

TEST_F(Editor, ChoosingAPrefixListsItsWordsAlsoTheSameAgain) {
    const auto choose = [this](Qt::Key step) {
        bringToFront("DictionaryEditor");
        QTest::keyClick(&prefixes(), Qt::Key_Space);
        QWidget* open = prefixes().view();
        ASSERT_TRUE(QTest::qWaitFor([open] { return open->isVisible(); }));
        QTest::keyClick(open, step);
        QTest::keyClick(open, Qt::Key_Return);
        QCoreApplication::processEvents();
    };
    cDictionaryAdd("bond");
    choose(Qt::Key_Home);
    EXPECT_EQ(shown(), "BO CA ZO | BO: bond bone | 5 words");
    choose(Qt::Key_Down);
    EXPECT_EQ(shown(), "BO CA ZO | CA: cab cat | 5 words");
}

TEST_F(Editor, ClearsAfterAQuestionAndOffersNoSaving) {
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        EXPECT_EQ(cNumberOfWords(), 4);
        boxes_.expect("Clear the dictionary?", answer);
        menu("DictionaryEditor/Clear");
    }
    EXPECT_EQ(shown(), "| : | 0 words");
    press("Main/Exit");
    EXPECT_FALSE(isShown("DictionaryEditor"));
    EXPECT_EQ(wordsInFile(), 4);
}

TEST_F(Editor, SavesEveryWordAsText) {
    Platform::ChooseFileToSave = [](const std::string& folder) { return folder + "/words.txt"; };
    menu("DictionaryEditor/SaveAs");
    EXPECT_EQ(folder_.read("program/words.txt"), "bone\ncab\ncat\nzoo\n");
    key(Qt::Key_Escape);
    EXPECT_FALSE(isShown("DictionaryEditor"));
    EXPECT_TRUE(comesToFront("Main"));
}

}  // namespace
