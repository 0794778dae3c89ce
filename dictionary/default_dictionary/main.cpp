// Makes the default dictionary from word lists at build time:
//   default_dictionary OUTPUT REAL_WORDS LIST...
// OUTPUT is the dictionary file to write, REAL_WORDS names the words without a
// vowel that are taken all the same. Prints the number of words.
#include <quorle/word_engine.h>

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <set>
#include <string>

namespace {

using Words = std::set<std::string>;

bool IsWord(const std::string& line) {
    return line.size() >= 2 && line.size() <= 16 &&
           std::all_of(line.begin(), line.end(), [](char c) { return c >= 'a' && c <= 'z'; });
}

// The lists hold a few signs of units ("kb", "lm"); having no vowel tells them.
bool HasVowel(const std::string& word) {
    return word.find_first_of("aeiouy") != std::string::npos;
}

bool ReadWords(const char* path, Words& words) {
    std::ifstream file(path);
    for (std::string line; std::getline(file, line);) {
        if (IsWord(line)) words.insert(line);
    }
    return file.eof() && !words.empty();
}

int Fail(const char* what, const char* path) {
    std::fprintf(stderr, "default_dictionary: cannot %s %s\n", what, path);
    return 1;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc < 4) return Fail("work without", "OUTPUT REAL_WORDS LIST...");
    Words real;
    if (!ReadWords(argv[2], real)) return Fail("read", argv[2]);
    Words words;
    for (int i = 3; i < argc; ++i) {
        if (!ReadWords(argv[i], words)) return Fail("read", argv[i]);
    }
    for (const std::string& word : words) {
        if (!HasVowel(word) && real.count(word) == 0) continue;
        if (cDictionaryAdd(word.c_str()) == 0) return Fail("add", word.c_str());
    }
    if (cWriteBinaryDictionary(argv[1]) == 0) return Fail("write", argv[1]);
    std::printf("%d words in %s\n", static_cast<int>(cNumberOfWords()), argv[1]);
    return 0;
}
