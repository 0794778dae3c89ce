#pragma once
// Boards that a test chooses.
#include "support/chains.h"

/// Every chain that spells `word`, which is not empty, smallest first.
inline std::vector<Chain> ChainsOf(const std::string& board, const std::string& word) {
    std::vector<Chain> found;
    Chain chain;
    Spell(board, word, chain, [&](const Chain& each) {
        found.push_back(each);
        return false;
    });
    return found;
}
