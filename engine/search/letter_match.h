#pragma once
// Which places of a board show one of a set of letters, in the way that suits the processor.
#include "search/board.h"

namespace Quorle {

/// By tables: the places of all sets of nine letters.
class PlainMatch {
  public:
    explicit PlainMatch(const BoardPlaces& places) {
        for (std::uint32_t i = 0; i < Places; ++i) {
            const auto letter = static_cast<std::uint32_t>(std::popcount(places.below[i]));
            tables_[letter / 9][1U << letter % 9] |= 1U << i;
        }
        for (auto& table : tables_) {
            for (std::uint32_t set = 1; set < table.size(); ++set) {
                table[set] = table[set & (set - 1)] | table[set & -set];
            }
        }
    }
    /// Bit i: place i shows one of the letters that follow.
    std::uint32_t operator()(Fields edge) const {
        const std::uint32_t letters = edge[Mask];
        return tables_[0][letters % 512] | tables_[1][letters >> 9 & 511] |
               tables_[2][letters >> 18 & 511];
    }
    /// 1 when a word ends with the edge, else 0.
    static std::uint32_t wordEnds(Fields edge) { return edge[Mask] >> 31; }

  private:
    std::array<std::array<std::uint32_t, 512>, 3> tables_{};
};

#if defined(__x86_64__)

/// By bytes: each place's byte of the set against its bit.
class Avx2Match {
  public:
    [[gnu::target("avx2")]] explicit Avx2Match(const BoardPlaces& places) {
        byte_ = _mm256_load_si256(reinterpret_cast<const __m256i*>(places.byte.data()));
        bit_ = _mm256_load_si256(reinterpret_cast<const __m256i*>(places.bit.data()));
    }
    [[gnu::target("avx2")]] std::uint32_t operator()(Fields edge) const {
        const __m256i all = _mm256_broadcastq_epi64(reinterpret_cast<__m128i>(edge));
        const __m256i own = _mm256_and_si256(_mm256_shuffle_epi8(all, byte_), bit_);
        return static_cast<std::uint32_t>(_mm256_movemask_epi8(_mm256_cmpeq_epi8(own, bit_)));
    }

    /// By the signs of both halves: the other one has none.
    static std::uint32_t wordEnds(Fields edge) {
        return static_cast<std::uint32_t>(_mm_movemask_pd(reinterpret_cast<__m128d>(edge)));
    }

  private:
    __m256i byte_;
    __m256i bit_;
};

#endif

}  // namespace Quorle
