#pragma once
// A set of words as a word graph: words that begin alike share nodes, and so do words that end
// alike. A WordGraph is a snapshot: copying it is cheap, and an edit changes this copy alone.
// Words are 1 to 16 letters "a" to "z"; whoever calls has checked that.
#include <cstdint>
#include <memory>
#include <string_view>

#include "node_store.h"

/// Where a walk along letters has come to.
struct GraphPlace {
    NodeIndex node;           ///< what the letters can go on with; NoNode: with nothing
    std::uint32_t firstWord;  ///< index of the first word below the node
    bool isWord;              ///< the letters are a word themselves (index firstWord - 1)
};

class WordGraph {
  public:
    WordGraph() = default;
    /// The base nodes of a finished store. `size`: how many words they spell.
    WordGraph(std::shared_ptr<NodeStore> store, std::uint32_t size);
    WordGraph(const WordGraph& other);
    WordGraph(WordGraph&& other) noexcept;
    WordGraph& operator=(WordGraph other) noexcept;
    ~WordGraph();

    /// The number of words.
    std::uint32_t size() const { return size_; }
    bool contains(std::string_view word) const;
    /// Whether some word begins with these letters (a word begins with itself).
    bool hasPrefix(std::string_view prefix) const;
    /// How many words come before `word` in alphabetical order, whether it is held or not.
    std::uint32_t rank(std::string_view word) const;
    /// Index of the first word that begins with `prefix`, or -1 when there is none.
    std::int64_t firstIndex(std::string_view prefix) const;
    /// How many words begin with `prefix`.
    std::uint32_t wordsBelow(std::string_view prefix) const;

    /// Adds a word; false when it is held already. Throws std::bad_alloc and changes nothing.
    bool add(std::string_view word);
    /// Removes a word; false when it is not held. Throws std::bad_alloc and changes nothing.
    bool remove(std::string_view word);

    /// Whether no smaller graph spells the same words: true until an edit.
    bool isMinimal() const { return !store_ || root_ == store_->baseRoot(); }

    /// Whether both are the same snapshot, with no edit between them.
    bool operator==(const WordGraph& other) const {
        return store_ == other.store_ && root_ == other.root_ && size_ == other.size_;
    }

    /// For those who walk the nodes themselves; see node_store.h. Valid until the next edit.
    const std::uint32_t* nodes() const;
    NodeIndex root() const { return root_; }
    /// Above the index of every node.
    std::size_t nodesEnd() const { return store_ ? store_->size() : 1; }

    /// Follows a text, which may hold anything, from the root; false when no word begins with it.
    bool find(const char* text, GraphPlace& place) const;
    /// The same for a word or a prefix.
    bool find(std::string_view letters, GraphPlace& place) const;

  private:
    void prepareEdit();

    std::shared_ptr<NodeStore> store_;
    NodeIndex root_ = NoNode;
    std::uint32_t size_ = 0;
};

/// How many words are spelled from `node` down.
std::uint32_t CountWords(const std::uint32_t* nodes, NodeIndex node);
