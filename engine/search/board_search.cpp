#include "search/board_search.h"

#include <algorithm>
#include <cstring>

#include "search/letter_match.h"

// All chains of as many letters are a level, and are extended together, so that their edges are
// fetched side by side and the inner loop runs long. When there are very many, they are taken in
// blocks, and each block's longer chains first: so memory is bounded whatever the board.
//
// The inner loop has no branch that depends on what the board shows: chains and words are written
// first and counted after. What has to be waited for in a step is whether a chain is done, so two
// chains take their steps in turn.

namespace Quorle {

namespace {

// A board is hard when so many chains have been extended. From then on chains are looked at twice:
// whether they were extended of late, and whether they can only find words again.
constexpr std::size_t HardAfter = 16384;
constexpr int MostEdgesLookedAt = 64;

// The next two go without the branch that compilers would make of them: by what the AND tells.
/// Keeps of `bits` those of `mask`; when that is none, `chain` becomes `otherwise`.
void Keep(std::uint32_t& bits, std::uint32_t mask, Chain*& chain, Chain* otherwise) {
#if defined(__x86_64__)
    asm("and %2, %0\n\tcmovz %3, %1" : "+&r"(bits), "+&r"(chain) : "r"(mask), "r"(otherwise));
#else
    if ((bits &= mask) == 0) chain = otherwise;
#endif
}

/// Takes the lowest place from `next`; after the last one, goes on to the chain behind.
void Advance(const Chain*& at, std::uint32_t& next) {
    const Chain* const behind = at + 1;
#if defined(__x86_64__)
    asm("and %2, %0\n\tcmovz %3, %0\n\tcmovz %4, %1"
        : "+&r"(next), "+&r"(at)
        : "r"(next - 1), "m"(behind->next), "r"(behind));
#else
    next &= next - 1;
    if (next == 0) next = (at = behind)->next;
#endif
}

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

BoardSearch::BoardSearch(Matching matching) : matching_(matching) {
    assert(CanMatch(matching));
}

void BoardSearch::search(const WordGraph& graph, const Board& board, WordLimits limits,
                         FoundWords& found) {
    found.begin(graph.size(), board, matching_ == Matching::Avx2);
    places_.show(board);
    edges_ = graph.edges();
    found_ = &found;
    limits_ = limits;
    if (matching_ == Matching::Avx2) return runAvx2(graph.root());
    CountingBits([&] { run(PlainMatch(places_), graph.root()); });
}

#if defined(__x86_64__)
[[gnu::target("avx2,bmi,popcnt"), gnu::flatten]]
#endif
void BoardSearch::runAvx2([[maybe_unused]] const Edge& root) {
#if defined(__x86_64__)
    run(Avx2Match(places_), root);
#endif
}

// Extends the chain of no letter, which is all of the first level, and what it grows to. Between
// levels one chain is left out: the inner loop reads it, and would wait for one just written.
template <class Match>
inline void BoardSearch::run(const Match& match, const Edge& root) {
    const Fields head = {root.first, root.letters, 0, ~0U};
    chains_[0] = {head, 0, match(head) & AllCubes};
    levels_[0] = {chains_.data(), chains_.data() + (chains_[0].next != 0 ? 1 : 0)};
    std::size_t extended = 0;
    bool isHard = false;
    for (Level* level = levels_.data();;) {
        if (level->begin == level->end) {
            if (level == levels_.data()) return;
            --level;
            continue;
        }
        Chain* const levelEnd = level->end;
        level->end -= std::min<std::ptrdiff_t>(levelEnd - level->begin, Block);
        const auto letters = static_cast<std::int32_t>(level - levels_.data());
        Chain* const end = isHard ? thinOut(level->end, levelEnd, letters) : levelEnd;
        extended += static_cast<std::size_t>(end - level->end);
        if (!isHard && extended >= HardAfter) {
            isHard = true;
            recent_.clear();
        }
        Chain* const longer = extend(match, level->end, end, levelEnd + 1, letters + 1);
        *++level = {levelEnd + 1, longer};
    }
}

/// Writes the longer chains, of so many letters, to `to` and returns their end.
template <class Match>
inline Chain* BoardSearch::extend(const Match& match, const Chain* chain, const Chain* end,
                                  Chain* to, std::int32_t letters) {
    FoundWord* word = found_->room(MostGrown + 1);
    Chain* const begin = to;
    const Edge* const edges = edges_;
    const auto step = [&](const Chain*& at, std::uint32_t& next) {
        const Chain& from = *at;
        const auto place = static_cast<std::size_t>(std::countr_zero(next));
        const auto before =
            static_cast<std::size_t>(std::popcount(from.head[Mask] & places_.below[place]));
        Fields edge;
        std::memcpy(&edge, edges + from.head[First] + before, sizeof edge);
        edge &= Fields{~0U, ~0U, ~0U, 0};  // without what stands behind it
        const Fields head = edge + (from.head & places_.kept[place]);
        const std::uint64_t path = from.path << 4 | place % Cubes;
        static_assert(offsetof(FoundWord, number) == Before * sizeof(std::uint32_t));
        std::memcpy(word, &head, sizeof head);
        word->path = path;
        word += match.wordEnds(edge);
        std::uint32_t follow = match(edge);
        Chain* after = to + 1;
        Keep(follow, places_.touching[place] & from.head[Free], after, to);
        *to = {head, path, follow};
        to = after;
        __builtin_prefetch(edges + edge[First]);  // comes before the chain's turn
        Advance(at, next);
    };
    const Chain* const middle = chain + (end - chain) / 2;
    const Chain* other = middle;
    std::uint32_t next = chain->next;
    std::uint32_t otherNext = other->next;
    while (chain != middle && other != end) {
        step(chain, next);
        step(other, otherNext);
    }
    while (chain != middle) step(chain, next);
    while (other != end) step(other, otherNext);
    if (letters >= limits_.shortest) found_->take(word, static_cast<std::uint32_t>(letters));
    return letters < limits_.longest ? to : begin;
}

/// Drops the chains that need not be extended, and returns the new end.
[[gnu::noinline]] Chain* BoardSearch::thinOut(Chain* begin, Chain* end, std::int32_t letters) {
    return std::remove_if(begin, end, [&](const Chain& chain) {
        const Fields& head = chain.head;
        int edgesLeft = MostEdgesLookedAt;
        return allFound({head[First], head[Mask]}, head[Before], letters, edgesLeft) ||
               !recent_.add(head[Before], static_cast<std::uint64_t>(letters),
                            head[Free] & AllCubes, chain.path % Cubes);
    });
}

/// Whether all words that go on from the edge, reached with so many letters, are found or outside
/// the limits; false also when that takes more edges to tell.
bool BoardSearch::allFound(const Edge& edge, std::uint32_t before, std::int32_t letters,
                           int& edgesLeft) {
    if (letters == limits_.longest) return true;
    const Edge* next = edges_ + edge.first;
    for (std::uint32_t left = edge.next(); left != 0; left &= left - 1, ++next) {
        if (--edgesLeft < 0) return false;
        const std::uint32_t number = before + next->before;
        const bool counts = next->isWord() && letters + 1 >= limits_.shortest;
        if (counts && !found_->contains(number)) return false;
        if (!allFound(*next, number, letters + 1, edgesLeft)) return false;
    }
    return true;
}

}  // namespace Quorle
