#pragma once
// Reading the nodes of a dictionary file, every byte of which may be wrong.
#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <vector>

#include "dictionary_codes.h"
#include "node_store.h"

class DictionaryDecoder {
  public:
    /// `bytes`: what follows the header.
    DictionaryDecoder(const DictionaryHeader& header, std::span<const std::byte> bytes);

    /// The finished base nodes, or null when the bytes are not exactly a graph of the header's
    /// counts. Throws std::bad_alloc.
    std::shared_ptr<NodeStore> read();

  private:
    struct Read {
        NodeIndex node;
        std::uint32_t words;   // spelled from the node down
        std::uint32_t height;  // letters of the longest one
    };
    // The nodes that wait for a parent: at most the later letters of every node on one path.
    static constexpr std::size_t MostWaiting = LongestWord * Letters;

    bool plausible() const;
    void readTables();
    bool readNodes();
    bool readNode(std::uint32_t mask);
    bool readLink(Read& child, std::uint32_t& wordEnds);
    bool share();
    bool finished() const;
    bool readCode(std::uint32_t& code);
    std::uint32_t readFour();

    const DictionaryHeader& header_;
    const std::byte* at_;
    const std::byte* end_;
    std::shared_ptr<NodeStore> store_;
    std::uint32_t* cells_ = nullptr;
    std::size_t used_ = 1;  // cells written
    std::size_t all_ = 1;   // cells that the header promises
    std::vector<std::uint32_t> masks_;
    std::vector<std::uint32_t> hotLinks_;
    std::vector<Read> shared_;
    std::size_t sharedCount_ = 0;
    std::array<Read, MostWaiting> waiting_;
    std::size_t waitingCount_ = 0;
};
