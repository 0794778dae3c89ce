#pragma once
// What the fuzz targets share. Each target defines LLVMFuzzerTestOneInput and drives the engine
// through its interface; a wrong result ends the program as a crash does.
#include <stdlib.h>

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
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

/// The words of a listing, which must ascend.
template <typename Words>
void List(std::int32_t first, std::int32_t second, Words& words) {
    char buffer[16];
    std::string last;
    REQUIRE(cStartDecodingWords(first, second) == 1);
    while (const std::int16_t length = cDecodeNextWord(buffer)) {
        REQUIRE(length >= 2 && length <= 16);
        const std::string word(buffer, static_cast<std::size_t>(length));
        REQUIRE(last < word && word[0] == 'a' + first && word[1] == 'a' + second);
        words.insert(words.end(), word);
        last = word;
    }
}

}  // namespace Fuzz
