#include "word_file/export.h"

#include "graph/word_cursor.h"

namespace Quorle {

std::string WordsAsText(const WordGraph& words) {
    std::string text;
    WordCursor cursor(words);
    for (PackedWord word = 0; cursor.next(word);) {
        char letters[LongestWord];
        const std::size_t length = LengthOf(word);
        WriteLetters(word, length, letters);
        text.append(letters, length).push_back('\n');
    }
    return text;
}

}  // namespace Quorle
