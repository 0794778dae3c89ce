#pragma once
// The commands of the dictionary editor. They change the word engine's dictionary;
// Dictionary.dat is written when the program ends.

namespace Dictionary {

/// Opens the editor at the first prefix.
void OpenEditor();

/// Adds the word in NewWord.
void AddNewWord();

/// Removes the word selected in WordList.
void RemoveSelectedWord();

/// Removes every word, after a question. Does not mark the dictionary changed.
void ClearDictionary();

/// Writes every word to a text file that the player names.
void SaveAsText();

/// Hides the editor and shows the main window.
void LeaveEditor();

}  // namespace Dictionary
