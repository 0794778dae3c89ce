#include "hard_board.h"

#include <random>
#include <utility>

#include "inputs.h"

namespace {

constexpr int Starts = 4;
constexpr int Tries = 600;

}  // namespace

std::string HardestBoard(const std::function<long(const std::string&)>& score) {
    std::mt19937 random(7);
    std::string hardest;
    long most = -1;
    for (std::string board : RandomBoards(Starts)) {
        long best = score(board);
        for (int i = 0; i < Tries; ++i) {
            std::string other = board;
            if (random() % 2 == 0) {
                other[random() % 16] = static_cast<char>('a' + random() % 26);
            } else {
                std::swap(other[random() % 16], other[random() % 16]);
            }
            const long reached = score(other);
            if (reached >= best) {
                best = reached;
                board = other;
            }
        }
        if (best > most) {
            most = best;
            hardest = board;
        }
    }
    return hardest;
}
