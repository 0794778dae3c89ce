#include <QAbstractItemView>

#include "dictionary/editor_fixture.h"
#include "platform/platform.h"

namespace {

using Editor = OpenEditor;

TEST_F(Editor, AddsTypedWordsOneAfterAnother) {
    prefixes().setCurrentText("CA");
    enter({"Apt", "CAPE", "sixteenlettersab"});
    EXPECT_EQ(text("DictionaryEditor/NewWord"), "");
    EXPECT_EQ(shown(), "AP BO CA SI ZO | CA: cab cape cat | 7 words");
    EXPECT_TRUE(State.DictionaryChanged);
    type("cow");
    select("DictionaryEditor/WordList", "cat");
    key(Qt::Key_Enter, Qt::KeypadModifier);
    EXPECT_EQ(text("WordCount"), "8 words");
}

TEST_F(Editor, RefusesWhatIsNoWordOfThreeToSixteenLetters) {
    const std::string length = "Words must be 3 to 16 letters long.";
    const std::string letters = "Word has a non-alphabetic character, no added.";
    for (const auto& [word, message] : {std::pair("at", length),
                                        {"seventeenlettersx", length},
                                        {"don't", letters},
                                        {"caf\u00e9", letters}}) {
        boxes_.expectMessage(message);
        enter({word});
        EXPECT_EQ(text("DictionaryEditor/NewWord"), "");
    }
    EXPECT_EQ(cNumberOfWords(), 4);
}

TEST_F(Editor, RemovesTheSelectedWordAndKeepsThePrefixWhileItLasts) {
    prefixes().setCurrentText("CA");
    select("DictionaryEditor/WordList", "cat");
    press("Remove");
    EXPECT_EQ(shown(), "BO CA ZO | CA: cab | 3 words");
    EXPECT_TRUE(State.DictionaryChanged);
    EXPECT_TRUE(control("DictionaryEditor/WordList")->hasFocus());
    boxes_.expectMessage("You must select a word to remove.", [] { cDictionaryAdd("cane"); });
    press("Remove");
    EXPECT_EQ(shown(), "BO CA ZO | CA: cab cane | 4 words");
    for (const char* word : {"cane", "cab"}) {
        select("DictionaryEditor/WordList", word);
        press("Remove");
    }
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
        boxes_.expectQuestion("Clear the dictionary?", answer);
        menu("DictionaryEditor/Clear");
    }
    EXPECT_EQ(shown(), "| : | 0 words");
    press("Main/Exit");
    EXPECT_FALSE(isShown("DictionaryEditor"));
    EXPECT_EQ(wordsOnDisk(), 4);
}

TEST_F(Editor, SavesEveryWordAsText) {
    std::string path;
    Platform::ChooseFileToSave = [&](const std::string& folder) {
        EXPECT_EQ(folder, folder_ / "program");
        return path;
    };
    menu("DictionaryEditor/SaveAs");
    path = folder_ / "words.txt";
    menu("DictionaryEditor/SaveAs");
    EXPECT_EQ(folder_.read("words.txt"), "bone\ncab\ncat\nzoo\n");
    EXPECT_FALSE(State.DictionaryChanged);
    key(Qt::Key_Escape);
    EXPECT_FALSE(isShown("DictionaryEditor"));
    EXPECT_TRUE(comesToFront("Main"));
}

}  // namespace
