#pragma once
// The order in which a search extends chains.
//
// All chains of one length are extended together, so that their nodes are fetched side by side and
// the inner loop runs long. When there are very many, they are taken in blocks, and each block's
// longer chains first: so memory is bounded whatever the board.
#include <algorithm>
#include <cstddef>
#include <cstdint>

#include "hard_boards.h"

inline constexpr std::size_t Block = 512;  // chains extended together

/// Chains of as many cubes as the level's number, one behind the other. Position: a pointer to a
/// chain, or a number.
template <class Position>
struct Level {
    Position begin;
    Position end;
};

/// Extends the chain of no cube, which is all of levels[0], and what it grows to. Each level begins
/// where the one before ends, and holds at most what a block grows to.
/// thinOut(begin, end, cubes) drops chains of so many cubes and returns the new end;
/// extend(begin, end, to, cubes) writes the longer chains to `to` and returns their end.
template <class Position, class ThinOut, class Extend>
inline void ExtendAll(Level<Position>* levels, RecentChains& recent, const ThinOut& thinOut,
                      const Extend& extend) {
    std::size_t extended = 0;
    bool isHard = false;
    for (Level<Position>* level = levels;;) {
        if (level->begin == level->end) {
            if (level == levels) return;
            --level;
            continue;
        }
        const Position levelEnd = level->end;
        const auto waiting = static_cast<std::size_t>(levelEnd - level->begin);
        level->end = level->begin + (waiting - std::min(waiting, Block));
        const auto cubes = static_cast<std::uint32_t>(level - levels);
        const Position end = isHard ? thinOut(level->end, levelEnd, cubes) : levelEnd;
        const Position longer = extend(level->end, end, levelEnd, cubes);
        extended += static_cast<std::size_t>(end - level->end);
        if (!isHard && extended >= HardAfter) {
            isHard = true;
            recent.clear();
        }
        *++level = {levelEnd, longer};
    }
}
