#include "dictionary/dictionary.h"

#include <quorle/word_engine.h>

#include "platform/platform.h"

namespace {

std::string FilePath() {
    return Platform::ProgramFolder() + "/Dictionary.dat";
}

}  // namespace

namespace Dictionary {

void LoadDictionary() {
    State.LetterBase = 'a';
    cReadBinaryDictionary(FilePath().c_str());
    State.DictionaryChanged = False;
}

void SaveDictionary() {
    cWriteBinaryDictionary(FilePath().c_str());
}

Boolean IsInDictionary(const std::string& word) {
    std::string asked = word;
    std::int32_t found = 0;
    std::int32_t begun = 0;
    cDictionaryCheck(asked.data(), &found, &begun);
    return ToBoolean(found != 0);
}

void AddToDictionary(const std::string& word) {
    cDictionaryAdd(word.c_str());
    State.DictionaryChanged = True;
}

void RemoveFromDictionary(const std::string& word) {
    cDictionaryRemove(word.c_str());
    State.DictionaryChanged = True;
}

void ShortenDictionary(std::int16_t letters) {
    cSetMaxWordSize(letters);
    cReduceWordSize();
    State.DictionaryChanged = True;
}

}  // namespace Dictionary
