// Any text as a board: every word found is held, within the limits, and in order.
#include "fuzz_target.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const std::string words =
        Fuzz::Write("words.txt",
                    "aa aaa aaaa aaaaaaaaaaaaaaaa ab ba abba cat cats act tac iraq suq quit qi "
                    "quiet bone bones nob eon tone stone notes onset");
    if (cNumberOfWords() == 0) Fuzz::Merge(words);
    if (size < 2) return 0;
    cSetMinWordSize(data[0] % 20);
    cSetMaxWordSize(data[1] % 20);
    const std::string board(Fuzz::Text(data + 2, size - 2));
    for (std::string word : Fuzz::Results(cCheckForAllDefinedWords(board.c_str()))) {
        const auto length = static_cast<std::int32_t>(word.size());
        REQUIRE(length >= cMinWordSize() && length <= cMaxWordSize());
        std::int32_t found = 0, other = 0;
        REQUIRE(cDictionaryCheck(word.data(), &found, &other) == 1);
    }
    return 0;
}
