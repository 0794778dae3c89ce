#pragma once
// Which cubes of a board show one of a set of letters: 16 comparisons at once.
#include <array>
#include <cstdint>

#if defined(__x86_64__)
#include <immintrin.h>
#endif

/// Each cube's letter as a bit, in board order.
using CubeBits = std::array<std::uint32_t, 16>;

/// Bit i of the result: the letter of cube i is in the mask.
struct PlainMatch {
    explicit PlainMatch(const CubeBits& cubes) {
        for (std::uint32_t i = 0; i < cubes.size(); ++i) {
            letters |= cubes[i];
            shown[static_cast<std::size_t>(__builtin_ctz(cubes[i]))] |= 1U << i;
        }
    }
    std::uint32_t operator()(std::uint32_t mask) const {
        std::uint32_t cubes = 0;
        for (mask &= letters; mask != 0; mask &= mask - 1) {
            cubes |= shown[static_cast<std::size_t>(__builtin_ctz(mask))];
        }
        return cubes;
    }
    std::uint32_t letters = 0;
    std::array<std::uint32_t, 26> shown{};
};

#if defined(__x86_64__)

struct Avx2Match {
    [[gnu::target("avx2")]] explicit Avx2Match(const CubeBits& cubes)
        : low(_mm256_loadu_si256(reinterpret_cast<const __m256i*>(cubes.data()))),
          high(_mm256_loadu_si256(reinterpret_cast<const __m256i*>(cubes.data() + 8))) {}
    [[gnu::target("avx2")]] std::uint32_t operator()(std::uint32_t mask) const {
        const __m256i letters = _mm256_set1_epi32(static_cast<int>(mask));
        const __m256i inLow = _mm256_cmpeq_epi32(_mm256_and_si256(letters, low), low);
        const __m256i inHigh = _mm256_cmpeq_epi32(_mm256_and_si256(letters, high), high);
        const int bits = _mm256_movemask_ps(_mm256_castsi256_ps(inLow)) |
                         (_mm256_movemask_ps(_mm256_castsi256_ps(inHigh)) << 8);
        return static_cast<std::uint32_t>(bits);
    }
    __m256i low;
    __m256i high;
};

struct Avx512Match {
    [[gnu::target("avx512f")]] explicit Avx512Match(const CubeBits& cubes)
        : letters(_mm512_loadu_si512(cubes.data())) {}
    [[gnu::target("avx512f")]] std::uint32_t operator()(std::uint32_t mask) const {
        return _mm512_test_epi32_mask(letters, _mm512_set1_epi32(static_cast<int>(mask)));
    }
    __m512i letters;
};

#endif
