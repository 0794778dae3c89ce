// Any bytes as a word file: exactly the tokens of 2 to 16 letters are merged.
#include "fuzz_target.h"

namespace {

std::set<std::string> Words(std::string_view text) {
    std::set<std::string> words;
    if (text.starts_with("\xEF\xBB\xBF")) text.remove_prefix(3);
    constexpr std::string_view Space = " \t\n\v\f\r";
    while (!text.empty()) {
        std::string token(text.substr(0, text.find_first_of(Space)));
        text.remove_prefix(std::min(token.size() + 1, text.size()));
        bool letters = token.size() >= 2 && token.size() <= 16;
        for (char& c : token) {
            if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
            letters = letters && c >= 'a' && c <= 'z';
        }
        if (letters) words.insert(token);
    }
    return words;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    cDictionaryClear();
    Fuzz::Merge(Fuzz::Write("words.txt", Fuzz::Text(data, size)));
    REQUIRE(Fuzz::AllWords() == Words(Fuzz::Text(data, size)));
    return 0;
}
