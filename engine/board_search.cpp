#include "board_search.h"

#include <algorithm>
#include <bit>

#include "hard_boards.h"
#include "letter_match.h"
#include "rank_set.h"
#include "search_order.h"
#include "wide_search.h"
#include "without_branches.h"

// A chain carries the index of the first word below its node. A word found is marked by its index,
// so that one found along many chains counts once.
//
// The inner loop has no branch that depends on what the board shows: chains and words are written
// first and counted after.

namespace {

constexpr std::uint32_t QBit = 1U << ('q' - 'a');
constexpr std::uint32_t UBit = 1U << ('u' - 'a');

/// Cubes joined to a beginning of words that can go on. Same cubes in another order are another
/// chain only if the letters differ or the last cube does.
struct Chain {
    std::uint64_t path;  // the cubes, as of a FoundWord
    NodeIndex node;
    std::uint32_t firstWord;  // index of the first word below the node
    std::uint16_t used;       // bit i: cube i is in the chain
    std::uint16_t next;       // bit i: the chain can go on with cube i
    std::uint32_t letters;    // kept on boards with a Qu; on others as many as cubes
};

constexpr std::array<std::uint32_t, Cubes> MakeTouching() {
    std::array<std::uint32_t, Cubes> touching{};
    for (int a = 0; a < Cubes; ++a) {
        for (int b = 0; b < Cubes; ++b) {
            const int rows = a / 4 - b / 4;
            const int columns = a % 4 - b % 4;
            const bool near = rows * rows <= 1 && columns * columns <= 1 && a != b;
            if (near) touching[a] |= 1U << b;
        }
    }
    return touching;
}

constexpr auto TouchingCubes = MakeTouching();
constexpr std::array<std::uint32_t, Cubes> NoCubes{};

/// On the way along a cube's letters.
struct Step {
    std::uint64_t path;
    NodeIndex node;
    std::uint32_t firstWord;
    std::uint32_t letters;
};

/// Where the next chain and the next word found go.
struct Output {
    Chain* chains;
    FoundWord* words;
};

}  // namespace

struct BoardSearch::State {
    // The chains that wait to be extended, level behind level: a stack, of which each level takes
    // what one block can grow to. One chain more may be written and not counted.
    std::array<Chain, (Cubes + 1) * Block * MostTouching + 1> chains;
    std::array<Level<Chain*>, Cubes + 2> levels;
    CubeBits cubes;
    std::array<std::uint32_t, Cubes> touching = TouchingCubes;  // where it is at hand
    RankSet found;
    RecentChains recent;  // once a board is hard
    std::vector<FoundWord>* out;
    const std::uint32_t* nodes;
    std::uint32_t minLetters;
    std::uint32_t maxLetters;
    bool hasQu;

    // Words found by the block being extended.
    std::array<FoundWord, 2 * Block * MostTouching + 1> words;
#if defined(__x86_64__)
    std::unique_ptr<WideSearch> wide;  // made by the first search it is for
#endif

    void runWide(NodeIndex root);
    template <class Match>
    void runAny(NodeIndex root);
    template <class Match, bool HasQu>
    void run(NodeIndex root);
    template <class Match, bool HasQu>
    Chain* extendBlock(const Match& match, const Chain* chain, const Chain* end, Chain* to,
                       std::uint32_t cubesUsed);
    template <class Match, bool HasQu>
    void extend(const Match& match, const std::uint32_t* around, const Chain& chain,
                std::uint32_t cube, Step step, Output& output) const;
    void take(Step& step, std::uint32_t bit, std::uint32_t endsInQ, Output& output) const;
    void keepNew(const FoundWord* end);
    template <bool HasQu>
    Chain* thinOut(Chain* begin, Chain* end, std::uint32_t cubesUsed);
};

#if defined(__x86_64__)
void BoardSearch::State::runWide(NodeIndex root) {
    if (!wide) wide.reset(new WideSearch);
    wide->run({nodes, root, cubes, touching, minLetters, maxLetters}, found, recent, *out);
}
#endif

// Only on boards with a Qu cube can chains of as many cubes have different numbers of letters.
template <class Match>
inline void BoardSearch::State::runAny(NodeIndex root) {
    if (hasQu) {
        run<Match, true>(root);
    } else {
        run<Match, false>(root);
    }
}

template <class Match, bool HasQu>
inline void BoardSearch::State::run(NodeIndex root) {
    const Match match(cubes);
    chains[0] = {0, root, 0, 0, static_cast<std::uint16_t>(match(nodes[root])), 0};
    if (chains[0].next == 0) return;
    levels[0] = {chains.data(), chains.data() + 1};
    ExtendAll(
        levels.data(), recent,
        [&](Chain* begin, Chain* end, std::uint32_t cubesUsed) {
            return thinOut<HasQu>(begin, end, cubesUsed);
        },
        [&](const Chain* begin, const Chain* end, Chain* to, std::uint32_t cubesUsed) {
            return extendBlock<Match, HasQu>(match, begin, end, to, cubesUsed);
        });
}

// Writes the longer chains to `to` and returns their end.
template <class Match, bool HasQu>
inline Chain* BoardSearch::State::extendBlock(const Match& match, const Chain* chain,
                                              const Chain* end, Chain* to,
                                              std::uint32_t cubesUsed) {
    Output output{to, words.data()};
    const bool mayGoOn = HasQu || cubesUsed + 1 < maxLetters;
    const std::uint32_t* around = mayGoOn ? touching.data() : NoCubes.data();
    for (std::uint32_t next = chain->next; chain != end;) {
        const auto cube = static_cast<std::uint32_t>(std::countr_zero(next));
        const Step step{chain->path << 4 | cube, chain->node, chain->firstWord,
                        HasQu ? chain->letters : cubesUsed};
        extend<Match, HasQu>(match, around, *chain, cube, step, output);
        next &= next - 1;
        const std::uint32_t isDone = IsLess(next, 1);
        next |= chain[1].next & (0 - isDone);
        chain += isDone;
    }
    keepNew(output.words);
    return output.chains;
}

template <class Match, bool HasQu>
inline void BoardSearch::State::extend(const Match& match, const std::uint32_t* around,
                                       const Chain& chain, std::uint32_t cube, Step step,
                                       Output& output) const {
    const std::uint32_t bit = cubes[cube];
    if (!HasQu || bit != QBit) {
        take(step, bit, 0, output);
    } else {
        // Past a Qu cube a word goes on with its "u" or not at all.
        take(step, QBit, EndsInQ, output);
        if ((nodes[step.node] & UBit) == 0 || step.letters == maxLetters) return;
        take(step, UBit, 0, output);
    }
    const std::uint32_t used = chain.used | (1U << cube);
    std::uint32_t next = match(nodes[step.node]) & around[cube] & ~used;
    if constexpr (HasQu) next &= 0 - IsLess(step.letters, maxLetters);
    Chain& longer = *output.chains;
    longer.path = step.path;
    longer.node = step.node;
    longer.firstWord = step.firstWord;
    longer.used = static_cast<std::uint16_t>(used);
    longer.next = static_cast<std::uint16_t>(next);
    if constexpr (HasQu) longer.letters = step.letters;
    output.chains += IsLess(0, next);
}

// Goes along the letter, which the node has.
inline void BoardSearch::State::take(Step& step, std::uint32_t bit, std::uint32_t endsInQ,
                                     Output& output) const {
    const std::uint32_t* node = nodes + step.node;
    const std::uint32_t* link = node + LinkOffset(node[0], bit);
    const std::uint32_t to = link[0];
    const std::uint32_t isWord = to >> 31;
    ++step.letters;
    step.firstWord += link[1];
    *output.words = {step.path, step.firstWord, step.letters | endsInQ};
    output.words += isWord & ~IsLess(step.letters, minLetters);
    step.firstWord += isWord;
    step.node = ChildOf(to);
}

// Of the block's words, those that are found for the first time.
inline void BoardSearch::State::keepNew(const FoundWord* end) {
    std::size_t count = out->size();
    out->resize(count + static_cast<std::size_t>(end - words.data()));
    FoundWord* const kept = out->data();
    for (const FoundWord* word = words.data(); word != end; ++word) {
        kept[count] = *word;
        count += found.insert(word->index);
    }
    out->resize(count);
}

// Drops the chains that need not be extended, and returns the new end.
template <bool HasQu>
[[gnu::noinline]] Chain* BoardSearch::State::thinOut(Chain* begin, Chain* end,
                                                     std::uint32_t cubesUsed) {
    Exhaustion exhaustion(nodes, found, minLetters, maxLetters);
    return std::remove_if(begin, end, [&](const Chain& chain) {
        const std::uint32_t letters = HasQu ? chain.letters : cubesUsed;
        return exhaustion.holds(chain.node, chain.firstWord, letters) ||
               !recent.add(chain.firstWord, letters, chain.used, chain.path % Cubes);
    });
}

namespace {

#if defined(__x86_64__)
template <class State>
[[gnu::target("avx2,bmi,popcnt"), gnu::flatten]] void RunAvx2(State& state, NodeIndex root) {
    state.template runAny<Avx2Match>(root);
}
template <class State>
[[gnu::target("avx512f,avx2,bmi,popcnt"), gnu::flatten]] void RunAvx512(State& state,
                                                                        NodeIndex root) {
    state.template runAny<Avx512Match>(root);
}
#endif

}  // namespace

bool CanMatch(Matching matching) {
#if defined(__x86_64__)
    const bool bits = __builtin_cpu_supports("bmi") && __builtin_cpu_supports("popcnt");
    const bool avx2 = bits && __builtin_cpu_supports("avx2");
    if (matching == Matching::Avx2) return avx2;
    const bool avx512 = avx2 && __builtin_cpu_supports("avx512f");
    if (matching == Matching::Avx512) return avx512;
    if (matching == Matching::Wide) return avx512 && WideSearch::canRun();
#endif
    return matching == Matching::Plain;
}

Matching BestMatching() {
    for (const Matching best : {Matching::Wide, Matching::Avx512}) {
        if (CanMatch(best)) return best;
    }
    return CanMatch(Matching::Avx2) ? Matching::Avx2 : Matching::Plain;
}

BoardSearch::BoardSearch(Matching matching) : matching_(matching), state_(new State) {}

BoardSearch::~BoardSearch() = default;

void BoardSearch::search(const WordGraph& graph, const Board& board, SearchLimits limits,
                         std::vector<FoundWord>& found) {
    found.clear();
    if (limits.minLetters > limits.maxLetters) return;
    State& state = *state_;
    for (std::size_t i = 0; i < board.size(); ++i) state.cubes[i] = LetterBit(board[i]);
    state.hasQu = HasQu(board);
    state.found.resize(graph.size());
    state.out = &found;
    state.nodes = graph.nodes();
    state.minLetters = static_cast<std::uint32_t>(limits.minLetters);
    state.maxLetters = static_cast<std::uint32_t>(limits.maxLetters);
    switch (matching_) {
#if defined(__x86_64__)
        case Matching::Wide:
            if (!state.hasQu) {
                state.runWide(graph.root());
                break;
            }
            [[fallthrough]];
        case Matching::Avx512:
            RunAvx512(state, graph.root());
            break;
        case Matching::Avx2:
            RunAvx2(state, graph.root());
            break;
#endif
        default:
            state.runAny<PlainMatch>(graph.root());
    }
    for (const FoundWord& word : found) state.found.clearAround(word.index);
}
