#pragma once
// Adding a word to a graph and removing one, copying only the nodes on its path.
#include <string_view>

#include "graph/edge_store.h"
#include "graph/packed_word.h"

namespace Quorle {

/// The most edges that one edit appends: each node on the path, with one edge more.
inline constexpr std::size_t MostEditedEdges = LongestWord * (2 + std::size_t{Letters});

/// Adds a word that is not held to what `root` leads to, or removes one that is; every other
/// snapshot stays whole. The store has room for MostEditedEdges.
void AddWord(EdgeStore& store, Edge& root, std::string_view word);
void RemoveWord(EdgeStore& store, Edge& root, std::string_view word);

}  // namespace Quorle
