#pragma once
// What spares a search the most on boards with few letters, where millions of chains spell a few
// words: chains that were extended before, and chains that can only find words again.
#include <array>

#include "graph/dictionary.h"
#include "search/number_set.h"

namespace Quorle {

/// A board is hard when so many chains have been extended; from then on they are looked at twice.
inline constexpr std::size_t HardAfter = 16384;

/// Remembers the chains extended of late, not all: a chain that is forgotten is extended again.
/// To be cleared before its first use.
class RecentChains {
  public:
    void clear() { keys_.fill(0); }

    /// False when the chain was added before and is still known. The number of the last word before
    /// those it goes on to and the number of letters say what it spells.
    bool add(std::uint32_t before, std::uint32_t letters, std::uint32_t freeCubes,
             std::uint32_t place) {
        const std::uint64_t chain = std::uint64_t{letters} << 21 | freeCubes << 5 | place;
        const std::uint64_t key = chain << 32 | before;
        std::uint64_t& known = keys_[(key * Mixer) >> (64 - Bits)];
        if (known == key) return false;
        known = key;
        return true;
    }

  private:
    static constexpr int Bits = 16;
    static constexpr std::uint64_t Mixer = 0x9e3779b97f4a7c15U;

    std::array<std::uint64_t, std::size_t{1} << Bits> keys_;  // 0: none, no chain has 0 letters
};

/// Looks for a word that is still to be found.
class Exhaustion {
  public:
    Exhaustion(const Edge* edges, const NumberSet& found, WordLimits limits)
        : edges_(edges), found_(found), limits_(limits) {}

    /// Whether all words that go on from the edge, reached with so many letters, are found or
    /// outside the limits; false also when that takes long to tell.
    bool holds(const Edge& edge, std::int32_t letters) {
        edgesLeft_ = MostEdges;
        return allFound(edge, edge.before, letters);
    }

  private:
    static constexpr int MostEdges = 64;

    bool allFound(const Edge& edge, std::uint32_t before, std::int32_t letters) {
        if (letters == limits_.longest) return true;
        const Edge* next = edges_ + edge.first;
        for (std::uint32_t left = edge.next(); left != 0; left &= left - 1, ++next) {
            if (--edgesLeft_ < 0) return false;
            const std::uint32_t number = before + next->before;
            const bool counts = next->isWord() && letters + 1 >= limits_.shortest;
            if (counts && !found_.contains(number)) return false;
            if (!allFound(*next, number, letters + 1)) return false;
        }
        return true;
    }

    const Edge* edges_;
    const NumberSet& found_;
    WordLimits limits_;
    int edgesLeft_ = 0;
};

}  // namespace Quorle
