#include "word_file_export.h"

#include <string>

#include "current_dictionary.h"
#include "replace_file.h"
#include "word_cursor.h"

bool ExportWords(const char* path) {
    std::string text;
    WordCursor cursor(TheDictionary.words);
    for (std::string_view word; cursor.next(word);) text.append(word).push_back('\n');
    return ReplaceFile(path, std::as_bytes(std::span(text)));
}
