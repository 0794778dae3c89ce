#include <malloc.h>

#include <memory>
#include <random>
#include <set>

#include "quorle/word_engine.h"
#include "rows.h"
#include "table.h"

namespace {

double MemoryInUse() {
    const struct mallinfo2 info = mallinfo2();
    return static_cast<double>(info.uordblks + info.hblkhd);
}

/// Words of a few syllables, not held.
WordList NewWords(std::size_t count, const WordList& held) {
    const std::set<std::string> known(held.begin(), held.end());
    std::mt19937 random(5);
    std::set<std::string> made;
    while (made.size() < count) {
        std::string word;
        for (std::size_t i = 2 + random() % 3; i > 0; --i) {
            word += "bcdfglmnprst"[random() % 12];
            word += "aeiou"[random() % 5];
        }
        if (!known.contains(word)) made.insert(word);
    }
    WordList words(made.begin(), made.end());
    for (std::size_t i = words.size(); i > 1; --i) std::swap(words[i - 1], words[random() % i]);
    return words;
}

double AfterAMillionEdits(const WordList& words) {
    const double before = MemoryInUse();
    for (std::size_t i = 0; i < 500000; ++i) {
        cDictionaryAdd(words[i % words.size()].c_str());
        cDictionaryRemove(words[i % words.size()].c_str());
    }
    return MemoryInUse() - before;
}

}  // namespace

void AddEditRows(const WordList& words) {
    const std::string dictionary = DictionaryOf("huge", words);
    const auto text = static_cast<double>(FileSize(TempFile("huge.txt")));
    cDictionaryClear();
    double before = MemoryInUse();
    cReadBinaryDictionary(dictionary.c_str());
    AddFigure({"memory after loading", "the text file's size", "1.5", "1.0"},
              Rounded((MemoryInUse() - before) / text));
    const WordList fresh = NewWords(20000, words);
    cDictionaryAdd(fresh[0].c_str());
    const double flat = AfterAMillionEdits(fresh);
    cStartDecodingWords(0, 0);
    const double listed = AfterAMillionEdits(fresh);
    AddFigure({"memory after a million edits, and with a listing open", "before them",
               "within 4 MB", "within 0.1 MB"},
              Rounded(flat / 1e6) + ", " + Rounded(listed / 1e6, " MB"));
    before = MemoryInUse();
    for (const std::string& word : fresh) cDictionaryAdd(word.c_str());
    AddFigure({"memory of an edit (20,000 words added)", "bytes", "1 KB", "200 bytes"},
              Rounded((MemoryInUse() - before) / 20000, " bytes"));

    auto set = std::make_shared<std::set<std::string>>(words.begin(), words.end());
    auto at = std::make_shared<std::size_t>(0);
    AddTimings(
        {"add and remove a word", "std::set", "1.8 ×", "2.5 ×"}, Compared::Ratio,
        [dictionary] { cReadBinaryDictionary(dictionary.c_str()); },
        [fresh, at] {
            const char* word = fresh[(*at)++ % fresh.size()].c_str();
            cDictionaryAdd(word);
            cDictionaryRemove(word);
        },
        [fresh, at, set] {
            const std::string& word = fresh[(*at)++ % fresh.size()];
            set->insert(word);
            set->erase(word);
        });
}
