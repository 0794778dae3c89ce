// Makes the corpus of the dictionary file's fuzz target: a few small dictionaries, as the engine
// saves them. Argument: the folder.
#include <filesystem>
#include <fstream>
#include <string>

#include "quorle/word_engine.h"

namespace {

bool Make(const std::string& path, const std::string& words, std::int32_t maxWordSize) {
    const std::string text = path + ".txt";
    std::ofstream(text) << words;
    cDictionaryClear();
    cSetMaxWordSize(maxWordSize);
    for (auto percent = cReadTextFile(text.c_str()); percent < 100;)
        percent = cReadTextFile("dummy");
    std::filesystem::remove(text);
    return cWriteBinaryDictionary(path.c_str()) == 1;
}

/// Words that share beginnings and ends in many ways.
std::string ManyWords() {
    std::string words;
    for (unsigned n = 2; n < 600; ++n) {
        for (unsigned rest = n; rest > 0; rest /= 3) words += static_cast<char>('a' + rest % 3 * 9);
        words += n % 7 == 0 ? "ings\n" : "ed\n";
    }
    return words;
}

}  // namespace

int main(int count, char** arguments) {
    if (count != 2) return 2;
    const std::string folder = arguments[1];
    std::filesystem::create_directories(folder);
    const bool made = Make(folder + "/empty", "", 16) && Make(folder + "/one", "cat", 2 + 1) &&
                      Make(folder + "/runs", "aa aaa aaaaaaaaaaaaaaaa zz", 16) &&
                      Make(folder + "/few", "cat cats act bone bones iraq suq quit zebra", 9) &&
                      Make(folder + "/many", ManyWords(), 12);
    return made ? 0 : 1;
}
