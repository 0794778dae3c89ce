#include <marisa.h>

#include <algorithm>
#include <chrono>
#include <memory>
#include <random>
#include <unordered_set>

#include "quorle/word_engine.h"
#include "rows.h"
#include "table.h"

namespace {

/// Words held, and as many with a letter changed, mixed.
std::vector<std::string> Questions(const WordList& words) {
    std::mt19937 random(3);
    std::vector<std::string> questions;
    for (int i = 0; i < 50000; ++i) {
        questions.push_back(words[random() % words.size()]);
        std::string other = words[random() % words.size()];
        other[random() % other.size()] = static_cast<char>('a' + random() % 26);
        questions.push_back(other);
    }
    std::shuffle(questions.begin(), questions.end(), random);
    return questions;
}

bool Held(std::string& word) {
    std::int32_t found = 0;
    std::int32_t other = 0;
    return cDictionaryCheck(word.data(), &found, &other) != 0;
}

/// Nanoseconds a word, the shortest of five listings of all words.
double ListingTime() {
    double shortest = 1e9;
    for (int run = 0; run < 5; ++run) {
        const auto begin = std::chrono::steady_clock::now();
        char word[16];
        for (int prefix = 0; prefix < 26 * 26; ++prefix) {
            cStartDecodingWords(prefix / 26, prefix % 26);
            while (cDecodeNextWord(word) != 0) continue;
        }
        const std::chrono::duration<double, std::nano> time =
            std::chrono::steady_clock::now() - begin;
        shortest = std::min(shortest, time.count() / cNumberOfWords());
    }
    return shortest;
}

}  // namespace

void AddLookupRows(const WordList& words) {
    const std::string dictionary = DictionaryOf("huge", words);
    const auto prepare = [dictionary] { cReadBinaryDictionary(dictionary.c_str()); };
    auto set = std::make_shared<std::unordered_set<std::string>>(words.begin(), words.end());
    auto trie = std::make_shared<marisa::Trie>();
    marisa::Keyset keys;
    for (const std::string& word : words) keys.push_back(word.c_str(), word.size());
    trie->build(keys);
    auto agent = std::make_shared<marisa::Agent>();
    auto questions = std::make_shared<std::vector<std::string>>(Questions(words));
    prepare();
    AddFigure({"listing a word", "nanoseconds", "30", "20"}, Rounded(ListingTime(), " ns"));
    for (std::string& word : *questions) {
        agent->set_query(word.c_str(), word.size());
        const bool held = set->contains(word);
        Require(Held(word) == held && trie->lookup(*agent) == held, word.c_str());
    }
    auto at = std::make_shared<std::size_t>(0);
    const auto next = [questions, at]() -> std::string& {
        return (*questions)[(*at)++ % questions->size()];
    };
    const auto ours = [next] { Held(next()); };
    AddTimings({"lookup, hits and misses", "unordered_set", "2.2 ×", "3 ×"}, Compared::Ratio,
               prepare, ours, [next, set] { return set->contains(next()); });
    AddTimings({"lookup, hits and misses", "marisa-trie", "7 ×", "10 ×"}, Compared::Ratio, prepare,
               ours, [next, trie, agent] {
                   const std::string& word = next();
                   agent->set_query(word.c_str(), word.size());
                   return trie->lookup(*agent);
               });
}
