/* The header alone is enough for a caller in C. */
#undef NDEBUG
#include <quorle/word_engine.h>

#include <assert.h>

int main(void) {
    char letters[16] = "cats";
    int32_t found = 7;
    int32_t other = 7;
    assert(cDictionaryAdd("cats") == 1);
    assert(cDictionaryCheck(letters, &found, &other) == 1 && found == 1 && other == 1);
    assert(cStartDecodingWords(2, 0) == 1 && cDecodeNextWord(letters) == 4);
    assert(cCheckForAllDefinedWords("catsxxxxxxxxxxxx") == 1);
    assert(cGetDefinedWord(0, letters, &found) == 1 && found == 4);
    return 0;
}
