#include "dictionary/editor_commands.h"

#include <quorle/word_engine.h>

#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QPushButton>
#include <QStringListModel>
#include <algorithm>

#include "dictionary/dictionary.h"
#include "dictionary/editor_window.h"
#include "dictionary/listing.h"
#include "main_window/main_window.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "state/windows.h"

namespace {

bool IsLetter(QChar character) {
    return character >= 'a' && character <= 'z';
}

// What keeps a word out, empty when nothing does.
std::string Objection(const QString& word) {
    if (word.size() < UsualShortestWord || word.size() > LongestWord) {
        return "Words must be 3 to 16 letters long.";
    }
    if (!std::all_of(word.begin(), word.end(), IsLetter)) {
        return "Word has a non-alphabetic character, no added.";
    }
    return {};
}

void Refresh(Boolean ResetSelection) {
    Dictionary::ListStartingLetters(ResetSelection);
    Dictionary::ListWords();
}

void TellChange(const QString& word, const char* what) {
    const QLabel& count = *Windows::Shared<DictionaryEditor>().WordCount;
    Platform::Tell(QString("%1 %2. %3").arg(word, what, count.text()).toStdString());
}

}  // namespace

namespace Dictionary {

void OpenEditor() {
    DictionaryEditor& editor = Windows::Shared<DictionaryEditor>();
    ListStartingLetters(True);
    Platform::SetDefaultButton(&editor, editor.Add);
    ListWords();
    editor.waits = false;
    Platform::BringToFront(editor);
    editor.NewWord->setFocus();
}

void AddNewWord() {
    QLineEdit& box = *Windows::Shared<DictionaryEditor>().NewWord;
    const QString word = box.text().toLower();
    if (word.isEmpty()) return;
    const std::string objection = Objection(word);
    if (!objection.empty()) {
        Platform::ShowMessage(objection, Platform::ProgramTitle);
        box.clear();
        return;
    }
    AddToDictionary(word.toStdString());
    box.clear();
    Refresh(False);
    TellChange(word, IsInDictionary(word.toStdString()) ? "added" : "not added, it is too long");
}

void RemoveSelectedWord() {
    const QListView& list = *Windows::Shared<DictionaryEditor>().WordList;
    const auto selected = list.selectionModel()->selectedIndexes();
    QString removed;
    if (selected.isEmpty()) {
        Platform::ShowMessage("You must select a word to remove.", Platform::ProgramTitle);
    } else {
        removed = selected.first().data().toString();
        RemoveFromDictionary(removed.toStdString());
    }
    Refresh(False);
    if (!removed.isEmpty()) TellChange(removed, "removed");
}

void ClearDictionary() {
    if (!Platform::AskYesNo("Clear the dictionary?", Platform::ProgramTitle)) return;
    cDictionaryClear();
    Refresh(True);
}

void SaveAsText() {
    const std::string path = Platform::ChooseFileToSave(Platform::ProgramFolder());
    if (!path.empty()) cWriteTextFile(path.c_str());
}

void LeaveEditor() {
    DictionaryEditor& editor = Windows::Shared<DictionaryEditor>();
    editor.Words->setStringList({});
    Platform::HideWindow(editor);
    Platform::BringToFront(Windows::Shared<Main>());
}

}  // namespace Dictionary
