#pragma once
// The dictionary editor open on a small dictionary.
#include <quorle/word_engine.h>

#include <QComboBox>
#include <QTest>

#include "support/program_fixture.h"

class OpenEditor : public ProgramFixture {
  protected:
    OpenEditor() {
        makeDictionary({"bone", "cab", "cat", "zoo"});
        launch();
        press("Dictionary");
    }

    QComboBox& prefixes() { return *qobject_cast<QComboBox*>(control("StartingLetters")); }

    /// The prefixes, the selected one and its words, and the count.
    std::string shown() {
        QString all;
        for (int i = 0; i < prefixes().count(); ++i) all += prefixes().itemText(i) + " ";
        all += "| " + prefixes().currentText() + ":";
        for (const auto& word : words("DictionaryEditor/WordList")) {
            all += " " + QString::fromStdString(word);
        }
        return all.toStdString() + " | " + text("WordCount");
    }

    /// Number of words in the program folder's file; the engine then holds them.
    int wordsOnDisk() {
        cReadBinaryDictionary((folder_ / "program/Dictionary.dat").c_str());
        return cNumberOfWords();
    }
};
