// Any sequence of engine calls with any arguments and files, against a plain set of words.
#include <algorithm>

#include "engine/calls.h"
#include "engine/temp_folder.h"
#include "support/chains.h"

namespace {

const TempFolder Folder;
const std::uint8_t* At;
const std::uint8_t* End;
WordSet Held;
std::int32_t Min, Max;
bool IsForeign;  // a file that is not ours may hold a node twice, and is saved as it is

int Number() {
    return At == End ? 0 : *At++;
}

/// Mostly a short word of few letters, so that words meet; now and then anything.
std::string Word() {
    const int shape = Number();
    std::string text(static_cast<std::size_t>(shape % 19), 'a');
    for (char& c : text) c = shape >= 240 ? static_cast<char>(Number()) : "aquc"[Number() % 4];
    return text.substr(0, text.find('\0'));
}

/// As many bytes as the next two say.
std::string Bytes() {
    const std::ptrdiff_t low = Number(), size = low + 256 * Number();
    std::string bytes(At, At + std::min(size, End - At));
    At += bytes.size();
    return bytes;
}

bool Fits(const std::string& text) {
    return text.size() >= 2 && static_cast<int>(text.size()) <= Max &&
           text.find_first_not_of("abcdefghijklmnopqrstuvwxyz") == std::string::npos;
}

void Add(const std::string& text) {
    const int added = cDictionaryAdd(text.c_str());
    REQUIRE(Held.count(text) == 1 || added == (Fits(text) ? 1 : 0));
    if (Fits(text)) Held.insert(text);
}

void LookUp() {
    std::string text = Word();
    const std::string word = text;
    const auto next = Held.lower_bound(word);
    const bool begins = !word.empty() && next != Held.end() && next->starts_with(word);
    std::int32_t found = 7, other = 7;
    REQUIRE(cDictionaryCheck(text.data(), &found, &other) == found && text == word);
    REQUIRE(found == static_cast<int>(Held.count(word)) && other == (begins ? 1 : 0));
    if (Number() % 3 > 0)
        REQUIRE(cDictionaryRemove(word.c_str()) == static_cast<int>(Held.erase(word)));
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

std::string Saved() {
    REQUIRE(cWriteBinaryDictionary((Folder / "Dictionary.dat").c_str()) == 1);
    return Folder.read("Dictionary.dat");
}

/// Any bytes, the checksum made right: refused, or a dictionary that works.
void LoadAnything() {
    if (cReadBinaryDictionary(Folder.write("file", Sealed(Bytes())).c_str()) == 0) return;
    // Few bytes can spell very many words; such a dictionary is not read through.
    if (cNumberOfWords() > 20'000) cDictionaryClear();
    Held = AllWords();
    IsForeign = true;
    Max = cMaxWordSize();
    REQUIRE(Max >= 2 && Max <= 16);
}

void MergeAnything() {
    std::string text = Bytes();
    Finish(Step(0, Folder.write("words", text).c_str()));
    if (text.starts_with("\xEF\xBB\xBF")) text.erase(0, 3);
    for (std::size_t end = 0; end != text.npos; text.erase(0, end + 1)) {
        end = text.find_first_of(" \t\n\v\f\r");
        std::string token = text.substr(0, end);
        for (char& c : token) c = static_cast<char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
        if (Fits(token)) Held.insert(token);
    }
}

/// Values are read or absent, and storing one keeps the others.
void ReadAnySettings() {
    Folder.write("quorle/settings", Bytes());
    Setting("key", "name");
    const std::string other = Setting("key", "other");
    REQUIRE(cSetRegValue("key", "name", "stored", 6) == 1);
    REQUIRE(Setting("key", "name") == "stored" && Setting("key", "other") == other);
}

/// What lies on the board is found. Later changes reach neither the results nor a listing.
void Search() {
    std::string board, snake;
    while (board.size() < 16) board += "aquc"[(board.size() + Number()) % 4];
    for (const std::size_t cube : {0, 1, 2, 3, 7, 6, 5, 4, 8, 9, 10, 11, 15, 14, 13, 12}) {
        snake += board[cube] == 'q' ? "qu" : board.substr(cube, 1);
    }
    Add(snake.substr(0, static_cast<std::size_t>(Number() % 17)));
    WordSet lying;
    std::copy_if(Held.begin(), Held.end(), std::inserter(lying, lying.end()), [&](auto& word) {
        const auto size = static_cast<int>(word.size());
        return size >= Min && size <= Max && Lies(board, word);
    });
    REQUIRE(Number() > 0 || cCheckForAllDefinedWords(Bytes().substr(0, 15).c_str()) == 0);
    const std::int32_t found = cCheckForAllDefinedWords(board.c_str());
    const WordSet listed(Held.lower_bound("aq"), Held.lower_bound("ar"));
    REQUIRE(cStartDecodingWords(0, 'q' - 'a') == 1);
    LookUp();
    ChangeLimits();
    REQUIRE(Found(found) == lying && Written(cDecodeNextWord) == listed);
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

/// What is saved is loaded again, whatever comes between.
void SaveAndLoad() {
    const std::int32_t max = Max;
    const WordSet held = Held;
    Saved();
    Add(Word());
    LookUp();
    ChangeLimits();
    REQUIRE(cReadBinaryDictionary(Word().c_str()) == 0);
    REQUIRE(cReadBinaryDictionary((Folder / "Dictionary.dat").c_str()) == 1);
    Held = held;
    Max = max;
}

/// The engine holds what it should, and saves it as if it were built at once.
void Check() {
    REQUIRE(AllWords() == Held && cMinWordSize() == Min && cMaxWordSize() == Max);
    cSetMaxWordSize(Max = 16);
    const std::string edited = Saved(), words = Folder / "words";
    REQUIRE(cWriteTextFile(words.c_str()) == 1 && cDictionaryClear() == 1);
    Finish(Step(0, words.c_str()));
    REQUIRE(Saved() == edited || IsForeign);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    At = data;
    End = data + size;
    setenv("XDG_CONFIG_HOME", Folder.path().c_str(), 1);
    cDictionaryClear();
    cSetMinWordSize(Min = 3);
    cSetMaxWordSize(Max = 16);
    Held.clear();
    IsForeign = false;
    using Call = void (*)();
    constexpr Call Add3 = [] { Add(Word()), Add(Word()), Add(Word()); };
    constexpr Call Calls[] = {Add3,         LookUp,        ChangeLimits,
                              LoadAnything, MergeAnything, ReadAnySettings,
                              Search,       SaveAndLoad,   Nonsense};
#ifdef ONLY_CALL
    for (Number(); At != End;) ONLY_CALL();
#endif
    while (At != End) Calls[static_cast<std::size_t>(Number()) % std::size(Calls)]();
    Check();
    return 0;
}
