#include "support/boards.h"

#include <algorithm>
#include <numeric>
#include <random>
#include <stdexcept>

#include "state/game_state.h"

namespace {

float DrawOf(std::size_t outcome, std::size_t outcomes) {
    return (static_cast<float>(outcome) + 0.5F) / static_cast<float>(outcomes);
}

}  // namespace

std::vector<float> DrawsFor(const std::string& board) {
    std::minstd_rand random;
    for (int attempt = 0; attempt < 100'000; ++attempt) {
        std::vector<std::size_t> cubes(CubeCount);  // one for each place, in any order that fits
        std::iota(cubes.begin(), cubes.end(), 0);
        std::vector<std::size_t> left = cubes;
        std::vector<float> draws;
        std::shuffle(cubes.begin(), cubes.end(), random);
        for (const char letter : board) {
            const auto cube = std::find_if(cubes.begin(), cubes.end(), [&](std::size_t each) {
                return State.CubeFaces[each].find(letter) != std::string::npos;
            });
            if (cube == cubes.end()) break;
            const auto at = std::find(left.begin(), left.end(), *cube);
            draws.push_back(DrawOf(static_cast<std::size_t>(at - left.begin()), left.size()));
            draws.push_back(DrawOf(State.CubeFaces[*cube].find(letter), 6));
            left.erase(at);
            cubes.erase(cube);
        }
        if (draws.size() == 2 * CubeCount) return draws;
    }
    throw std::invalid_argument("no shake gives " + board);
}

std::vector<Chain> ChainsOf(const std::string& board, const std::string& word) {
    std::vector<Chain> found;
    Chain chain;
    Spell(board, word, chain, [&](const Chain& each) {
        found.push_back(each);
        return false;
    });
    return found;
}
