#pragma once
// Writing the dictionary as a text file.

/// Replaces the file at `path` by every word, in alphabetical order, one a line. False when it
/// could not be written.
bool ExportWords(const char* path);
