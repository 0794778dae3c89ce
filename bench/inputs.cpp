#include "inputs.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <random>

#include "quorle/word_engine.h"

namespace {

struct TempFolder {
    std::filesystem::path path;
    TempFolder() {
        std::string name = std::filesystem::temp_directory_path() / "engine_bench.XXXXXX";
        if (mkdtemp(name.data()) == nullptr) std::abort();
        path = name;
    }
    ~TempFolder() { std::filesystem::remove_all(path); }
};

// Letters about as frequent as on the cubes of the game.
constexpr std::string_view Frequent =
    "eeeeeeeeeeettttttttaaaaaaoooooooiiiiiinnnnnnssssssrrrrrhhhhhllllddduuummwwwyyyggccffppbbvvkjxz"
    "q";

}  // namespace

WordList ReadWordList(const std::string& name) {
    std::ifstream file("/usr/share/dict/" + name);
    WordList words;
    for (std::string line; std::getline(file, line);) {
        const bool letters =
            std::all_of(line.begin(), line.end(), [](char c) { return c >= 'a' && c <= 'z'; });
        if (letters && line.size() >= 2 && line.size() <= 16) words.push_back(line);
    }
    std::sort(words.begin(), words.end());
    words.erase(std::unique(words.begin(), words.end()), words.end());
    return words;
}

WordList Runs() {
    WordList words;
    for (std::size_t size = 2; size <= 16; ++size) words.emplace_back(size, 'a');
    return words;
}

std::string TempFile(const std::string& name) {
    static const TempFolder folder;
    return folder.path / name;
}

void WriteText(const std::string& path, const WordList& words) {
    std::ofstream file(path);
    for (const std::string& word : words) file << word << '\n';
}

std::size_t FileSize(const std::string& path) {
    return std::filesystem::file_size(path);
}

std::string DictionaryOf(const std::string& name, const WordList& words) {
    std::string path = TempFile(name + ".dat");
    if (std::filesystem::exists(path)) return path;
    WriteText(TempFile(name + ".txt"), words);
    cDictionaryClear();
    Merge(TempFile(name + ".txt"));
    if (cWriteBinaryDictionary(path.c_str()) != 1) std::abort();
    return path;
}

double Merge(const std::string& path) {
    using Clock = std::chrono::steady_clock;
    double longest = 0;
    const char* next = path.c_str();
    for (int percent = 0; percent < 100; next = "dummy") {
        const auto begin = Clock::now();
        percent = cReadTextFile(next);
        const std::chrono::duration<double, std::milli> step = Clock::now() - begin;
        longest = std::max(longest, step.count());
    }
    return longest;
}

std::vector<std::string> RandomBoards(int count) {
    std::mt19937 random(2026);
    std::vector<std::string> boards;
    for (int i = 0; i < count; ++i) {
        std::string board(16, ' ');
        for (char& cube : board) cube = Frequent[random() % Frequent.size()];
        boards.push_back(board);
    }
    return boards;
}

std::vector<std::string> FewLetterBoards() {
    return {std::string(16, 'a'), std::string(16, 'e'), std::string(16, 's'), "esesseseeseseses",
            "aeaeeaeaaeaeaeea",   "ststtstsstststts",   "nonoonononooonon",   "aaaasaaaaasaaaaa"};
}
