#pragma once
// Boards that a test chooses.
#include <string>
#include <vector>

#include "support/chains.h"

/// The 32 numbers of the random source that shake `board` (16 letters, "Q" for
/// the Qu face). Throws when no shake gives it. The cubes must be filled.
std::vector<float> DrawsFor(const std::string& board);

/// Every chain that spells `word`, which is not empty, smallest first.
std::vector<Chain> ChainsOf(const std::string& board, const std::string& word);
