// Any text as a board: every word found is held, within the limits, and in order.
#include "fuzz_target.h"

namespace {

bool LoadWords() {
    Fuzz::Merge(
        Fuzz::Write("words.txt",
                    "aa aaa aaaa aaaaaaaaaaaaaaaa ab ba abba cat cats act tac iraq suq quit "
                    "qi quiet bone bones nob eon tone stone notes onset"));
    return cNumberOfWords() == 24;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const bool loaded = LoadWords();
    REQUIRE(loaded);
    if (size < 2) return 0;
    cSetMinWordSize(data[0] % 20);
    cSetMaxWordSize(data[1] % 20);
    const std::string board(Fuzz::Text(data + 2, size - 2));
    const std::int32_t words = cCheckForAllDefinedWords(board.c_str());
    std::string last;
    for (std::int32_t i = -1; i <= words; ++i) {
        char buffer[17] = {};
        std::int32_t length = 16;
        const bool inside = i >= 0 && i < words;
        REQUIRE(cGetDefinedWord(i, buffer, &length) == (inside ? 1 : 0));
        REQUIRE(inside ? length >= cMinWordSize() && length <= cMaxWordSize() : length == 0);
        std::int32_t found = 0, other = 0;
        REQUIRE(!inside || (cDictionaryCheck(buffer, &found, &other) == 1 && last < buffer));
        last = buffer;
    }
    return 0;
}
