#pragma once
// Which places of a board show one of a set of letters: the one thing that a search does in another
// way where the processor has wide registers.
#include <bit>

#include "search/board.h"

#if defined(__x86_64__)
#include <immintrin.h>
#endif

namespace Quorle {

/// By tables: the places of all sets of nine letters.
class PlainMatch {
  public:
    explicit PlainMatch(const BoardPlaces& places) {
        std::array<std::uint32_t, 32> shown{};
        for (std::uint32_t i = 0; i < Places; ++i) {
            shown[static_cast<std::uint32_t>(std::countr_zero(places.shown[i]))] |= 1U << i;
        }
        for (std::uint32_t table = 0; table < 3; ++table) {
            for (std::uint32_t bit = 0; bit < 9; ++bit) {
                std::uint32_t* const sets = tables_[table].data();
                for (std::uint32_t i = 0; i < 1U << bit; ++i) {
                    sets[(1U << bit) + i] = sets[i] | shown[9 * table + bit];
                }
            }
        }
    }
    /// Bit i: place i shows one of the letters.
    std::uint32_t operator()(std::uint32_t letters) const {
        return tables_[0][letters % 512] | tables_[1][letters >> 9 & 511] |
               tables_[2][letters >> 18 & 511];
    }

  private:
    std::array<std::array<std::uint32_t, 512>, 3> tables_{};
};

#if defined(__x86_64__)

/// By bytes: each place's byte of the set against its bit.
class Avx2Match {
  public:
    [[gnu::target("avx2")]] explicit Avx2Match(const BoardPlaces& places) {
        alignas(32) std::array<std::uint8_t, Places> bytes{};
        alignas(32) std::array<std::uint8_t, Places> bits{};
        for (std::uint32_t i = 0; i < Places; ++i) {
            const auto letter = static_cast<std::uint32_t>(std::countr_zero(places.shown[i]));
            bytes[i] = static_cast<std::uint8_t>(letter / 8);
            bits[i] = static_cast<std::uint8_t>(1U << letter % 8);
        }
        bytes_ = _mm256_load_si256(reinterpret_cast<const __m256i*>(bytes.data()));
        bits_ = _mm256_load_si256(reinterpret_cast<const __m256i*>(bits.data()));
    }
    [[gnu::target("avx2")]] std::uint32_t operator()(std::uint32_t letters) const {
        const __m256i all = _mm256_set1_epi32(static_cast<int>(letters));
        const __m256i own = _mm256_and_si256(_mm256_shuffle_epi8(all, bytes_), bits_);
        return static_cast<std::uint32_t>(_mm256_movemask_epi8(_mm256_cmpeq_epi8(own, bits_)));
    }

  private:
    __m256i bytes_;
    __m256i bits_;
};

#endif

}  // namespace Quorle
