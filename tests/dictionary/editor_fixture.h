#pragma once
// The dictionary editor open on a small dictionary.
#include <quorle/word_engine.h>

#include <QComboBox>

#include "platform/platform.h"
#include "support/program_fixture.h"

class OpenEditor : public ProgramFixture {
  protected:
    OpenEditor() {
        makeDictionary({"bone", "cab", "cat", "zoo"});
        launch();
        press("Dictionary");
    }

    QComboBox& prefixes() { return *control<QComboBox>("StartingLetters"); }

    /// The prefixes, the selected one and its words, and the count.
    std::string shown() {
        std::string all;
        for (int i = 0; i < prefixes().count(); ++i) {
            all += prefixes().itemText(i).toStdString() + " ";
        }
        all += "| " + prefixes().currentText().toStdString() + ":";
        for (const auto& word : words("DictionaryEditor/WordList")) all += " " + word;
        return all + " | " + text("WordCount");
    }
};
