#pragma once
// Boards that a test chooses, and a simple second judge of what lies on them.
#include <string>
#include <vector>

/// The 32 numbers of the random source that shake `board` (16 letters, "Q" for
/// the Qu face). Throws when no shake gives it. The cubes must be filled.
std::vector<float> DrawsFor(const std::string& board);

/// Board indexes of a chain, from its first cube on.
using Chain = std::vector<int>;

/// Every chain of touching cubes that spells `word`, smallest first. Found by
/// spelling out the chains themselves, without any rule about letters.
std::vector<Chain> ChainsOf(const std::string& board, const std::string& word);
