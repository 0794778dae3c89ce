#include "search/board_search.h"

#include <algorithm>
#include <cstring>

#include "graph/bit_count.h"
#include "search/hard_boards.h"
#include "search/letter_match.h"

// All chains of as many letters are a level, and are extended together, so that their edges are
// fetched side by side and the inner loop runs long. When there are very many, they are taken in
// blocks, and each block's longer chains first: so memory is bounded whatever the board.
//
// The inner loop has no branch that depends on what the board shows: chains and words are written
// first and counted after.

namespace Quorle {

namespace {

constexpr std::uint32_t Block = 512;  // chains extended together
constexpr std::uint32_t AllCubes = (1U << Cubes) - 1;

/// The four fields of an edge as one value.
using Fields [[gnu::vector_size(16)]] = std::uint32_t;

/// A beginning of words on the board. The cubes still free stand in the edge's field `none`, and
/// its words before are those of the whole dictionary: so a step is an edge and what a place keeps
/// of the chain, added up.
struct Chain {
    Fields head;
    std::uint64_t path;  // as of a FoundWord
    std::uint32_t next;  // bit i: the chain can go on with place i
};
static_assert(sizeof(Chain) == 32);

/// Chains of as many letters as the level's number.
struct Level {
    Chain* begin;
    Chain* end;
};

/// 1, or 0 when the number is 0: from its sign, for from a comparison the compiler would make a
/// branch, or set a byte of a register, and the rest of it would have to be waited for.
constexpr std::uint32_t IsAny(std::uint32_t number) {
    return static_cast<std::uint32_t>((0 - std::uint64_t{number}) >> 63);
}

Fields FieldsOf(const Edge& edge) {
    Fields fields;
    std::memcpy(&fields, &edge, sizeof fields);
    return fields;
}

Edge EdgeOf(const Fields& fields) {
    Edge edge;
    std::memcpy(static_cast<void*>(&edge), &fields, sizeof edge);
    return edge;
}

}  // namespace

struct BoardSearch::State {
    // The chains that wait to be extended, level behind level: a stack, of which each level takes
    // what one block can grow to. One chain more may be written and not counted.
    std::array<Chain, (LongestWord + 1) * Block * MostTouching + 1> chains;
    std::array<Level, LongestWord + 2> levels;
    const BoardPlaces* places;
    std::array<Fields, Places> kept;  // of a chain that goes on to the place
    NumberSet known;
    RecentChains recent;  // once a board is hard
    std::vector<FoundWord>* found;
    const Edge* edges;
    WordLimits limits;
    std::array<FoundWord, Block * MostTouching + 1> words;  // of the block

    State() {
        for (std::uint32_t place = 0; place < Places; ++place) {
            kept[place] = Fields{0, 0, ~0U, place < Cubes ? ~(1U << place) : ~0U};
        }
    }
    template <class Match>
    void run(const Match& match, const Edge& root);
    template <class Match>
    Chain* extend(const Match& match, const Chain* chain, const Chain* end, Chain* to,
                  std::int32_t letters);
    Chain* thinOut(Chain* begin, Chain* end, std::int32_t letters);
    void keepNew(const FoundWord* end, std::int32_t letters);
};

// Extends the chain of no letter, which is all of levels[0], and what it grows to. Each level
// begins where the one before ends.
template <class Match>
inline void BoardSearch::State::run(const Match& match, const Edge& root) {
    chains[0] = {FieldsOf({root.letters, root.first, 0, ~0U}), 0, match(root.letters) & AllCubes};
    levels[0] = {chains.data(), chains.data() + (chains[0].next != 0 ? 1 : 0)};
    std::size_t extended = 0;
    bool isHard = false;
    for (Level* level = levels.data();;) {
        if (level->begin == level->end) {
            if (level == levels.data()) return;
            --level;
            continue;
        }
        Chain* const levelEnd = level->end;
        level->end -= std::min<std::ptrdiff_t>(levelEnd - level->begin, Block);
        const auto letters = static_cast<std::int32_t>(level - levels.data());
        Chain* const end = isHard ? thinOut(level->end, levelEnd, letters) : levelEnd;
        extended += static_cast<std::size_t>(end - level->end);
        if (!isHard && extended >= HardAfter) {
            isHard = true;
            recent.clear();
        }
        Chain* const longer = extend(match, level->end, end, levelEnd, letters);
        *++level = {levelEnd, longer};
    }
}

/// Writes the longer chains to `to` and returns their end.
template <class Match>
inline Chain* BoardSearch::State::extend(const Match& match, const Chain* chain, const Chain* end,
                                         Chain* to, std::int32_t letters) {
    const std::uint32_t mayGoOn = letters + 1 < limits.longest ? ~0U : 0;
    const std::uint32_t isLong = letters + 1 >= limits.shortest ? 1 : 0;
    FoundWord* word = words.data();
    const Edge* const all = edges;
    const std::array<std::uint32_t, Places>& shown = places->shown;
    const std::array<std::uint32_t, Places>& touching = places->touching;
    for (std::uint32_t next = chain->next; chain != end;) {
        const auto place = static_cast<std::uint32_t>(std::countr_zero(next));
        const std::uint32_t bit = shown[place];
        const std::uint64_t path = chain->path << 4 | place % Cubes;
        const Fields edge = FieldsOf(all[EdgeOf(chain->head).at(bit)]);
        const Fields head = edge + (chain->head & kept[place]);
        const std::uint32_t follow = match(edge[0]) & touching[place] & chain->head[3] & mayGoOn;
        word->path = path;
        word->number = head[2];
        word += edge[0] >> 31 & isLong;
        to->head = head;
        to->path = path;
        to->next = follow;
        to += IsAny(follow);
        next &= next - 1;
        const std::uint32_t isDone = 1 - IsAny(next);
        next |= chain[1].next & (0 - isDone);
        chain += isDone;
    }
    keepNew(word, letters + 1);
    return to;
}

/// Of the block's words, those that are found for the first time.
inline void BoardSearch::State::keepNew(const FoundWord* end, std::int32_t letters) {
    std::size_t count = found->size();
    found->resize(count + static_cast<std::size_t>(end - words.data()));
    FoundWord* const all = found->data();
    for (const FoundWord* word = words.data(); word != end; ++word) {
        all[count] = {word->path, word->number, static_cast<std::uint32_t>(letters)};
        count += known.insert(word->number);
    }
    found->resize(count);
}

/// Drops the chains that need not be extended, and returns the new end.
[[gnu::noinline]] Chain* BoardSearch::State::thinOut(Chain* begin, Chain* end,
                                                     std::int32_t letters) {
    Exhaustion exhaustion(edges, known, limits);
    return std::remove_if(begin, end, [&](const Chain& chain) {
        const Edge head = EdgeOf(chain.head);
        const auto place = static_cast<std::uint32_t>(chain.path % Cubes);
        return exhaustion.holds(head, letters) ||
               !recent.add(head.before, static_cast<std::uint32_t>(letters), head.none & AllCubes,
                           place);
    });
}

namespace {

#if defined(__x86_64__)
template <class State>
[[gnu::target("avx2,bmi,popcnt"), gnu::flatten]] void RunAvx2(State& state,
                                                              const BoardPlaces& places,
                                                              const Edge& root) {
    state.run(Avx2Match(places), root);
}
#endif

}  // namespace

bool CanMatch(Matching matching) {
#if defined(__x86_64__)
    if (matching == Matching::Avx2) {
        return __builtin_cpu_supports("avx2") && __builtin_cpu_supports("bmi") &&
               __builtin_cpu_supports("popcnt");
    }
#endif
    return matching == Matching::Plain;
}

BoardSearch::BoardSearch(Matching matching) : matching_(matching), state_(new State) {
    assert(CanMatch(matching));
}

BoardSearch::~BoardSearch() = default;

void BoardSearch::search(const WordGraph& graph, const Board& board, WordLimits limits,
                         std::vector<FoundWord>& found) {
    found.clear();
    if (limits.shortest > limits.longest) return;
    const BoardPlaces places(board);
    State& state = *state_;
    state.places = &places;
    state.known.resize(graph.size());
    state.found = &found;
    state.edges = graph.edges();
    state.limits = limits;
#if defined(__x86_64__)
    if (matching_ == Matching::Avx2) {
        RunAvx2(state, places, graph.root());
    } else
#endif
    {
        CountingBits([&] { state.run(PlainMatch(places), graph.root()); });
    }
    for (const FoundWord& word : found) state.known.clearAround(word.number);
}

}  // namespace Quorle
