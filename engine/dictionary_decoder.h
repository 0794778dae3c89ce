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

/// Takes codes off the front of bytes.
class CodeReader {
  public:
    explicit CodeReader(std::span<const std::byte> bytes)
        : at_(bytes.data()), end_(bytes.data() + bytes.size()) {}

    std::size_t left() const { return static_cast<std::size_t>(end_ - at_); }
    bool isLong() const { return at_ != end_ && *at_ == std::byte{LongCode}; }
    bool read(std::uint32_t& code);
    /// A number of four bytes, which must be there.
    std::uint32_t readFour();

  private:
    bool readSlowly(std::uint32_t& code);

    const std::byte* at_;
    const std::byte* end_;
};

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
    static constexpr std::uint32_t MostWaiting = LongestWord * Letters;

    bool plausible() const;
    bool readTables();
    bool readNodes();
    bool readNode(CodeReader& codes, std::uint32_t mask);
    bool readLink(CodeReader& codes, std::uint32_t& waiting, Read& child, std::uint32_t& wordEnds);
    bool share();
    bool finished() const;

    const DictionaryHeader& header_;
    CodeReader codes_;
    std::shared_ptr<NodeStore> store_;
    std::uint32_t* cells_ = nullptr;
    std::size_t used_ = 1;  // cells written
    std::size_t all_ = 1;   // cells that the header promises
    std::vector<std::uint32_t> masks_;
    // A link is twice the place of a node behind those that wait, plus 1 when a word ends: nothing
    // comes first there, then the shared nodes.
    static constexpr std::uint32_t FirstLink = 2;
    std::array<std::uint32_t, OneByteCodes> shortLinks_{};  // of the codes of one byte
    std::uint32_t firstNumber_ = 0;                         // the code of number 0
    // Those that wait in MostWaiting places, then nothing, then the shared nodes by number.
    std::vector<Read> nodes_;
    std::uint32_t waiting_ = 0;
    std::uint32_t shared_ = 0;
};
