#if defined(__GNUC__) && !defined(__clang__)
// GCC 12 warns of what its own header leaves undefined on purpose.
#pragma GCC diagnostic ignored "-Wmaybe-uninitialized"
#pragma GCC diagnostic ignored "-Wuninitialized"
#endif
#include "wide_search.h"

#if defined(__x86_64__)
#include <immintrin.h>

#include <algorithm>
#include <bit>
#include <cstring>

// A step joins a cube to a chain. A block's steps are taken together, one thing for all of them
// after the other: each is listed, with what it has of its chain; its link is fetched and followed,
// words are kept; the mask of its node is fetched, and those that can go on become chains. Where
// only some of sixteen lanes are kept they move up to each other, so no branch depends on what the
// board shows.

// What a processor must have, for every function that touches the registers.
#define QUORLE_WIDE \
    gnu::target("avx512f,avx512bw,avx512dq,avx512vl,avx512vbmi2,avx512vpopcntdq,popcnt")

namespace {

constexpr std::array<std::uint8_t, 64> MakeNumbers() {
    std::array<std::uint8_t, 64> numbers{};
    for (std::uint8_t i = 0; i < 64; ++i) numbers[i] = i;
    return numbers;
}
constexpr auto Numbers = MakeNumbers();

constexpr std::uint16_t FirstLanes(std::size_t count) {
    return static_cast<std::uint16_t>((1U << count) - 1);
}

/// Bit i of each lane: cube i shows one of the lane's letters.
[[QUORLE_WIDE]] inline __m512i Showing(const CubeBits& cubes, __m512i letters) {
    __m512i shown = _mm512_setzero_si512();
    for (std::size_t i = 0; i < cubes.size(); ++i) {
        const __m512i bit = _mm512_set1_epi32(static_cast<int>(cubes[i]));
        const __mmask16 lanes = _mm512_test_epi32_mask(letters, bit);
        shown = _mm512_mask_or_epi32(shown, lanes, shown, _mm512_set1_epi32(1 << i));
    }
    return shown;
}

[[QUORLE_WIDE]] inline __m512i Load(const std::uint32_t* from) {
    return _mm512_loadu_si512(from);
}

[[QUORLE_WIDE]] inline __m512i LoadHalves(const std::uint16_t* from) {
    return _mm512_cvtepu16_epi32(_mm256_loadu_si256(reinterpret_cast<const __m256i*>(from)));
}
[[QUORLE_WIDE]] inline void Store(std::uint32_t* to, __m512i lanes) {
    _mm512_storeu_si512(to, lanes);
}

/// Writes the lanes asked for, one behind the other; what follows them is of no use.
[[QUORLE_WIDE]] inline void Keep(std::uint32_t* to, __mmask16 which, __m512i lanes) {
    _mm512_storeu_si512(to, _mm512_maskz_compress_epi32(which, lanes));
}
[[QUORLE_WIDE]] inline void Keep(std::uint16_t* to, __mmask16 which, __m512i lanes) {
    const __m512i kept = _mm512_maskz_compress_epi32(which, lanes);
    _mm256_storeu_si256(reinterpret_cast<__m256i*>(to), _mm512_cvtepi32_epi16(kept));
}

}  // namespace

/// Sixteen chains, a field in each register.
struct WideSearch::Parents {
    __m512i node;
    __m512i mask;
    __m512i firstWord;
    __m512i low;
    __m512i high;
    __m512i used;
};

bool WideSearch::canRun() {
    return __builtin_cpu_supports("avx512f") && __builtin_cpu_supports("avx512bw") &&
           __builtin_cpu_supports("avx512dq") && __builtin_cpu_supports("avx512vl") &&
           __builtin_cpu_supports("avx512vbmi2") && __builtin_cpu_supports("avx512vpopcntdq") &&
           __builtin_cpu_supports("popcnt");
}

void WideSearch::run(const WideSearchTask& task, RankSet& found, RecentChains& recent,
                     std::vector<FoundWord>& out) {
    task_ = task;
    found_ = &found;
    recent_ = &recent;
    out_ = &out;
    if (!start()) return;
    ExtendAll(
        levels_.data(), recent,
        [this](std::size_t begin, std::size_t end, std::uint32_t letters) {
            return thinOut(begin, end, letters);
        },
        [this](std::size_t begin, std::size_t end, std::size_t to, std::uint32_t letters) {
            return extendBlock(begin, end, to, letters + 1);
        });
}

// The chain of no cube; false when no word begins with a cube of the board.
bool WideSearch::start() {
    const std::uint32_t mask = task_.nodes[task_.root];
    std::uint32_t next = 0;
    for (std::uint32_t i = 0; i < Cubes; ++i) {
        if ((mask & task_.cubes[i]) != 0) next |= 1U << i;
    }
    chains_.node[0] = task_.root;
    chains_.mask[0] = mask;
    chains_.firstWord[0] = chains_.low[0] = chains_.high[0] = 0;
    chains_.used[0] = 0;
    chains_.next[0] = static_cast<std::uint16_t>(next);
    levels_[0] = {0, 1};
    return next != 0;
}

// Writes the longer chains, of so many letters, to `to` and returns their end.
std::size_t WideSearch::extendBlock(std::size_t begin, std::size_t end, std::size_t to,
                                    std::uint32_t letters) {
    const std::size_t steps = listSteps(begin, end);
    fetchLinks(steps);
    keepNew(followLinks(steps, letters >= task_.minLetters), letters);
    if (letters == task_.maxLetters) return to;
    fetchMasks(steps);
    return keepChains(steps, to);
}

[[QUORLE_WIDE]] std::size_t WideSearch::listSteps(std::size_t begin, std::size_t end) {
    std::size_t steps = 0;
    for (; begin < end; begin += Lanes) {
        const Parents parents{Load(&chains_.node[begin]),      Load(&chains_.mask[begin]),
                              Load(&chains_.firstWord[begin]), Load(&chains_.low[begin]),
                              Load(&chains_.high[begin]),      LoadHalves(&chains_.used[begin])};
        const std::size_t count = listCubes(begin, end);
        for (std::size_t i = 0; i < count; i += Lanes) joinCubes(parents, i, steps + i);
        steps += count;
    }
    Store(&steps_.edge[steps], _mm512_setzero_si512());
    return steps;
}

// Lists the next cubes of up to sixteen chains and returns how many there are.
[[QUORLE_WIDE]] inline std::size_t WideSearch::listCubes(std::size_t begin, std::size_t end) {
    const __mmask16 there = FirstLanes(std::min(end - begin, Lanes));
    const __m256i next = _mm256_maskz_loadu_epi16(there, &chains_.next[begin]);
    std::array<std::uint64_t, 4> quarters;  // of 4 chains, 16 cubes each
    _mm256_storeu_si256(reinterpret_cast<__m256i*>(quarters.data()), next);
    __m512i numbers = _mm512_loadu_si512(Numbers.data());
    std::size_t count = 0;
    for (const std::uint64_t quarter : quarters) {
        _mm512_storeu_si512(&cubes_[count], _mm512_maskz_compress_epi8(quarter, numbers));
        numbers = _mm512_add_epi8(numbers, _mm512_set1_epi8(Numbers.size()));
        count += static_cast<std::size_t>(std::popcount(quarter));
    }
    return count;
}

// Sixteen steps from the list of cubes.
[[QUORLE_WIDE]] inline void WideSearch::joinCubes(const Parents& parents, std::size_t cubes,
                                                  std::size_t step) {
    const __m512i one = _mm512_set1_epi32(1);
    const __m512i list =
        _mm512_cvtepu8_epi32(_mm_loadu_si128(reinterpret_cast<const __m128i*>(&cubes_[cubes])));
    const __m512i chain = _mm512_srli_epi32(list, 4);
    const __m512i cube = _mm512_and_si512(list, _mm512_set1_epi32(Cubes - 1));

    const __m512i bit = _mm512_permutexvar_epi32(cube, Load(task_.cubes.data()));
    const __m512i mask = _mm512_permutexvar_epi32(chain, parents.mask);
    const __m512i node = _mm512_permutexvar_epi32(chain, parents.node);
    const __m512i before = _mm512_popcnt_epi32(_mm512_and_si512(mask, _mm512_sub_epi32(bit, one)));
    Store(&steps_.edge[step],
          _mm512_add_epi32(_mm512_add_epi32(node, one), _mm512_slli_epi32(before, 1)));

    const __m512i low = _mm512_permutexvar_epi32(chain, parents.low);
    const __m512i high = _mm512_permutexvar_epi32(chain, parents.high);
    Store(&steps_.low[step], _mm512_or_si512(_mm512_slli_epi32(low, 4), cube));
    Store(&steps_.high[step], _mm512_shldi_epi32(high, low, 4));
    Store(&steps_.firstWord[step], _mm512_permutexvar_epi32(chain, parents.firstWord));

    const __m512i used = _mm512_or_si512(_mm512_permutexvar_epi32(chain, parents.used),
                                         _mm512_sllv_epi32(one, cube));
    const __m512i touching = _mm512_permutexvar_epi32(cube, Load(task_.touching.data()));
    Store(&steps_.used[step], used);
    Store(&steps_.around[step], _mm512_andnot_si512(used, touching));
}

// One by one: a load for all lanes is slower, and nothing else goes on meanwhile.
[[gnu::noinline]] void WideSearch::fetchLinks(std::size_t steps) {
    for (std::size_t i = 0; i < steps; i += Lanes) {
        for (std::size_t lane = i; lane < i + Lanes; ++lane) {
            std::memcpy(&steps_.link[lane], task_.nodes + steps_.edge[lane],
                        sizeof steps_.link[lane]);
        }
    }
}

// Goes along the links; returns how many words, if they are long enough, that gives.
[[QUORLE_WIDE]] std::size_t WideSearch::followLinks(std::size_t steps, bool isLongEnough) {
    const __m512i evens = _mm512_slli_epi32(
        _mm512_cvtepu8_epi32(_mm_loadu_si128(reinterpret_cast<const __m128i*>(Numbers.data()))), 1);
    const __m512i one = _mm512_set1_epi32(1);
    const __m512i odds = _mm512_add_epi32(evens, one);
    std::size_t words = 0;
    for (std::size_t i = 0; i < steps; i += Lanes) {
        const __m512i first = _mm512_loadu_si512(&steps_.link[i]);
        const __m512i second = _mm512_loadu_si512(&steps_.link[i + Lanes / 2]);
        const __m512i link = _mm512_permutex2var_epi32(first, evens, second);
        const __m512i skip = _mm512_permutex2var_epi32(first, odds, second);
        const __m512i index = _mm512_add_epi32(Load(&steps_.firstWord[i]), skip);
        const __mmask16 there = FirstLanes(std::min(steps - i, Lanes));
        const __mmask16 isWord = _mm512_movepi32_mask(link) & there;
        if (isLongEnough) {
            Keep(&words_.index[words], isWord, index);
            Keep(&words_.low[words], isWord, Load(&steps_.low[i]));
            Keep(&words_.high[words], isWord, Load(&steps_.high[i]));
            words += static_cast<std::size_t>(std::popcount(isWord));
        }
        Store(&steps_.firstWord[i], _mm512_mask_add_epi32(index, isWord, index, one));
        Store(&steps_.node[i],
              _mm512_andnot_si512(_mm512_set1_epi32(static_cast<int>(WordEnds)), link));
    }
    return words;
}

[[gnu::noinline]] void WideSearch::fetchMasks(std::size_t steps) {
    for (std::size_t i = 0; i < steps; i += Lanes) {
        for (std::size_t lane = i; lane < i + Lanes; ++lane) {
            steps_.mask[lane] = task_.nodes[steps_.node[lane]];
        }
    }
}

// Those that can go on become chains.
[[QUORLE_WIDE]] std::size_t WideSearch::keepChains(std::size_t steps, std::size_t to) {
    for (std::size_t i = 0; i < steps; i += Lanes) {
        const __m512i mask = Load(&steps_.mask[i]);
        const __m512i next = _mm512_and_si512(Load(&steps_.around[i]), Showing(task_.cubes, mask));
        const __mmask16 there = FirstLanes(std::min(steps - i, Lanes));
        const __mmask16 goesOn = _mm512_mask_test_epi32_mask(there, next, next);
        Keep(&chains_.node[to], goesOn, Load(&steps_.node[i]));
        Keep(&chains_.mask[to], goesOn, mask);
        Keep(&chains_.firstWord[to], goesOn, Load(&steps_.firstWord[i]));
        Keep(&chains_.low[to], goesOn, Load(&steps_.low[i]));
        Keep(&chains_.high[to], goesOn, Load(&steps_.high[i]));
        Keep(&chains_.used[to], goesOn, Load(&steps_.used[i]));
        Keep(&chains_.next[to], goesOn, next);
        to += static_cast<std::size_t>(std::popcount(goesOn));
    }
    return to;
}

// Drops the chains that need not be extended, and returns the new end.
std::size_t WideSearch::thinOut(std::size_t begin, std::size_t end, std::uint32_t letters) {
    Exhaustion exhaustion(task_.nodes, *found_, task_.minLetters, task_.maxLetters);
    std::size_t kept = begin;
    for (std::size_t i = begin; i < end; ++i) {
        const std::uint32_t firstWord = chains_.firstWord[i];
        if (exhaustion.holds(chains_.node[i], firstWord, letters) ||
            !recent_->add(firstWord, letters, chains_.used[i], chains_.low[i] % Cubes)) {
            continue;
        }
        moveChain(i, kept++);
    }
    return kept;
}

void WideSearch::moveChain(std::size_t from, std::size_t to) {
    chains_.node[to] = chains_.node[from];
    chains_.mask[to] = chains_.mask[from];
    chains_.firstWord[to] = chains_.firstWord[from];
    chains_.low[to] = chains_.low[from];
    chains_.high[to] = chains_.high[from];
    chains_.used[to] = chains_.used[from];
    chains_.next[to] = chains_.next[from];
}

// Of the block's words, those that are found for the first time.
void WideSearch::keepNew(std::size_t count, std::uint32_t letters) {
    std::size_t isNew = 0;
    for (std::size_t i = 0; i < count; ++i) {
        words_.isNew[isNew] = static_cast<std::uint32_t>(i);
        isNew += found_->insert(words_.index[i]);
    }
    const std::size_t size = out_->size();
    out_->resize(size + isNew);
    FoundWord* const kept = out_->data() + size;
    for (std::size_t i = 0; i < isNew; ++i) {
        const std::uint32_t word = words_.isNew[i];
        const std::uint64_t path = std::uint64_t{words_.high[word]} << 32 | words_.low[word];
        kept[i] = {path, words_.index[word], letters};
    }
}

#endif
