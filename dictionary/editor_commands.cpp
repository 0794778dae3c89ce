#include "dictionary/editor_commands.h"

#include <quorle/word_engine.h>

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

}  // namespace

namespace Dictionary {

void OpenEditor() {
    DictionaryEditor& editor = Windows::Shared<DictionaryEditor>();
    ListStartingLetters(True);
    SetDefaultButton(&editor, editor.Add);
    ListWords();
    WindowFront::Bring(editor);
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
}

void RemoveSelectedWord() {
    const QListView& list = *Windows::Shared<DictionaryEditor>().WordList;
    const auto selected = list.selectionModel()->selectedIndexes();
    if (selected.isEmpty()) {
        Platform::ShowMessage("You must select a word to remove.", Platform::ProgramTitle);
    } else {
        RemoveFromDictionary(selected.first().data().toString().toStdString());
    }
    Refresh(False);
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
    WindowFront::Hide(editor);
    WindowFront::Bring(Windows::Shared<Main>());
}

}  // namespace Dictionary
