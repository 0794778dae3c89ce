#pragma once
// The memory of a word graph: one array of edges. What a walk needs to know of where an edge leads
// stands in the edge, so that a letter takes one load.
//
//   base edges     written once, minimal, never changed; edge 0 leads to the root
//   edited nodes   copies that edits made, behind the base; an edge before each counts references
//
// A node is a run of edges, in alphabetical order, one for each letter that the edge to it names.
#include <array>
#include <bit>
#include <cassert>
#include <cstddef>
#include <cstdint>

#include "graph/memory.h"

namespace Quorle {

inline constexpr int Letters = 26;
inline constexpr std::uint32_t WordEnds = 1U << 31;

struct Edge {
    std::uint32_t first = 0;    ///< index of the first edge of the letters; 0 when there are none
    std::uint32_t letters = 0;  ///< bit i: a word goes on with letter i; WordEnds: one ends here
    std::uint32_t before = 0;   ///< words of the node before this edge's letter, and this word

    bool operator==(const Edge&) const = default;
    bool isWord() const { return letters >> 31 != 0; }
    std::uint32_t next() const { return letters & ~WordEnds; }
    std::uint32_t count() const { return static_cast<std::uint32_t>(std::popcount(next())); }
    /// Where the edge of a letter stands, or would.
    std::uint32_t at(std::uint32_t bit) const {
        return first + static_cast<std::uint32_t>(std::popcount(letters & (bit - 1)));
    }
};

inline constexpr Edge Nowhere;

/// Where a letter leads; Nowhere when no word goes on with it.
inline const Edge& Follow(const Edge* edges, const Edge& from, std::uint32_t bit) {
    return (from.letters & bit) != 0 ? edges[from.at(bit)] : Nowhere;
}

/// The bit of a lower-case letter.
inline std::uint32_t LetterBit(char letter) {
    assert(letter >= 'a' && letter <= 'z');
    return 1U << (letter - 'a');
}

#if defined(__x86_64__)
template <class Walk>
[[gnu::target("popcnt"), gnu::flatten]] auto ByInstruction(const Walk& walk) {
    return walk();
}
#endif

/// Walks count the letters before theirs at every step: they are compiled a second time for
/// processors that have an instruction for it.
template <class Walk>
auto CountingBits(const Walk& walk) {
#if defined(__x86_64__)
    if (__builtin_cpu_supports("popcnt")) return ByInstruction(walk);
#endif
    return walk();
}

/// How many words go on from the edge.
std::uint32_t CountWords(const Edge* edges, const Edge& edge);

/// Owns the array, and room for one edge behind it, so that each can be read as 16 bytes. Grows at
/// its end; edited nodes that nothing leads to are used again.
class EdgeStore {
  public:
    EdgeStore() { edges_[append(1)] = {}; }

    Edge* edges() { return edges_.get(); }
    std::size_t size() const { return size_; }

    /// Makes room for `count` more edges. Throws std::bad_alloc; the content stays.
    void reserve(std::size_t count);
    /// Appends `count` edges, not yet written, and returns their index. Throws std::bad_alloc when
    /// there is no room.
    std::uint32_t append(std::size_t count);
    /// Ends the base, which nothing is added to from now on, and gives back the room left.
    void closeBase(const Edge& root);
    bool isEdited(std::uint32_t first) const { return first >= baseEnd_; }

    /// A new edited node of `count` edges, not yet written, with one reference.
    std::uint32_t allocate(std::uint32_t count);
    /// Frees an edited node, whatever its references.
    void free(std::uint32_t first, std::uint32_t count);
    std::uint32_t& references(std::uint32_t first) { return edges_[first - 1].letters; }
    /// One reference more or less to the node that the edge leads to; base nodes are not counted.
    /// The last one frees the node, and takes one from each of its children.
    void hold(const Edge& edge);
    void release(const Edge& edge);

  private:
    Memory<Edge> edges_;
    std::size_t size_ = 0;
    std::size_t capacity_ = 0;
    std::uint32_t baseEnd_ = 1;
    std::array<std::uint32_t, Letters + 1> free_{};  // freed nodes of each size, chained
};

}  // namespace Quorle
