#include "dictionary/editor_fixture.h"
#include "platform/platform.h"

namespace {

using Editor = OpenEditor;

TEST_F(Editor, AddsTypedWordsOneAfterAnother) {
    prefixes().setCurrentText("CA");
    for (const char* word : {"Apt", "CAPE", "sixteenlettersab"}) {
        type(word);
        key(Qt::Key_Return);
        EXPECT_EQ(text("DictionaryEditor/NewWord"), "");
    }
    EXPECT_EQ(listed(), (Words{"cab", "cape", "cat"}));
    EXPECT_EQ(offered(), "AP BO CA SI ZO");
    EXPECT_EQ(selectedPrefix(), "CA");
    EXPECT_EQ(text("WordCount"), "7 words");
    EXPECT_TRUE(State.DictionaryChanged);
    type("cow");
    select("DictionaryEditor/WordList", "cat");
    key(Qt::Key_Enter, Qt::KeypadModifier);
    EXPECT_TRUE(holds("cow"));
}

TEST_F(Editor, RefusesWhatIsNoWordOfThreeToSixteenLetters) {
    const std::string length = "Words must be 3 to 16 letters long.";
    const std::string letters = "Word has a non-alphabetic character, no added.";
    const std::vector<std::pair<std::string, std::string>> refused{
        {"at", length},         {"seventeenlettersx", length}, {"don't", letters},
        {"two words", letters}, {"caf\u00e9", letters},        {"ab1", letters}};
    for (const auto& [word, message] : refused) {
        boxes_.expect("Quorle", message, QMessageBox::Ok, QMessageBox::Ok);
        enter(word);
        EXPECT_EQ(text("DictionaryEditor/NewWord"), "");
    }
    EXPECT_EQ(cNumberOfWords(), 4);
    EXPECT_FALSE(State.DictionaryChanged);
}

TEST_F(Editor, RemovesTheSelectedWordAndKeepsThePrefixWhileItLasts) {
    QWidget* list = control("DictionaryEditor/WordList");
    prefixes().setCurrentText("CA");
    select("DictionaryEditor/WordList", "cat");
    press("Remove");
    EXPECT_EQ(listed(), Words{"cab"});
    EXPECT_FALSE(holds("cat"));
    EXPECT_TRUE(State.DictionaryChanged);
    EXPECT_TRUE(list->hasFocus());
    boxes_.expect("Quorle", "You must select a word to remove.", QMessageBox::Ok, QMessageBox::Ok,
                  [] { cDictionaryAdd("cane"); });
    press("Remove");
    EXPECT_EQ(listed(), (Words{"cab", "cane"}));
    for (const char* word : {"cane", "cab"}) {
        select("DictionaryEditor/WordList", word);
        press("Remove");
    }
    EXPECT_EQ(offered(), "BO ZO");
    EXPECT_EQ(selectedPrefix(), "BO");
    EXPECT_EQ(listed(), Words{"bone"});
}

TEST_F(Editor, ClearsAfterAQuestionAndOffersNoSaving) {
    const auto buttons = QMessageBox::Yes | QMessageBox::No;
    boxes_.expect("Quorle", "Clear the dictionary?", buttons, QMessageBox::No);
    menu("Clear");
    EXPECT_EQ(cNumberOfWords(), 4);
    boxes_.expect("Quorle", "Clear the dictionary?", buttons, QMessageBox::Yes);
    menu("Clear");
    EXPECT_EQ(offered(), "");
    EXPECT_EQ(listed(), Words{});
    EXPECT_EQ(text("WordCount"), "0 words");
    EXPECT_TRUE(isShown("DictionaryEditor"));
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
    menu("SaveAs");
    path = folder_ / "words.txt";
    menu("SaveAs");
    QFile file(QString::fromStdString(path));
    ASSERT_TRUE(file.open(QFile::ReadOnly));
    EXPECT_EQ(file.readAll(), "bone\ncab\ncat\nzoo\n");
    EXPECT_FALSE(State.DictionaryChanged);
}

TEST_F(Editor, IsLeftInThreeWaysForTheMainWindow) {
    const std::vector<std::function<void()>> ways{[this] { key(Qt::Key_Escape); },
                                                  [this] { menu("Exit"); },
                                                  [this] { closeByTitleBar("DictionaryEditor"); }};
    for (const auto& leave : ways) {
        press("Dictionary");
        bringToFront("DictionaryEditor");
        leave();
        EXPECT_FALSE(isShown("DictionaryEditor"));
        EXPECT_EQ(listed(), Words{});
        EXPECT_TRUE(QTest::qWaitForWindowActive(control("Main")));
    }
}

}  // namespace
