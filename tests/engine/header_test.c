/* The header alone is enough for a caller in C. */
#include <quorle/word_engine.h>

int main(void) {
    char word[16] = "cats";
    int32_t found = 0;
    int32_t other = 0;
    return cDictionaryAdd(word) == 1 && cDictionaryCheck(word, &found, &other) == 1 ? 0 : 1;
}
