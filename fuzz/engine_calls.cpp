// Any sequence of engine calls with any arguments, against a plain set of words.
#include <algorithm>
#include <set>
#include <vector>

#include "fuzz_target.h"

namespace {

using Words = std::set<std::string>;

const std::uint8_t* At;
const std::uint8_t* End;
Words Held, Saved;
std::int32_t Min, Max, SavedMax;

std::int32_t Number() {
    return At == End ? 0 : *At++;
}

std::string File() {
    return Fuzz::Folder() + "/Dictionary.dat";
}

/// Mostly a short word of few letters, so that words meet; now and then anything.
std::string Word() {
    const int shape = Number();
    std::string text(static_cast<std::size_t>(shape % 19), 'a');
    for (char& c : text) {
        const int letter = Number();
        c = static_cast<char>(shape >= 240 ? letter : 'a' + letter % 3);
    }
    return text.c_str();
}

bool Fits(const std::string& text) {
    return text.size() >= 2 && static_cast<int>(text.size()) <= Max &&
           text.find_first_not_of("abcdefghijklmnopqrstuvwxyz") == std::string::npos;
}

void Add() {
    const std::string text = Word();
    const int added = cDictionaryAdd(text.c_str());
    REQUIRE(Held.count(text) == 1 || added == (Fits(text) ? 1 : 0));
    if (Fits(text)) Held.insert(text);
}

void Remove() {
    const std::string text = Word();
    REQUIRE(cDictionaryRemove(text.c_str()) == static_cast<int>(Held.erase(text)));
}

void LookUp() {
    std::string text = Word();
    const std::string before = text;
    const auto next = Held.lower_bound(text);
    const bool begins = !text.empty() && next != Held.end() && next->starts_with(text);
    std::int32_t found = 7, other = 7;
    REQUIRE(cDictionaryCheck(text.data(), &found, &other) == found && text == before);
    REQUIRE(found == static_cast<int>(Held.count(text)) && other == (begins ? 1 : 0));
}

void ChangeLimits() {
    const int size = Number() % 20 - 1;
    const int valid = size >= 2 && size <= 16 ? 1 : 0;
    const bool minimum = Number() % 3 == 0;
    REQUIRE((minimum ? cSetMinWordSize(size) : cSetMaxWordSize(size)) == valid);
    if (valid == 1) (minimum ? Min : Max) = size;
    if (Number() % 2 == 0) return;
    REQUIRE(cReduceWordSize() == 1);
    std::erase_if(Held, [](auto& each) { return static_cast<int>(each.size()) > Max; });
}

void Save() {
    REQUIRE(cWriteBinaryDictionary(File().c_str()) == 1);
    Saved = Held;
    SavedMax = Max;
}

void Load() {
    REQUIRE(cReadBinaryDictionary(Word().c_str()) == 0);
    REQUIRE(cReadBinaryDictionary(File().c_str()) == 1);
    Held = Saved;
    Max = SavedMax;
}

void Merge() {
    std::string text;
    for (int i = Number() % 40; i > 0; --i) {
        const std::string token = Word();
        if (!Fits(token)) continue;  // what else a file may hold has a target of its own
        text += token + "\n";
        Held.insert(token);
    }
    Fuzz::Merge(Fuzz::Write("words.txt", text));
}

// Later changes reach neither the results nor a listing.
void Search() {
    std::string board(16, 'a');
    for (char& c : board) c = static_cast<char>('a' + Number() % 3);
    cCheckForAllDefinedWords(Word().c_str());  // hardly ever a board
    const std::int32_t found = cCheckForAllDefinedWords(board.c_str());
    const Words before = Held;
    REQUIRE(cStartDecodingWords(0, 1) == 1);
    const auto outside = [min = Min, max = Max](const std::string& word) {
        return static_cast<int>(word.size()) < min || static_cast<int>(word.size()) > max;
    };
    Remove();
    ChangeLimits();
    const Words results = Fuzz::Results(found);
    REQUIRE(std::ranges::none_of(results, outside));
    REQUIRE(std::includes(before.begin(), before.end(), results.begin(), results.end()));
    Words listed;
    Fuzz::ReadListing(listed);
    REQUIRE(listed == Words(before.lower_bound("ab"), before.lower_bound("ac")));
}

void Nonsense() {
    std::int32_t n = Number() - 128;
    char buffer[16];
    REQUIRE(cReadBinaryDictionary(nullptr) == 0 && cWriteBinaryDictionary(nullptr) == 0);
    REQUIRE(cDictionaryAdd(nullptr) == 0 && cDictionaryRemove(nullptr) == 0);
    REQUIRE(cDictionaryCheck(nullptr, nullptr, nullptr) == 0);
    REQUIRE(cDictIndex(-1 - Number(), 0) == -1 && cDictIndex(0, 26 + Number()) == -1);
    REQUIRE(cStartDecodingWords(26 + Number(), 0) == 0 && cDecodeNextWord(nullptr) == 0);
    REQUIRE(cReadTextFile(nullptr) == 100 && cReadTextFile("dummy") == 100);
    REQUIRE(cWriteTextFile(nullptr) == 0 && cCheckForAllDefinedWords(nullptr) == 0);
    REQUIRE(cGetDefinedWord(n, buffer, &n) == 0 && cGetDefinedWord(0, nullptr, nullptr) == 0);
    REQUIRE(cGetRegValue(nullptr, "n", buffer, &n) == 0 && cSetRegValue("k", "n", nullptr, 1) == 0);
    REQUIRE(cSetRegValue("k", "n", "text", -1 - Number()) == 0);
}

/// The engine holds exactly the words it should.
void Check() {
    REQUIRE(cNumberOfWords() == static_cast<std::int32_t>(Held.size()));
    REQUIRE(cMinWordSize() == Min && cMaxWordSize() == Max);
    Words listed;
    for (std::int32_t first = 0; first < 26; ++first) {
        for (std::int32_t second = 0; second < 26; ++second) {
            const auto index = static_cast<std::int32_t>(listed.size());
            Fuzz::List(first, second, listed);
            const bool any = static_cast<std::int32_t>(listed.size()) > index;
            REQUIRE(cDictIndex(first, second) == (any ? index : -1));
        }
    }
    REQUIRE(listed == Held);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    At = data;
    End = data + size;
    cDictionaryClear();
    cSetMinWordSize(Min = 3);
    cSetMaxWordSize(Max = 16);
    Held.clear();
    Save();
    using Call = void (*)();
    constexpr Call Calls[] = {Add,          Add,  Add,  Add,   Remove, Remove,   LookUp,
                              ChangeLimits, Save, Load, Merge, Search, Nonsense, Check};
    while (At != End) Calls[static_cast<std::size_t>(Number()) % std::size(Calls)]();
    Check();
    return 0;
}
