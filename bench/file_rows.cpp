#include <marisa.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <memory>
#include <unordered_set>

#include "quorle/word_engine.h"
#include "rows.h"
#include "table.h"

namespace {

void BuildMarisa(marisa::Trie& trie, const std::string& text) {
    std::ifstream file(text);
    marisa::Keyset keys;
    for (std::string line; std::getline(file, line);) keys.push_back(line.c_str(), line.size());
    trie.build(keys);
}

void LoadSet(const std::string& text) {
    std::unordered_set<std::string> words;
    std::ifstream file(text);
    for (std::string line; std::getline(file, line);) words.insert(line);
}

void AddLoads(const std::string& dictionary, const std::string& text, const std::string& marisa) {
    const auto load = [dictionary] { cReadBinaryDictionary(dictionary.c_str()); };
    AddTimings({"load with all checks, again", "text into unordered_set", "39 ×", "100 ×"},
               Compared::Ratio, load, load, [text] { LoadSet(text); });
    AddTimings({"load with all checks, again", "marisa-trie's load", "20", "4"}, Compared::Share,
               load, load, [marisa] {
                   marisa::Trie trie;
                   trie.load(marisa.c_str());
               });
}

void AddMerges(const std::string& text) {
    const auto nothing = [] {};
    AddTimings(
        {"merge of a whole list into an empty dictionary", "marisa-trie's build", "4.5 ×", "6 ×"},
        Compared::Ratio, nothing,
        [text] {
            cDictionaryClear();
            Merge(text);
        },
        [text] {
            marisa::Trie trie;
            BuildMarisa(trie, text);
        },
        1);
    const std::string american = TempFile("american.txt");
    const std::string insane = TempFile("insane.txt");
    const WordList americanWords = ReadWordList("american-english");
    Require(!americanWords.empty(), "the list of wamerican is not installed");
    const std::string dictionary = DictionaryOf("american", americanWords);
    WriteText(insane, ReadWordList("american-english-insane"));
    const std::string sorted = TempFile("sorted.txt");
    const std::string sort = "LC_ALL=C sort -u -o " + sorted + " " + american + " " + insane;
    Require(std::system(sort.c_str()) == 0, "sort");
    double longest = 1000;
    for (int i = 0; i < 5; ++i) {
        cReadBinaryDictionary(dictionary.c_str());
        longest = std::min(longest, Merge(insane));
    }
    const std::string merged = TempFile("merged.txt");
    cWriteTextFile(merged.c_str());
    Require(std::system(("cmp -s " + merged + " " + sorted).c_str()) == 0, "merge");
    AddFigure({"longest merge step", "a frame of 16 ms", "under 8 ms", "under 4 ms"},
              Rounded(longest, " ms"));
    AddTimings(
        {"merge of american-english-insane into american-english", "sort -u of both", "0.55",
         "0.3"},
        Compared::ShareByClock, [dictionary] { cReadBinaryDictionary(dictionary.c_str()); },
        [insane] { Merge(insane); }, [sort] { Require(std::system(sort.c_str()) == 0, "sort"); },
        1);
}

}  // namespace

void AddFileRows(const WordList& words) {
    const std::string dictionary = DictionaryOf("huge", words);
    const std::string text = TempFile("huge.txt");
    const std::string marisa = TempFile("huge.marisa");
    marisa::Trie trie;
    BuildMarisa(trie, text);
    trie.save(marisa.c_str());
    const auto size = static_cast<double>(FileSize(dictionary));
    AddFigure({"file size", "the text file", "0.25", "0.15"},
              Rounded(size / static_cast<double>(FileSize(text))));
    AddFigure({"file size", "marisa-trie's", "1.35", "0.90"},
              Rounded(size / static_cast<double>(FileSize(marisa))));
    AddLoads(dictionary, text, marisa);
    AddMerges(text);
}
