#pragma once
// What spares a search the most on boards with few letters, where millions of chains spell a few
// words: the chains that were extended before.
#include <array>
#include <cstdint>

namespace Quorle {

/// Remembers the chains extended of late, not all: a chain that is forgotten is extended again.
/// To be cleared before its first use.
class RecentChains {
  public:
    void clear() { keys_.fill(0); }

    /// False when the chain was added before and is still known. The number of the last word before
    /// those it goes on to and the number of letters say what it spells.
    bool add(std::uint32_t before, std::uint64_t letters, std::uint32_t freeCubes,
             std::uint64_t cube) {
        const std::uint64_t key = (letters << 21 | freeCubes << 5 | cube) << 32 | before;
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

}  // namespace Quorle
