#pragma once
// A set of words as a word graph: words that begin alike share edges, and so do words that end
// alike. A WordGraph is a snapshot: copying it is cheap, and an edit changes this copy alone.
// Words are 2 to 16 letters "a" to "z"; whoever calls has checked that.
#include <memory>
#include <string_view>

#include "graph/edge_store.h"

namespace Quorle {

class WordGraph {
  public:
    WordGraph() = default;
    /// The base of a finished store.
    explicit WordGraph(const std::shared_ptr<EdgeStore>& store);

    std::uint32_t size() const { return size_; }  ///< words
    /// Where these letters lead: an edge that counts the words before those that go on from it.
    /// Without letters and no word when no word begins so.
    Edge find(std::string_view letters) const;

    /// Adds a word that is not held, or removes one that is. Copies only the nodes on its path.
    /// Tells where its first two letters lead now. Throws std::bad_alloc and changes nothing.
    Edge set(std::string_view word, bool isHeld);

    /// Whether no smaller graph spells the same words: true until an edit.
    bool isMinimal() const { return root() == edges()[0]; }
    /// Whether both are the same snapshot, with no edit between them.
    bool operator==(const WordGraph& other) const = default;

    /// For those who walk the edges themselves. Valid until the next edit.
    const Edge* edges() const { return place_ ? place_->store->edges() : &Nowhere; }
    const Edge& root() const { return place_ ? place_->root : Nowhere; }
    /// Above the index of every edge.
    std::size_t edgesEnd() const { return place_ ? place_->store->size() : 1; }

  private:
    /// Holds what the root leads to.
    struct Place {
        std::shared_ptr<EdgeStore> store;
        Edge root;
        ~Place() { store->release(root); }
    };

    std::shared_ptr<Place> place_;
    std::uint32_t size_ = 0;
};

}  // namespace Quorle
