#pragma once
// The dictionary editor open on a small dictionary.
#include <quorle/word_engine.h>

#include <QAction>
#include <QComboBox>
#include <QFile>
#include <QTest>
#include <string>

#include "dictionary/dictionary.h"
#include "support/program_fixture.h"

class OpenEditor : public ProgramFixture {
  protected:
    OpenEditor() {
        makeDictionary({"bone", "cab", "cat", "zoo"});
        launch();
        press("Dictionary");
    }

    QComboBox& prefixes() { return *qobject_cast<QComboBox*>(control("StartingLetters")); }

    std::string offered() {
        QStringList all;
        for (int i = 0; i < prefixes().count(); ++i) all += prefixes().itemText(i);
        return all.join(' ').toStdString();
    }

    std::string selectedPrefix() { return prefixes().currentText().toStdString(); }

    Words listed() { return words("DictionaryEditor/WordList"); }

    void menu(const char* command) {
        control("DictionaryEditor")->findChild<QAction*>(command)->trigger();
    }

    void enter(const std::string& word) {
        EXPECT_TRUE(QTest::qWaitForWindowActive(control("DictionaryEditor")));
        type(word);
        key(Qt::Key_Return);
    }

    static bool holds(const std::string& word) { return Dictionary::IsInDictionary(word); }

    /// Number of words in the program folder's file; the engine then holds them.
    static int wordsOnDisk() {
        Dictionary::LoadDictionary();
        return cNumberOfWords();
    }
};
