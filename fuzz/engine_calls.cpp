// Any sequence of engine calls with any arguments, against a plain set of words.
#include <map>
#include <set>

#include "fuzz_target.h"

namespace {

using Words = std::set<std::string>;

class Calls {
  public:
    Calls(const std::uint8_t* data, std::size_t size) : at_(data), end_(data + size) {
        cDictionaryClear();
        cSetMinWordSize(3);
        cSetMaxWordSize(16);
        REQUIRE(cWriteBinaryDictionary(file_.c_str()) == 1);
    }
    void run() {
        while (at_ != end_) call();
        check();
    }

  private:
    void call();
    void edit(bool add);
    void changeLimits();
    void saveOrLoad(bool save);
    void merge();
    void search();
    void nonsense();
    void check() const;

    int number() { return at_ == end_ ? 0 : *at_++; }
    /// Mostly a short word of few letters, so that words meet; now and then anything.
    std::string word();

    const std::uint8_t* at_;
    const std::uint8_t* end_;
    const std::string file_ = Fuzz::Folder() + "/Dictionary.dat";
    Words words_, saved_;
    int max_ = 16, savedMax_ = 16;
};

std::string Calls::word() {
    const int shape = number();
    std::string text(static_cast<std::size_t>(shape % 19), 'a');
    for (char& c : text) {
        const int letter = number();
        c = shape >= 240 ? static_cast<char>(letter) : static_cast<char>('a' + letter % 3);
    }
    return text.c_str();
}

bool IsWord(const std::string& text) {
    return text.size() >= 2 && text.size() <= 16 &&
           text.find_first_not_of("abcdefghijklmnopqrstuvwxyz") == std::string::npos;
}

void Calls::edit(bool add) {
    const std::string text = word();
    if (add) {
        const bool taken = IsWord(text) && static_cast<int>(text.size()) <= max_;
        const int added = cDictionaryAdd(text.c_str());
        REQUIRE(words_.count(text) == 1 || added == (taken ? 1 : 0));
        if (taken) words_.insert(text);
    } else {
        REQUIRE(cDictionaryRemove(text.c_str()) == static_cast<int>(words_.erase(text)));
    }
}

void Calls::changeLimits() {
    const int size = number() % 20 - 1;
    const bool valid = size >= 2 && size <= 16;
    REQUIRE(cSetMaxWordSize(size) == (valid ? 1 : 0));
    if (valid) max_ = size;
    if (number() % 2 == 0) {
        REQUIRE(cReduceWordSize() == 1);
        std::erase_if(words_, [this](auto& each) { return static_cast<int>(each.size()) > max_; });
    }
}

void Calls::saveOrLoad(bool save) {
    if (save) {
        REQUIRE(cWriteBinaryDictionary(file_.c_str()) == 1);
        saved_ = words_;
        savedMax_ = max_;
    } else {
        REQUIRE(cReadBinaryDictionary(file_.c_str()) == 1);
        words_ = saved_;
        max_ = savedMax_;
    }
}

void Calls::merge() {
    std::string text;
    for (int i = number() % 40; i > 0; --i) {
        const std::string token = word();
        if (!IsWord(token)) continue;  // what else a file may hold has a target of its own
        text += token + "\n";
        if (static_cast<int>(token.size()) <= max_) words_.insert(token);
    }
    Fuzz::Merge(Fuzz::Write("words.txt", text));
}

void Calls::search() {
    std::string board(16, 'a');
    for (char& c : board) c = static_cast<char>('a' + number() % 3);
    const std::int32_t found = cCheckForAllDefinedWords(board.c_str());
    const Words before = words_;
    edit(false);  // does not reach the results
    std::string last;
    for (std::int32_t i = 0; i < found; ++i) {
        char buffer[17] = {};
        std::int32_t length = 0;
        REQUIRE(cGetDefinedWord(i, buffer, &length) == 1);
        REQUIRE(before.count(buffer) == 1 && last < buffer && length >= cMinWordSize());
        last = buffer;
    }
}

void Calls::nonsense() {
    std::int32_t n = number() - 128;
    char buffer[16];
    REQUIRE(cReadBinaryDictionary(nullptr) == 0 && cWriteBinaryDictionary(nullptr) == 0);
    REQUIRE(cReadBinaryDictionary(word().c_str()) == 0);
    REQUIRE(cDictionaryAdd(nullptr) == 0 && cDictionaryRemove(nullptr) == 0);
    REQUIRE(cDictionaryCheck(nullptr, nullptr, nullptr) == 0);
    REQUIRE(cDictIndex(-1 - number(), 0) == -1 && cDictIndex(0, 26 + number()) == -1);
    REQUIRE(cStartDecodingWords(26 + number(), 0) == 0 && cDecodeNextWord(nullptr) == 0);
    REQUIRE(cReadTextFile(nullptr) == 100 && cReadTextFile("dummy") == 100);
    REQUIRE(cWriteTextFile(nullptr) == 0 && cCheckForAllDefinedWords(nullptr) == 0);
    REQUIRE(cGetDefinedWord(n, buffer, &n) == 0 && cGetDefinedWord(0, nullptr, nullptr) == 0);
    REQUIRE(cGetRegValue(nullptr, "n", buffer, &n) == 0 && cSetRegValue("k", "n", nullptr, 1) == 0);
    REQUIRE(cSetRegValue("k", "n", "text", -1 - number()) == 0);
}

void Calls::call() {
    switch (number() % 12) {
        case 0:
        case 1:
        case 2:
        case 3:
            return edit(true);
        case 4:
        case 5:
            return edit(false);
        case 6:
            return changeLimits();
        case 7:
            return saveOrLoad(number() % 2 == 0);
        case 8:
            return merge();
        case 9:
            return search();
        case 10:
            return nonsense();
        default:
            return check();
    }
}

/// The engine holds exactly the words it should.
void Calls::check() const {
    REQUIRE(cNumberOfWords() == static_cast<std::int32_t>(words_.size()));
    REQUIRE(cMaxWordSize() == max_);
    Words held;
    std::int32_t index = 0;
    for (std::int32_t first = 0; first < 26; ++first) {
        for (std::int32_t second = 0; second < 26; ++second) {
            const std::size_t before = held.size();
            Fuzz::List(first, second, held);
            const auto count = static_cast<std::int32_t>(held.size() - before);
            REQUIRE(cDictIndex(first, second) == (count == 0 ? -1 : index));
            index += count;
        }
    }
    REQUIRE(held == words_);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Calls(data, size).run();
    return 0;
}
