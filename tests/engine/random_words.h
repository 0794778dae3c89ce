#pragma once
// Words and boards by chance, the same for the same seed.
#include <algorithm>
#include <random>
#include <set>
#include <string>

class RandomWords {
  public:
    explicit RandomWords(std::uint32_t seed) : random_(seed) {}

    int below(int n) { return std::uniform_int_distribution(0, n - 1)(random_); }

    /// 2 to `longest` letters of the first `letters` of "eaqstiru...".
    std::string word(int letters, int longest = 16) {
        std::string text(static_cast<std::size_t>(2 + below(longest - 1)), ' ');
        for (char& c : text) c = letter(letters);
        return text;
    }
    std::string board(int letters) {
        std::string text(16, ' ');
        for (char& c : text) c = letter(letters);
        return text;
    }
    std::set<std::string> words(int count, int letters, int longest = 16) {
        std::set<std::string> all;
        for (int i = 0; i < count; ++i) all.insert(word(letters, longest));
        return all;
    }

  private:
    char letter(int letters) {
        return "uaqeistrnlodcmphgbyfvkwzxj"[static_cast<std::size_t>(below(letters))];
    }

    std::mt19937 random_;
};
