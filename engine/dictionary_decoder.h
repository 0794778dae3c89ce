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
    DictionaryDecoder(const DictionaryHeader& header, std::span<const std::byte> bytes)
        : header_(header), code_(bytes.data()), end_(bytes.data() + bytes.size()) {}

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

    struct Shape {
        std::uint32_t mask;
        std::uint32_t cells;  // that a node with the mask takes
    };
    // A link is twice the place of a node behind those that wait, plus 1 when a word ends: nothing
    // comes first there, then the shared nodes.
    static constexpr std::uint32_t FirstLink = 2;
    /// What the first byte of a link's code tells.
    struct LinkStart {
        std::uint32_t link;
        std::uint16_t secondMask;  // of the second byte, which is added to the link
        std::uint16_t isNew;       // 1: the link is to the newest node that waits
    };
    /// How far reading has come.
    struct Progress {
        const std::byte* code;
        std::uint32_t* cell;
        std::uint32_t waiting;
        std::uint32_t shared;
    };
    static constexpr std::ptrdiff_t LongCodeSize = 5;
    // No node takes more bytes, so its codes are looked at without asking for the end.
    static constexpr std::ptrdiff_t MostNodeBytes = LongCodeSize * (1 + Letters);

    bool plausible() const;
    std::uint32_t takeFour();
    bool readTables();
    bool readShapes();
    bool readLinkStarts();
    bool readNodes();
    template <bool NearEnd>
    bool readNode(Progress& progress);
    template <bool NearEnd>
    bool readShape(const std::byte*& code, Shape& shape) const;
    template <bool NearEnd>
    bool readLink(const std::byte*& code, LinkStart& link) const;
    template <bool NearEnd>
    bool isThere(const std::byte* code) const;
    bool share(Progress& progress);
    bool finished() const;

    const DictionaryHeader& header_;
    const std::byte* code_;
    const std::byte* end_;
    std::shared_ptr<NodeStore> store_;
    std::uint32_t* cells_ = nullptr;
    std::uint32_t* cellsEnd_ = nullptr;  // of those that the header promises
    std::vector<Shape> shapes_;          // of the table of masks
    std::array<LinkStart, 256> links_{};
    std::uint32_t firstNumber_ = 0;  // the code of number 0
    // Those that wait in MostWaiting places, then nothing, then the shared nodes by number.
    std::vector<Read> nodes_;
    Progress progress_{};
};
