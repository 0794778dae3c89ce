#pragma once
// What spares a search the most on boards with few letters, where millions of chains spell a few
// words: chains that were extended before, and chains that can only find words again.
#include <array>
#include <cstdint>

#include "node_store.h"
#include "rank_set.h"

/// A board is hard when so many chains have been extended; from then on they are looked at twice.
inline constexpr std::size_t HardAfter = 16384;

/// Remembers the chains extended of late, not all: a chain that is forgotten is extended again.
/// To be cleared before its first use.
class RecentChains {
  public:
    void clear() { keys_.fill(0); }

    /// False when the chain was added before and is still known. The first word and the number of
    /// letters say what it spells; `used` is its cubes, `cube` the last.
    bool add(std::uint32_t firstWord, std::uint32_t letters, std::uint32_t used,
             std::uint32_t cube) {
        const std::uint64_t place = std::uint64_t{letters} << 20 | used << 4 | cube;
        const std::uint64_t key = place << 32 | firstWord;
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
    Exhaustion(const std::uint32_t* nodes, const RankSet& found, std::uint32_t minLetters,
               std::uint32_t maxLetters)
        : nodes_(nodes), found_(found), minLetters_(minLetters), maxLetters_(maxLetters) {}

    /// Whether all words below the node are found or outside the limits; false also when that
    /// takes long to tell.
    bool holds(NodeIndex node, std::uint32_t firstWord, std::uint32_t letters) {
        linksLeft_ = MostLinks;
        return allFound(node, firstWord, letters);
    }

  private:
    static constexpr int MostLinks = 64;

    bool allFound(NodeIndex node, std::uint32_t firstWord, std::uint32_t letters) {
        if (letters == maxLetters_) return true;
        const std::uint32_t* link = nodes_ + node + 1;
        for (std::uint32_t left = EdgeCount(nodes_[node]); left > 0; --left, link += 2) {
            if (--linksLeft_ < 0) return false;
            const std::uint32_t isWord = link[0] >> 31;
            const std::uint32_t rank = firstWord + link[1];
            if (isWord != 0 && letters + 1 >= minLetters_ && !found_.contains(rank)) return false;
            if (!allFound(ChildOf(link[0]), rank + isWord, letters + 1)) return false;
        }
        return true;
    }

    const std::uint32_t* nodes_;
    const RankSet& found_;
    std::uint32_t minLetters_;
    std::uint32_t maxLetters_;
    int linksLeft_ = 0;
};
