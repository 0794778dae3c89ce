#include "quorle/word_engine.h"

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "board_search.h"
#include "current_dictionary.h"
#include "damaged_file.h"
#include "dictionary_file.h"
#include "graph_rebuild.h"
#include "read_file.h"
#include "replace_file.h"
#include "settings_file.h"
#include "word_cursor.h"
#include "word_file_export.h"
#include "word_file_merge.h"

// The flat interface: checks what callers pass, and lets no exception out.

namespace {

WordCursor Listing;

struct LastSearch {
    std::unique_ptr<BoardSearch> search;  // made by the first search
    Board board{};
    std::vector<FoundWord> words;
    std::optional<Speller> speller;  // once the words are sorted
    std::vector<FoundWord> room;     // for sorting
};

LastSearch Found;

/// Runs `work`; `nothing` when memory runs out.
template <class Result, class Work>
Result Guarded(Result nothing, const Work& work) {
    try {
        return work();
    } catch (...) {
        return nothing;
    }
}

bool IsLetters(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char c) { return c >= 'a' && c <= 'z'; });
}

/// At most 17 characters, so that a text without end is not read.
std::string_view Beginning(const char* text) {
    std::size_t size = 0;
    while (size <= LongestWord && text[size] != 0) ++size;
    return {text, size};
}

bool IsWord(std::string_view text) {
    return text.size() >= ShortestWordSize && text.size() <= LongestWordSize && IsLetters(text);
}

bool IsWordSize(std::int32_t size) {
    return size >= ShortestWordSize && size <= LongestWordSize;
}

bool IsPrefix(std::int32_t first, std::int32_t second) {
    return first >= 0 && first < Letters && second >= 0 && second < Letters;
}

std::array<char, 2> Prefix(std::int32_t first, std::int32_t second) {
    return {static_cast<char>('a' + first), static_cast<char>('a' + second)};
}

bool LoadDictionary(const char* path) {
    std::vector<std::byte> bytes;
    DictionaryContent content;
    if (!ReadRegularFile(path, bytes) || !DecodeDictionary(bytes, content)) {
        RememberDamaged(path);
        return false;
    }
    ForgetDamaged(path);
    TheDictionary.words = std::move(content.words);
    TheDictionary.maxWordSize = content.maxWordSize;
    return true;
}

/// Words found on a board that is 16 letters.
void SearchBoard(std::string_view letters) {
    std::copy(letters.begin(), letters.end(), Found.board.begin());
    Found.speller.reset();
    // Out of memory, a search is left in its midst, and must not be used again.
    auto search = Found.search ? std::move(Found.search) : std::make_unique<BoardSearch>();
    search->search(TheDictionary.words, Found.board,
                   {TheDictionary.minWordSize, TheDictionary.maxWordSize}, Found.words);
    Found.search = std::move(search);
}

/// Word i, of those there are, in alphabetical order; returns the number of its letters.
std::size_t SpellFound(std::size_t i, char* letters) {
    if (!Found.speller) {
        SortFound(Found.words, Found.room);
        Found.speller.emplace(Found.board);
    }
    return (*Found.speller)(Found.words[i], letters);
}

}  // namespace

int32_t cReadBinaryDictionary(const char* path) {
    return Guarded(0, [&] { return path != nullptr && LoadDictionary(path) ? 1 : 0; });
}

int32_t cWriteBinaryDictionary(const char* path) {
    return Guarded(0, [&] {
        if (path == nullptr) return 0;
        const auto bytes = EncodeDictionary({TheDictionary.words, TheDictionary.maxWordSize});
        return ReplaceFile(path, bytes) ? 1 : 0;
    });
}

int32_t cDictionaryCheck(char* word, int32_t* found, int32_t* other) {
    if (found == nullptr || other == nullptr) return 0;
    *found = *other = 0;
    if (word == nullptr || word[0] == 0) return 0;
    GraphPlace place{};
    if (!TheDictionary.words.find(word, place)) return 0;
    *other = 1;
    *found = place.isWord ? 1 : 0;
    return *found;
}

int32_t cDictionaryAdd(const char* word) {
    return Guarded(0, [&] {
        if (word == nullptr) return 0;
        const std::string_view letters = Beginning(word);
        const auto longest = static_cast<std::size_t>(TheDictionary.maxWordSize);
        if (!IsWord(letters) || letters.size() > longest) return 0;
        TheDictionary.words.add(letters);
        return 1;
    });
}

int32_t cDictionaryRemove(const char* word) {
    return Guarded(0, [&] {
        if (word == nullptr || !IsWord(Beginning(word))) return 0;
        return TheDictionary.words.remove(Beginning(word)) ? 1 : 0;
    });
}

int32_t cDictionaryClear(void) {
    TheDictionary.words = WordGraph();
    return 1;
}

int32_t cNumberOfWords(void) {
    return static_cast<int32_t>(TheDictionary.words.size());
}

int32_t cDictIndex(int32_t first, int32_t second) {
    if (!IsPrefix(first, second)) return -1;
    const auto prefix = Prefix(first, second);
    return static_cast<int32_t>(TheDictionary.words.firstIndex({prefix.data(), prefix.size()}));
}

int32_t cStartDecodingWords(int32_t first, int32_t second) {
    if (!IsPrefix(first, second)) return 0;
    const auto prefix = Prefix(first, second);
    Listing = WordCursor(TheDictionary.words, {prefix.data(), prefix.size()});
    return 1;
}

int16_t cDecodeNextWord(char* buffer) {
    std::string_view word;
    if (buffer == nullptr || !Listing.next(word)) return 0;
    std::copy(word.begin(), word.end(), buffer);
    return static_cast<int16_t>(word.size());
}

int32_t cReadTextFile(const char* path) {
    return Guarded(100, [&] { return MergeStep(path); });
}

int32_t cWriteTextFile(const char* path) {
    return Guarded(0, [&] { return path != nullptr && ExportWords(path) ? 1 : 0; });
}

int32_t cCheckForAllDefinedWords(const char* board) {
    Found.words.clear();
    const std::int32_t count = Guarded(-1, [&] {
        if (board == nullptr || Beginning(board).size() != Cubes || !IsLetters(Beginning(board))) {
            return 0;
        }
        SearchBoard(Beginning(board));
        return static_cast<int32_t>(Found.words.size());
    });
    if (count < 0) Found.words.clear();
    return std::max(count, 0);
}

int32_t cGetDefinedWord(int32_t i, char* buffer, int32_t* n) {
    if (n == nullptr) return 0;
    *n = 0;
    if (buffer == nullptr || i < 0 || static_cast<std::size_t>(i) >= Found.words.size()) return 0;
    return Guarded(0, [&] {
        *n = static_cast<int32_t>(SpellFound(static_cast<std::size_t>(i), buffer));
        return 1;
    });
}

int32_t cMinWordSize(void) {
    return TheDictionary.minWordSize;
}
int32_t cMaxWordSize(void) {
    return TheDictionary.maxWordSize;
}

int32_t cSetMinWordSize(int32_t size) {
    if (!IsWordSize(size)) return 0;
    TheDictionary.minWordSize = size;
    return 1;
}

int32_t cSetMaxWordSize(int32_t size) {
    if (!IsWordSize(size)) return 0;
    TheDictionary.maxWordSize = size;
    return 1;
}

int32_t cReduceWordSize(void) {
    return Guarded(0, [&] {
        TheDictionary.words =
            Rebuilt(TheDictionary.words, static_cast<std::uint32_t>(TheDictionary.maxWordSize));
        return 1;
    });
}

int32_t cGetRegValue(const char* key, const char* name, char* buffer, int32_t* n) {
    if (n == nullptr) return 0;
    const std::int32_t room = *n;
    *n = 0;
    return Guarded(0, [&] {
        std::string value;
        if (key == nullptr || name == nullptr || buffer == nullptr || room < 0 ||
            !GetSetting(key, name, value) || value.size() > static_cast<std::size_t>(room)) {
            return 0;
        }
        std::copy(value.begin(), value.end(), buffer);
        *n = static_cast<int32_t>(value.size());
        return 1;
    });
}

int32_t cSetRegValue(const char* key, const char* name, const char* text, int32_t length) {
    return Guarded(0, [&] {
        if (key == nullptr || name == nullptr || text == nullptr || length < 0) return 0;
        return SetSetting(key, name, {text, static_cast<std::size_t>(length)}) ? 1 : 0;
    });
}
