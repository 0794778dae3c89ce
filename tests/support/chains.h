#pragma once
// A simple second judge of what lies on a board: it follows every chain of touching cubes.
#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

/// Board indexes of a chain, from its first cube on.
using Chain = std::vector<int>;

/// Whether a chain can go on from `chain` and spell `rest`; it is then the first such, by its
/// places. A Qu cube ("Q", "q") is "qu", or a "q" that ends the word.
inline bool Spell(std::string_view board, std::string_view rest, Chain& chain) {
    if (rest.empty()) return true;
    const int last = chain.empty() ? -1 : chain.back();
    for (int next = 0; next < 16; ++next) {
        const int rows = next / 4 - last / 4;
        const int columns = next % 4 - last % 4;
        if (last >= 0 && (rows * rows > 1 || columns * columns > 1)) continue;
        if (std::find(chain.begin(), chain.end(), next) != chain.end()) continue;
        const auto letter = static_cast<char>(board[static_cast<std::size_t>(next)] | 0x20);
        const bool qu = letter == 'q' && rest.size() > 1;
        if (rest[0] != letter || (qu && rest[1] != 'u')) continue;
        chain.push_back(next);
        if (Spell(board, rest.substr(qu ? 2 : 1), chain)) return true;
        chain.pop_back();
    }
    return false;
}

/// The first chain that spells the word, empty where none does.
inline Chain FirstChain(std::string_view board, std::string_view word) {
    Chain chain;
    Spell(board, word, chain);
    return chain;
}

/// Whether the word, which is not empty, lies on the board at all.
inline bool Lies(std::string_view board, std::string_view word) {
    return !FirstChain(board, word).empty();
}
