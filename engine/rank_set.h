#pragma once
// A set of word indexes that is read in ascending order and empties itself by that.
#include <bit>
#include <cstddef>
#include <cstdint>
#include <vector>

/// Two levels of bits: one for each index, and one for each 64 of them, so that reading a few
/// indexes out of many does not look at them all.
class RankSet {
  public:
    /// Makes room for indexes below `count`. The set must be empty.
    void resize(std::size_t count) {
        ranks_.resize((count >> 6) + 1);
        groups_.resize((count >> 12) + 1);
    }

    void insert(std::uint32_t rank) {
        ranks_[rank >> 6] |= std::uint64_t{1} << (rank & 63);
        groups_[rank >> 12] |= std::uint64_t{1} << ((rank >> 6) & 63);
    }

    bool contains(std::uint32_t rank) const {
        return ((ranks_[rank >> 6] >> (rank & 63)) & 1) != 0;
    }

    /// Moves all indexes to `out`, which they replace.
    void drainTo(std::vector<std::uint32_t>& out) {
        out.clear();
        for (std::size_t i = 0; i < groups_.size(); ++i) {
            for (; groups_[i] != 0; groups_[i] &= groups_[i] - 1) {
                drainGroup((i << 6) + static_cast<std::size_t>(std::countr_zero(groups_[i])), out);
            }
        }
    }

  private:
    void drainGroup(std::size_t group, std::vector<std::uint32_t>& out) {
        for (; ranks_[group] != 0; ranks_[group] &= ranks_[group] - 1) {
            out.push_back(static_cast<std::uint32_t>(
                (group << 6) + static_cast<std::size_t>(std::countr_zero(ranks_[group]))));
        }
    }

    std::vector<std::uint64_t> ranks_;
    std::vector<std::uint64_t> groups_;
};
