#include "quorle/word_engine.h"

#include <algorithm>
#include <filesystem>
#include <set>

#include "dictionary_file/dictionary_file.h"
#include "files/replace_file.h"
#include "graph/graph_builder.h"
#include "search/board_search.h"
#include "settings/settings_file.h"
#include "word_file/merge_line.h"

// The flat interface: checks what callers pass, and lets no exception out.

using namespace Quorle;

namespace {

/// All that the engine holds between two calls.
struct EngineState {
    Dictionary dictionary;
    WordCursor listing;
    std::unique_ptr<BoardSearch> search;  // made by the first one
    FoundWords found;
    MergeLine merges{dictionary};
    std::set<std::string> unreadable;  // dictionary files, by their path without links
};

EngineState State;

/// Runs `work`; `nothing` when memory runs out.
template <class Result, class Work>
Result Guarded(Result nothing, const Work& work) {
    try {
        return work();
    } catch (...) {
        return nothing;
    }
}

bool IsWordSize(std::int32_t size) {
    return size >= 2 && size <= std::int32_t{LongestWord};
}

/// A text of 2 to 16 letters; empty when it is none. A text without end is not read on.
std::string_view Word(const char* text) {
    std::size_t size = 0;
    while (text != nullptr && size <= LongestWord && text[size] >= 'a' && text[size] <= 'z') ++size;
    const bool isWord = IsWordSize(static_cast<std::int32_t>(size)) && text[size] == 0;
    return isWord ? std::string_view(text, size) : "";
}

/// Two letters by their numbers; empty when there are no such letters.
std::string Prefix(std::int32_t first, std::int32_t second) {
    if (first < 0 || first >= Letters || second < 0 || second >= Letters) return {};
    return {static_cast<char>('a' + first), static_cast<char>('a' + second)};
}

std::string PathWithoutLinks(const char* path) {
    std::error_code error;
    return std::filesystem::canonical(path, error).string();
}

bool LoadDictionary(const char* path) {
    std::vector<std::byte> bytes;
    DictionaryContent content;
    const std::string place = PathWithoutLinks(path);
    const bool isRead = ReadFileAt(AT_FDCWD, path, bytes) == ReadResult::Done;
    if (!isRead || !DecodeDictionary(bytes, content)) {
        if (!place.empty()) State.unreadable.insert(place);
        return false;
    }
    State.unreadable.erase(place);
    State.dictionary.replace(std::move(content.words));
    State.dictionary.limits.longest = content.maxWordSize;
    return true;
}

/// A dictionary that could not be read is not lost when it is replaced.
bool Save(const char* path, std::span<const std::byte> content) {
    const std::string place = PathWithoutLinks(path);
    const bool stays = State.unreadable.contains(place);
    if (!ReplaceFile(LockTarget(path), content, stays ? Old::Stays : Old::Goes)) return false;
    State.unreadable.erase(place);
    return true;
}

/// Every word, in alphabetical order, one a line.
std::string WordsAsText(const WordGraph& words) {
    std::string text;
    WordCursor cursor(words);
    for (PackedWord word = cursor.next(); word != NoWord; word = cursor.next()) {
        char letters[LongestWord];
        WriteLetters(word, LengthOf(word), letters);
        text.append(letters, LengthOf(word)).push_back('\n');
    }
    return text;
}

}  // namespace

int32_t cReadBinaryDictionary(const char* path) {
    return Guarded(0, [&] { return path != nullptr && LoadDictionary(path) ? 1 : 0; });
}

int32_t cWriteBinaryDictionary(const char* path) {
    return Guarded(0, [&] {
        if (path == nullptr) return 0;
        const Dictionary& all = State.dictionary;
        return Save(path, EncodeDictionary({all.words(), all.limits.longest})) ? 1 : 0;
    });
}

int32_t cDictionaryCheck(char* word, int32_t* found, int32_t* other) {
    if (found == nullptr || other == nullptr) return 0;
    *found = *other = 0;
    if (word == nullptr || word[0] == 0) return 0;
    const std::uint32_t letters = State.dictionary.lookUp(word);
    *other = letters != 0 ? 1 : 0;
    *found = (letters & WordEnds) != 0 ? 1 : 0;
    return *found;
}

int32_t cDictionaryAdd(const char* text) {
    return Guarded(0, [&] {
        const std::string_view word = Word(text);
        const auto longest = static_cast<std::size_t>(State.dictionary.limits.longest);
        if (word.empty() || word.size() > longest) return 0;
        State.dictionary.set(text, true);
        return 1;
    });
}

int32_t cDictionaryRemove(const char* text) {
    return Guarded(
        0, [&] { return !Word(text).empty() && State.dictionary.set(text, false) ? 1 : 0; });
}

int32_t cDictionaryClear(void) {
    State.dictionary.replace({});
    return 1;
}

int32_t cNumberOfWords(void) {
    return static_cast<int32_t>(State.dictionary.words().size());
}

int32_t cDictIndex(int32_t first, int32_t second) {
    const std::string prefix = Prefix(first, second);
    const Edge place = State.dictionary.words().find(prefix);
    if (prefix.empty() || place.letters == 0) return -1;
    return static_cast<int32_t>(place.before) - (place.isWord() ? 1 : 0);
}

int32_t cStartDecodingWords(int32_t first, int32_t second) {
    const std::string prefix = Prefix(first, second);
    if (prefix.empty()) return 0;
    State.listing = WordCursor(State.dictionary.words(), prefix);
    return 1;
}

int16_t cDecodeNextWord(char* buffer) {
    const PackedWord word = buffer == nullptr ? NoWord : State.listing.next();
    if (word == NoWord) return 0;
    const std::size_t length = LengthOf(word);
    WriteLetters(word, length, buffer);
    return static_cast<int16_t>(length);
}

int32_t cReadTextFile(const char* path) {
    return Guarded(100, [&] { return State.merges.step(path); });
}

int32_t cWriteTextFile(const char* path) {
    return Guarded(0, [&] {
        if (path == nullptr) return 0;
        const std::string text = WordsAsText(State.dictionary.words());
        return Save(path, std::as_bytes(std::span(text))) ? 1 : 0;
    });
}

int32_t cCheckForAllDefinedWords(const char* board) {
    const bool isFound = Guarded(false, [&] {
        Board letters;
        if (Word(board).size() != letters.size()) return false;
        std::copy_n(board, letters.size(), letters.begin());
        if (!State.search) State.search = std::make_unique<BoardSearch>();
        const Dictionary& dictionary = State.dictionary;
        State.search->search(dictionary.words(), letters, dictionary.limits, State.found);
        return true;
    });
    if (!isFound) State.found.clear();
    return static_cast<int32_t>(State.found.size());
}

int32_t cGetDefinedWord(int32_t i, char* buffer, int32_t* n) {
    if (n == nullptr) return 0;
    *n = 0;
    return Guarded(0, [&] {
        const auto index = static_cast<std::size_t>(i);
        if (buffer == nullptr || i < 0 || index >= State.found.size()) return 0;
        *n = static_cast<int32_t>(State.found.spell(index, buffer));
        return 1;
    });
}

int32_t cMinWordSize(void) {
    return State.dictionary.limits.shortest;
}

int32_t cMaxWordSize(void) {
    return State.dictionary.limits.longest;
}

int32_t cSetMinWordSize(int32_t size) {
    if (IsWordSize(size)) State.dictionary.limits.shortest = size;
    return IsWordSize(size) ? 1 : 0;
}

int32_t cSetMaxWordSize(int32_t size) {
    if (IsWordSize(size)) State.dictionary.limits.longest = size;
    return IsWordSize(size) ? 1 : 0;
}

int32_t cReduceWordSize(void) {
    return Guarded(0, [] {
        const auto longest = static_cast<std::size_t>(State.dictionary.limits.longest);
        State.dictionary.replace(CopyGraph(State.dictionary.words(), longest));
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
