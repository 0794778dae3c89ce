#pragma once
// What is measured on: word lists, boards, and a folder for files.
#include <string>
#include <vector>

using WordList = std::vector<std::string>;

/// The lines of 2 to 16 letters a to z of a list of the distribution, sorted.
WordList ReadWordList(const std::string& name);
/// a, aa, aaa ... without the first, which is no word.
WordList Runs();

/// A file in a temporary folder that is removed at the end.
std::string TempFile(const std::string& name);
void WriteText(const std::string& path, const WordList& words);
std::size_t FileSize(const std::string& path);

/// The dictionary of a list, in its file; made the first time.
std::string DictionaryOf(const std::string& name, const WordList& words);
/// Merges a whole text file through the engine, and returns the longest step in milliseconds.
double Merge(const std::string& path);

/// Boards as random shakes give them, the same in every run.
std::vector<std::string> RandomBoards(int count);
/// One letter and two, the most frequent ones.
std::vector<std::string> FewLetterBoards();
