#include "board_search.h"

#include <algorithm>
#include <bit>

#include "hard_boards.h"
#include "letter_match.h"
#include "rank_set.h"

// All chains of one length are extended together, so that their nodes are fetched side by side and
// the inner loop runs long. When there are very many, they are taken in blocks, and each block's
// longer chains first: so memory is bounded whatever the board.
//
// A chain carries the index of the first word below its node. A word found is marked by its index:
// one found along many chains is marked once, and the marks are in alphabetical order.

namespace {

constexpr std::size_t Block = 512;        // chains extended together
constexpr std::size_t HardAfter = 16384;  // chains extended, before they are looked at twice
constexpr std::size_t MostTouching = 8;   // cubes around a cube
constexpr std::uint8_t NoCube = Cubes;    // where the empty chain ends; every cube touches it
constexpr std::uint32_t QBit = 1U << ('q' - 'a');
constexpr std::uint32_t UBit = 1U << ('u' - 'a');

/// Cubes joined to a beginning of words. Same cubes in another order are another chain only if the
/// letters differ or the last cube does.
struct Chain {
    NodeIndex node;
    std::uint32_t firstWord;  // index of the first word below the node
    std::uint16_t used;       // bit i: cube i is in the chain
    std::uint8_t cube;        // the last one
    std::uint8_t letters;
};

constexpr std::array<std::uint16_t, Cubes + 1> MakeTouching() {
    std::array<std::uint16_t, Cubes + 1> touching{};
    for (int a = 0; a < Cubes; ++a) {
        for (int b = 0; b < Cubes; ++b) {
            const int rows = a / 4 - b / 4;
            const int columns = a % 4 - b % 4;
            const bool near = rows * rows <= 1 && columns * columns <= 1 && a != b;
            if (near) touching[a] = static_cast<std::uint16_t>(touching[a] | (1 << b));
        }
    }
    touching[NoCube] = 0xffff;
    return touching;
}

constexpr auto Touching = MakeTouching();

/// On the way along a cube's letters.
struct Step {
    NodeIndex node;
    std::uint32_t firstWord;
    std::uint32_t letters;
};

/// Where the next chain and the next word found go.
struct Output {
    Chain* chains;
    std::uint32_t* words;
};

/// A chain and the cubes that it can still go on with.
struct Growing {
    const Chain* chain;
    std::uint32_t cubesLeft;
};

/// Chains of as many cubes as the level's number, one behind the other.
struct Level {
    Chain* begin;
    Chain* end;
};

}  // namespace

struct BoardSearch::State {
    // The chains that wait to be extended, level behind level: a stack, of which each level takes
    // what one block can grow to. One chain more may be written and not counted.
    std::array<Chain, (Cubes + 1) * Block * MostTouching + 1> chains;
    std::array<Level, Cubes + 2> levels;
    CubeBits cubes;
    RankSet found;
    RecentChains recent;  // once a board is hard
    std::vector<std::uint32_t> ranks;
    const std::uint32_t* nodes;
    std::uint32_t minLetters;
    std::uint32_t maxLetters;

    // Words found by the block being extended.
    std::array<std::uint32_t, 2 * Block * MostTouching + 1> words;

    std::array<Growing, Block + 1> growing;

    template <class Match>
    std::size_t matchBlock(const Match& match, const Chain* chain, const Chain* end);
    void growBlock(std::size_t count, Output& out);
    void grow(const Chain& chain, std::uint32_t cube, Output& out) const;
    void take(Step& step, std::uint32_t bit, Output& out) const;
    template <class Match>
    Chain* extendBlock(const Match& match, const Chain* chain, const Chain* end, Chain* to);
    template <class Match>
    void run();
    Chain* thinOut(Chain* begin, Chain* end);
};

// Finds the cubes that each chain of the block can go on with, and gathers the chains that have
// any. Returns the number of such cubes, all chains together.
template <class Match>
inline std::size_t BoardSearch::State::matchBlock(const Match& match, const Chain* chain,
                                                  const Chain* end) {
    std::size_t count = 0;
    Growing* last = growing.data();
    for (; chain != end; ++chain) {
        const std::uint32_t cubesLeft =
            match(nodes[chain->node]) & Touching[chain->cube] & ~std::uint32_t{chain->used};
        *last = {chain, cubesLeft};
        last += cubesLeft != 0 ? 1 : 0;
        count += EdgeCount(cubesLeft);
    }
    return count;
}

// Makes the longer chains of those gathered. No branch depends on what the board shows: chains and
// words are written first and counted after, and going on to the next chain is a choice of values.
inline void BoardSearch::State::growBlock(std::size_t count, Output& out) {
    const Growing* from = growing.data();
    std::uint32_t cubesLeft = from->cubesLeft;
    for (; count > 0; --count) {
        grow(*from->chain, static_cast<std::uint32_t>(std::countr_zero(cubesLeft)), out);
        cubesLeft &= cubesLeft - 1;
        const std::uint32_t done = cubesLeft == 0 ? 1 : 0;
        from += done;
        cubesLeft |= from->cubesLeft & (0 - done);
    }
}

inline void BoardSearch::State::grow(const Chain& chain, std::uint32_t cube, Output& out) const {
    const std::uint32_t bit = cubes[cube];
    Step step{chain.node, chain.firstWord, chain.letters};
    take(step, bit, out);
    if (bit == QBit) {
        // Past a Qu cube a word goes on with its "u" or not at all.
        if ((nodes[step.node] & UBit) == 0) return;
        take(step, UBit, out);
    }
    __builtin_prefetch(nodes + step.node);
    *out.chains = {step.node, step.firstWord, static_cast<std::uint16_t>(chain.used | (1U << cube)),
                   static_cast<std::uint8_t>(cube), static_cast<std::uint8_t>(step.letters)};
    out.chains += (step.node != NoNode ? 1U : 0U) & (step.letters < maxLetters ? 1U : 0U);
}

// Goes along the letter, which the node has.
inline void BoardSearch::State::take(Step& step, std::uint32_t bit, Output& out) const {
    const std::uint32_t* node = nodes + step.node;
    const std::uint32_t* link = node + LinkOffset(node[0], bit);
    const std::uint32_t isWord = link[0] >> 31;
    ++step.letters;
    step.firstWord += link[1];
    *out.words = step.firstWord;
    out.words += isWord & (step.letters - minLetters <= maxLetters - minLetters ? 1U : 0U);
    step.firstWord += isWord;
    step.node = ChildOf(link[0]);
}

// Drops the chains that need not be extended, and returns the new end.
[[gnu::noinline]] Chain* BoardSearch::State::thinOut(Chain* begin, Chain* end) {
    Exhaustion exhaustion(nodes, found, minLetters, maxLetters);
    return std::remove_if(begin, end, [&](const Chain& chain) {
        return exhaustion.holds(chain.node, chain.firstWord, chain.letters) ||
               !recent.add(chain.firstWord, chain.letters, chain.used, chain.cube);
    });
}

// Writes the longer chains to `to` and returns their end.
template <class Match>
inline Chain* BoardSearch::State::extendBlock(const Match& match, const Chain* chain,
                                              const Chain* end, Chain* to) {
    Output out{to, words.data()};
    growBlock(matchBlock(match, chain, end), out);
    for (const std::uint32_t* word = words.data(); word != out.words; ++word) found.insert(*word);
    return out.chains;
}

template <class Match>
inline void BoardSearch::State::run() {
    const Match match(cubes);
    std::size_t extended = 0;
    bool isHard = false;
    for (Level* level = levels.data();;) {
        if (level->begin == level->end) {
            if (level == levels.data()) return;
            --level;
            continue;
        }
        Chain* const levelEnd = level->end;
        level->end -= std::min(levelEnd - level->begin, std::ptrdiff_t{Block});
        Chain* const end = isHard ? thinOut(level->end, levelEnd) : levelEnd;
        Chain* const longer = extendBlock(match, level->end, end, levelEnd);
        extended += static_cast<std::size_t>(end - level->end);
        if (!isHard && extended >= HardAfter) {
            isHard = true;
            recent.clear();
        }
        *++level = {levelEnd, longer};
    }
}

namespace {

#if defined(__x86_64__)
template <class State>
[[gnu::target("avx2,bmi,popcnt"), gnu::flatten]] void RunAvx2(State& state) {
    state.template run<Avx2Match>();
}
template <class State>
[[gnu::target("avx512f,avx2,bmi,popcnt"), gnu::flatten]] void RunAvx512(State& state) {
    state.template run<Avx512Match>();
}
#endif

}  // namespace

bool CanMatch(Matching matching) {
#if defined(__x86_64__)
    const bool bits = __builtin_cpu_supports("bmi") && __builtin_cpu_supports("popcnt");
    const bool avx2 = bits && __builtin_cpu_supports("avx2");
    if (matching == Matching::Avx2) return avx2;
    if (matching == Matching::Avx512) return avx2 && __builtin_cpu_supports("avx512f");
#endif
    return matching == Matching::Plain;
}

Matching BestMatching() {
    if (CanMatch(Matching::Avx512)) return Matching::Avx512;
    return CanMatch(Matching::Avx2) ? Matching::Avx2 : Matching::Plain;
}

BoardSearch::BoardSearch(Matching matching) : matching_(matching), state_(new State) {}

BoardSearch::~BoardSearch() = default;

const std::vector<std::uint32_t>& BoardSearch::search(const WordGraph& graph, const Board& board,
                                                      SearchLimits limits) {
    State& state = *state_;
    for (std::size_t i = 0; i < board.size(); ++i) state.cubes[i] = 1U << board[i];
    state.found.resize(graph.size());
    state.nodes = graph.nodes();
    state.minLetters = static_cast<std::uint32_t>(limits.minLetters);
    state.maxLetters = static_cast<std::uint32_t>(limits.maxLetters);
    state.chains[0] = {graph.root(), 0, 0, NoCube, 0};
    const bool canFind = limits.minLetters <= limits.maxLetters;
    state.levels[0] = {state.chains.data(), state.chains.data() + (canFind ? 1 : 0)};
    switch (matching_) {
#if defined(__x86_64__)
        case Matching::Avx512:
            RunAvx512(state);
            break;
        case Matching::Avx2:
            RunAvx2(state);
            break;
#endif
        default:
            state.run<PlainMatch>();
    }
    state.found.drainTo(state.ranks);
    return state.ranks;
}
