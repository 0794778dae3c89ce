#pragma once
// The engine's calls with texts and sets of words. A promise of the interface that is broken
// throws: a test fails by that, and a fuzz target ends.
#include <quorle/word_engine.h>

#include <functional>
#include <random>
#include <set>
#include <stdexcept>
#include <string>
#include <string_view>

#define REQUIRE(condition) \
    if (!(condition)) throw std::logic_error("not so: " #condition)

using WordSet = std::set<std::string>;
using Random = std::minstd_rand;

inline std::string Text(Random& random, std::size_t size, std::string_view letters) {
    std::string text;
    while (text.size() < size) text += letters[random() % letters.size()];
    return text;
}

/// The words that `next` writes, one a call: in order, and nothing beside their letters.
inline WordSet Written(const std::function<std::int32_t(char*)>& next) {
    WordSet words;
    std::string word(17, '?');
    while (const std::int32_t length = next(word.data())) {
        word.resize(word.find('?'));
        REQUIRE(length == static_cast<std::int32_t>(word.size()) && length >= 2);
        REQUIRE(words.empty() || *words.rbegin() < word);
        words.insert(words.end(), word);
        word.assign(17, '?');
    }
    return words;
}

/// Every word held, prefix by prefix.
inline WordSet AllWords() {
    WordSet words;
    for (std::int32_t prefix = 0; prefix < 26 * 26; ++prefix) {
        const auto index = static_cast<std::int32_t>(words.size());
        REQUIRE(cStartDecodingWords(prefix / 26, prefix % 26) == 1);
        words.merge(Written(cDecodeNextWord));
        const bool any = static_cast<std::int32_t>(words.size()) > index;
        REQUIRE(cDictIndex(prefix / 26, prefix % 26) == (any ? index : -1));
    }
    REQUIRE(cNumberOfWords() == static_cast<std::int32_t>(words.size()));
    return words;
}

/// The words of a search that has found so many.
inline WordSet Found(std::int32_t count) {
    return Written([count, i = -1](char* buffer) mutable {
        std::int32_t length = 7;
        ++i;
        REQUIRE(cGetDefinedWord(i, buffer, &length) == (i < count ? 1 : 0));
        return length;
    });
}

/// A step of a merge; `percent`: what the last one returned.
inline std::int32_t Step(std::int32_t percent, const char* path = "dummy") {
    const std::int32_t next = cReadTextFile(path);
    REQUIRE(next >= percent && next <= 100);
    return next;
}

inline void Finish(std::int32_t percent) {
    while (percent < 100) percent = Step(percent);
}

inline std::string Setting(const std::string& key, const std::string& name) {
    std::string value(255, '?');
    std::int32_t length = 255;
    const std::int32_t present = cGetRegValue(key.c_str(), name.c_str(), value.data(), &length);
    REQUIRE(length >= 0 && length <= 255 && (present == 1 || length == 0));
    return present == 1 ? value.substr(0, static_cast<std::size_t>(length)) : "absent";
}

/// The dictionary file with the CRC-32C of all its other bytes put in, where it has the room.
inline std::string Sealed(std::string file) {
    constexpr std::size_t At = 4, End = 8;
    std::uint32_t checksum = ~0U;
    for (std::size_t i = 0; i < file.size(); ++i) {
        if (i >= At && i < End) continue;
        checksum ^= static_cast<unsigned char>(file[i]);
        for (int bit = 0; bit < 8; ++bit) checksum = checksum >> 1 ^ (checksum & 1) * 0x82F63B78U;
    }
    for (std::size_t i = At; i < End && file.size() >= End; ++i, checksum >>= 8) {
        file[i] = static_cast<char>(~checksum);
    }
    return file;
}
