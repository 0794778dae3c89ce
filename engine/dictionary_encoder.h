#pragma once
// Writing the nodes of a graph in the compact form of dictionary files.
#include <cstddef>
#include <cstdint>
#include <unordered_map>
#include <vector>

#include "dictionary_codes.h"
#include "word_graph.h"

class DictionaryEncoder {
  public:
    /// `graph` must be minimal.
    explicit DictionaryEncoder(const WordGraph& graph);

    /// Appends tables and nodes to `out`, and fills in the header's counts.
    void write(std::vector<std::byte>& out, DictionaryHeader& header) const;

  private:
    static constexpr std::uint32_t NotSeen = ~0U;
    static constexpr std::uint32_t NotShared = NotSeen - 1;

    void countUses(NodeIndex node);
    void flatten(NodeIndex node);
    std::uint32_t linkCode(std::uint32_t link, bool isNew) const;
    void makeTables();

    const std::uint32_t* nodes_;
    std::vector<std::uint32_t> uses_;     // of each node, by its index
    std::vector<std::uint32_t> numbers_;  // of each node: NotSeen, NotShared, or its number
    std::uint32_t shared_ = 0;
    std::uint32_t count_ = 0;
    std::uint32_t edges_ = 0;
    // The nodes in file order: mask, a link code for each letter, ...; ShareCode between nodes.
    std::vector<std::uint32_t> stream_;
    std::vector<std::uint32_t> masks_;  // the most frequent first
    std::vector<std::uint32_t> hotLinks_;
    std::unordered_map<std::uint32_t, std::uint32_t> maskCodes_;
    std::unordered_map<std::uint32_t, std::uint32_t> hotCodes_;
};
