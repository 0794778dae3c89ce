/* The header alone is enough for a caller in C. */
#include <quorle/word_engine.h>
#include <stdio.h>
#include <string.h>

static int failures;

static void Expect(int holds, const char* what) {
    if (holds) return;
    ++failures;
    printf("failed: %s\n", what);
}

int main(void) {
    char word[17] = "cat";
    char buffer[16] = "xxxxxxxxxxxxxxx";
    int32_t found = 7;
    int32_t other = 7;
    int32_t n = 7;

    Expect(cDictionaryAdd("cat") == 1 && cDictionaryAdd("cats") == 1, "adding");
    Expect(cDictionaryCheck(word, &found, &other) == 1 && found == 1 && other == 1, "checking");
    Expect(cStartDecodingWords(2, 0) == 1 && cDecodeNextWord(buffer) == 3, "listing");
    Expect(memcmp(buffer, "catxxxxx", 8) == 0, "letters alone are written");
    Expect(cCheckForAllDefinedWords("catsxxxxxxxxxxxx") == 2, "searching");
    Expect(cGetDefinedWord(1, buffer, &n) == 1 && n == 4, "fetching");
    Expect(memcmp(buffer, "catsxxxx", 8) == 0, "the word fetched");
    return failures;
}
