#pragma once
// The memory of a word graph: one array of 32-bit words that holds every node.
//
//   base nodes            written once, minimal, never changed
//   [0]                   the empty node; as a link, "no node"
//   [mask][link][skip][link][skip]...
//     mask   bit i set: a word goes on with letter i (0 "a" .. 25 "z")
//     link   one for each letter in the mask, in alphabetical order:
//            bit 31: a word ends with this letter; bits 0..30: index of the child's mask
//     skip   how many words of this node come before that letter
//
//   edited nodes          copies that edits made, behind the base nodes
//   [refs][mask][link][skip]...
//     refs   how many nodes and snapshots link here
//
// Because a link says where its word ends and how many come before it, membership, rank and
// first word of a prefix are one walk, and a node does not need to know its own place.
#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>

using NodeIndex = std::uint32_t;

inline constexpr NodeIndex NoNode = 0;
inline constexpr std::uint32_t WordEnds = 0x80000000U;
inline constexpr int Letters = 26;
inline constexpr int LongestWord = 16;

inline NodeIndex ChildOf(std::uint32_t link) {
    return link & ~WordEnds;
}
/// Written out, because where the processor is not known to count bits the library would be called;
/// where it is, the compiler knows this form. Walks count at every letter: those that should be
/// fast are compiled a second time for processors that have an instruction for it.
inline std::uint32_t EdgeCount(std::uint32_t mask) {
    mask -= (mask >> 1) & 0x55555555;
    mask = (mask & 0x33333333) + ((mask >> 2) & 0x33333333);
    return (((mask + (mask >> 4)) & 0x0f0f0f0f) * 0x01010101) >> 24;
}
#if defined(__x86_64__)
inline bool HasBitCount() {
    return __builtin_cpu_supports("popcnt") != 0;
}
#endif
/// The bit of a lower-case letter in a mask.
inline std::uint32_t LetterBit(char letter) {
    return 1U << (letter - 'a');
}
/// Where the link of a letter stands, counted from its node's mask. `bit`: a bit set in `mask`.
inline std::uint32_t LinkOffset(std::uint32_t mask, std::uint32_t bit) {
    return 1 + 2 * EdgeCount(mask & (bit - 1));
}

/// Owns the array. Grows at its end; edited nodes that nothing links to are used again.
class NodeStore {
  public:
    NodeStore();
    ~NodeStore();
    NodeStore(const NodeStore&) = delete;
    NodeStore& operator=(const NodeStore&) = delete;

    std::uint32_t* words() { return words_; }
    const std::uint32_t* words() const { return words_; }
    std::size_t size() const { return size_; }

    /// Makes room for `count` more words. Throws std::bad_alloc; the content stays.
    void reserve(std::size_t count);
    /// Appends `count` words, not yet written, of the room reserved, and returns their index.
    NodeIndex append(std::size_t count);
    /// Gives back the room that no node uses.
    void shrink();

    /// Ends the base nodes: what is allocated from now on is an edited node.
    void closeBase(NodeIndex root);
    NodeIndex baseRoot() const { return baseRoot_; }
    bool isEdited(NodeIndex node) const { return node >= baseEnd_; }

    /// A new edited node with one reference, its mask and links not yet written.
    /// There must be room (reserve).
    NodeIndex allocate(std::uint32_t edges);
    /// Frees an edited node of `edges` edges, whatever its references.
    void free(NodeIndex node, std::uint32_t edges);
    std::uint32_t& references(NodeIndex node) { return words_[node - 1]; }
    /// One reference more or less; base nodes are not counted. The last one frees the node,
    /// and takes one from each of its children.
    void hold(NodeIndex node);
    void release(NodeIndex node);

  private:
    std::uint32_t* words_ = nullptr;
    std::size_t size_ = 0;
    std::size_t capacity_ = 0;
    NodeIndex baseRoot_ = NoNode;
    NodeIndex baseEnd_ = 1;
    // Freed nodes of each number of edges, chained through their masks.
    std::array<NodeIndex, Letters + 1> free_{};
};
