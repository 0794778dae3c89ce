#pragma once
// Adding a word to a graph and removing one, copying only the nodes on its path.
#include <string_view>

#include "node_store.h"

/// Works in a store with room for MostWords more words. Takes over the caller's reference to
/// `root` and returns the new root with one reference; every other snapshot stays whole.
class GraphEdit {
  public:
    /// The most words that one edit appends: each node on the path, with one edge more.
    static constexpr std::size_t MostWords = LongestWord * (2 + 2 * (Letters + 1));

    explicit GraphEdit(NodeStore& store) : store_(store) {}

    /// Adds a word that is not held.
    NodeIndex add(NodeIndex root, std::string_view word);
    /// Removes a word that is held.
    NodeIndex remove(NodeIndex root, std::string_view word);

  private:
    NodeIndex edit(NodeIndex root, std::string_view word, std::uint32_t change);
    NodeIndex toggle(NodeIndex root, std::string_view word, std::uint32_t change);
    NodeIndex toggleByInstruction(NodeIndex root, std::string_view word, std::uint32_t change);
    NodeIndex ownWithEdge(NodeIndex node, std::uint32_t bit);
    NodeIndex withoutEdge(NodeIndex node, std::uint32_t bit);
    NodeIndex baseChild(NodeIndex base, std::uint32_t bit) const;
    NodeIndex baseIfSame(NodeIndex node, NodeIndex base);

    NodeStore& store_;
};
