#pragma once
// What the fuzz targets share. Each target defines LLVMFuzzerTestOneInput and drives the engine
// through its interface; a wrong result ends the program as a crash does.
#include <stdlib.h>

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <set>
#include <string>
#include <string_view>

#include "quorle/word_engine.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

#define REQUIRE(condition) \
    if (!(condition)) Fuzz::Fail(#condition, __FILE__, __LINE__)

namespace Fuzz {

[[noreturn]] inline void Fail(const char* condition, const char* file, int line) {
    std::fprintf(stderr, "%s:%d: not so: %s\n", file, line, condition);
    std::abort();
}

/// This process's folder, in memory where the system has such; also the home of its settings.
inline const std::string& Folder() {
    static const std::string folder = [] {
        const bool inMemory = std::filesystem::is_directory("/dev/shm");
        std::string path = inMemory ? "/dev/shm/quorle_fuzz_XXXXXX" : "/tmp/quorle_fuzz_XXXXXX";
        if (mkdtemp(path.data()) == nullptr) std::abort();
        setenv("XDG_CONFIG_HOME", path.c_str(), 1);
        static std::string made = path;
        std::atexit([] { std::filesystem::remove_all(made); });
        return path;
    }();
    return folder;
}

/// Puts a file into the folder and returns its path.
inline std::string Write(const std::string& name, std::string_view content) {
    std::string path = Folder() + "/" + name;
    std::filesystem::create_directories(std::filesystem::path(path).parent_path());
    std::ofstream(path, std::ios::binary) << content;
    return path;
}

inline std::string_view Text(const std::uint8_t* data, std::size_t size) {
    return {reinterpret_cast<const char*>(data), size};
}

/// Merges the file to its end; percentages must not fall.
inline void Merge(const std::string& path) {
    std::int32_t percent = cReadTextFile(path.c_str());
    while (percent < 100) {
        const std::int32_t next = cReadTextFile("dummy");
        REQUIRE(next >= percent);
        percent = next;
    }
    REQUIRE(percent == 100);
}

/// Reads what a listing has left; its words must ascend.
template <typename Words>
void ReadListing(Words& words) {
    char buffer[17] = {};
    std::string last;
    while (const std::int16_t length = cDecodeNextWord(buffer)) {
        REQUIRE(length >= 2 && length <= 16);
        const std::string word(buffer, static_cast<std::size_t>(length));
        REQUIRE(last < word);
        words.insert(words.end(), word);
        last = word;
    }
}

template <typename Words>
void List(std::int32_t first, std::int32_t second, Words& words) {
    REQUIRE(cStartDecodingWords(first, second) == 1);
    ReadListing(words);
}

inline std::set<std::string> AllWords() {
    std::set<std::string> words;
    for (std::int32_t first = 0; first < 26; ++first) {
        for (std::int32_t second = 0; second < 26; ++second) List(first, second, words);
    }
    return words;
}

/// The results of a search, which must ascend and be as many as it said.
inline std::set<std::string> Results(std::int32_t count) {
    std::set<std::string> words;
    for (std::int32_t i = -1; i <= count; ++i) {
        char buffer[17] = {};
        std::int32_t length = 16;
        const bool inside = i >= 0 && i < count;
        REQUIRE(cGetDefinedWord(i, buffer, &length) == (inside ? 1 : 0));
        REQUIRE(length == static_cast<std::int32_t>(std::string_view(buffer).size()));
        if (inside) REQUIRE(std::next(words.insert(words.end(), buffer)) == words.end());
    }
    REQUIRE(static_cast<std::int32_t>(words.size()) == count);
    return words;
}

}  // namespace Fuzz
