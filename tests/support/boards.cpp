#include "support/boards.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <stdexcept>

#include "game/game_state.h"

namespace {

constexpr int Faces = 6;

class CubeChoice {
  public:
    explicit CubeChoice(const std::string& board) : board_(board) { place_.fill(-1); }

    std::vector<int> choose() {
        for (int position = 0; position < CubeCount; ++position) {
            std::array<bool, CubeCount> tried{};
            if (!find(position, tried)) throw std::invalid_argument("no shake gives " + board_);
        }
        std::vector<int> cubes(CubeCount);
        for (int cube = 0; cube < CubeCount; ++cube) {
            cubes[static_cast<std::size_t>(place(cube))] = cube;
        }
        return cubes;
    }

  private:
    int& place(int cube) { return place_[static_cast<std::size_t>(cube)]; }

    // Takes a cube that shows the letter, moving others to another cube where needed.
    bool find(int position, std::array<bool, CubeCount>& tried) {
        const char letter = board_[static_cast<std::size_t>(position)];
        for (std::size_t cube = 0; cube < CubeCount; ++cube) {
            if (tried[cube] || State.CubeFaces[cube].find(letter) == std::string::npos) continue;
            tried[cube] = true;
            if (place_[cube] < 0 || find(place_[cube], tried)) {
                place_[cube] = position;
                return true;
            }
        }
        return false;
    }

    std::string board_;
    std::array<int, CubeCount> place_{};
};

float DrawOf(std::size_t outcome, int outcomes) {
    return (static_cast<float>(outcome) + 0.5F) / static_cast<float>(outcomes);
}

bool Touch(int a, int b) {
    return std::abs(a / 4 - b / 4) <= 1 && std::abs(a % 4 - b % 4) <= 1;
}

void Spell(const std::string& board, const std::string& word, const std::string& spelled,
           Chain& chain, std::vector<Chain>& found) {
    const bool lastIsQu = !chain.empty() && board[static_cast<std::size_t>(chain.back())] == 'Q';
    if (!chain.empty() && (spelled == word || (lastIsQu && spelled == word + "u"))) {
        found.push_back(chain);
        return;
    }
    if (!word.starts_with(spelled)) return;
    for (int k = 0; k < CubeCount; ++k) {
        const bool used = std::find(chain.begin(), chain.end(), k) != chain.end();
        if (used || (!chain.empty() && !Touch(chain.back(), k))) continue;
        const char letter = board[static_cast<std::size_t>(k)];
        chain.push_back(k);
        Spell(board, word, spelled + (letter == 'Q' ? "qu" : std::string(1, letter | 0x20)), chain,
              found);
        chain.pop_back();
    }
}

}  // namespace

std::vector<float> DrawsFor(const std::string& board) {
    if (board.size() != CubeCount) throw std::invalid_argument("no board: " + board);
    std::vector<int> free;
    for (int cube = 0; cube < CubeCount; ++cube) free.push_back(cube);
    std::vector<float> draws;
    const std::vector<int> cubes = CubeChoice(board).choose();
    for (std::size_t i = 0; i < CubeCount; ++i) {
        const auto at = std::find(free.begin(), free.end(), cubes[i]);
        draws.push_back(
            DrawOf(static_cast<std::size_t>(at - free.begin()), static_cast<int>(free.size())));
        free.erase(at);
        draws.push_back(
            DrawOf(State.CubeFaces[static_cast<std::size_t>(cubes[i])].find(board[i]), Faces));
    }
    return draws;
}

std::vector<Chain> ChainsOf(const std::string& board, const std::string& word) {
    std::vector<Chain> found;
    Chain chain;
    Spell(board, word, "", chain, found);
    return found;
}
