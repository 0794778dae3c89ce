#pragma once
// Finding every word of a graph on a board of touching cubes.
#include "graph/dictionary.h"
#include "search/board.h"
#include "search/found_words.h"

namespace Quorle {

/// How letters are compared with those of the places; both find the same.
enum class Matching { Plain, Avx2 };

/// Whether this machine can do it.
bool CanMatch(Matching matching);

/// A beginning of words on the board. The words before its edge are those of the whole dictionary:
/// so a step is an edge and what a place keeps of the chain, added up.
struct Chain {
    Fields head;         // the edge it stands on
    std::uint64_t path;  // as of a FoundWord
    std::uint32_t next;  // bit i: the chain can go on with place i
};
static_assert(sizeof(Chain) == 32);

/// Remembers the chains extended of late, not all: a chain that is forgotten is extended again. It
/// spares a search the most on boards with few letters, where millions of chains spell a few words.
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

/// The working memory of searches, some 3 MB of which each touches what it needs.
class BoardSearch {
  public:
    explicit BoardSearch(Matching matching = CanMatch(Matching::Avx2) ? Matching::Avx2
                                                                      : Matching::Plain);

    /// Replaces `found` by the words found. Throws std::bad_alloc.
    void search(const WordGraph& graph, const Board& board, WordLimits limits, FoundWords& found);

  private:
    static constexpr std::uint32_t Block = 512;  // chains extended together
    static constexpr std::size_t MostGrown = std::size_t{Block} * MostTouching;

    /// Chains of as many letters as the level's number.
    struct Level {
        Chain* begin;
        Chain* end;
    };

    void runAvx2(const Edge& root);
    template <class Match>
    void run(const Match& match, const Edge& root);
    template <class Match>
    Chain* extend(const Match& match, const Chain* chain, const Chain* end, Chain* to,
                  std::int32_t letters);
    Chain* thinOut(Chain* begin, Chain* end, std::int32_t letters);
    bool allFound(const Edge& edge, std::uint32_t before, std::int32_t letters, int& edgesLeft);

    const Matching matching_;
    BoardPlaces places_;
    const Edge* edges_ = nullptr;
    FoundWords* found_ = nullptr;
    WordLimits limits_;
    RecentChains recent_;  // once a board is hard
    std::array<Level, LongestWord + 2> levels_;
    // The chains that wait to be extended, level behind level: a stack, of which each level takes
    // what one block can grow to, and one more. One more still may be written and not counted.
    std::array<Chain, (LongestWord + 1) * (MostGrown + 1) + 1> chains_;
};

}  // namespace Quorle
