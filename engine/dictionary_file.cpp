#include "dictionary_file.h"

#include <algorithm>
#include <array>
#include <cstring>

#include "crc32c.h"
#include "graph_builder.h"
#include "word_cursor.h"

namespace {

constexpr std::uint32_t Magic = 0x44727551;
constexpr std::uint32_t Version = 1;

struct Header {
    std::uint32_t magic;
    std::uint32_t checksum;
    std::uint32_t version;
    std::uint32_t maxWordSize;
    std::uint32_t words;
    std::uint32_t root;
};

WordGraph Minimal(const WordGraph& words) {
    if (words.isMinimal()) return words;
    GraphBuilder builder;
    WordCursor cursor(words);
    for (std::string_view word; cursor.next(word);) builder.add(word);
    return builder.finish();
}

std::uint32_t Checksum(std::span<const std::byte> bytes) {
    return Crc32c(Crc32c(0, bytes.subspan(0, 4)), bytes.subspan(8));
}

/// Checks nodes in file order; links lead backwards only.
class NodeChecker {
  public:
    explicit NodeChecker(std::span<const std::uint32_t> nodes)
        : nodes_(nodes), counts_(nodes.size()), depths_(nodes.size()) {}

    bool check(std::uint32_t root, std::uint32_t words) {
        std::uint32_t last = NoNode;
        for (std::uint32_t at = 1; at < nodes_.size(); at += 1 + 2 * EdgeCount(nodes_[at])) {
            if (!checkNode(at)) return false;
            last = at;
        }
        return root == last && counts_[root] == words;
    }

  private:
    bool checkNode(std::uint32_t at) {
        const std::uint32_t mask = nodes_[at];
        const std::uint32_t end = 1 + 2 * EdgeCount(mask);
        if (mask == 0 || mask >> Letters != 0 || end > nodes_.size() - at) return false;
        std::uint64_t words = 0;
        int depth = 0;
        for (std::uint32_t i = 1; i < end; i += 2) {
            const std::uint32_t link = nodes_[at + i];
            const NodeIndex child = ChildOf(link);
            if (link == 0 || child >= at || nodes_[at + i + 1] != words) return false;
            if (child != NoNode && depths_[child] == 0) return false;
            words += (link >> 31) + counts_[child];
            depth = std::max(depth, depths_[child] + 1);
        }
        if (words > INT32_MAX || depth > LongestWord) return false;
        counts_[at] = static_cast<std::uint32_t>(words);
        depths_[at] = static_cast<std::uint8_t>(depth);
        return true;
    }

    std::span<const std::uint32_t> nodes_;
    std::vector<std::uint32_t> counts_;
    std::vector<std::uint8_t> depths_;  // 0: no node begins here
};

}  // namespace

std::vector<std::byte> EncodeDictionary(const DictionaryContent& content) {
    const WordGraph words = Minimal(content.words);
    const std::size_t cells =
        words.root() == NoNode ? 0 : words.root() + 2 * EdgeCount(words.nodes()[words.root()]);
    Header header{Magic,        0,
                  Version,      static_cast<std::uint32_t>(content.maxWordSize),
                  words.size(), words.root()};
    std::vector<std::byte> bytes(sizeof header + cells * 4);
    std::memcpy(bytes.data(), &header, sizeof header);
    std::memcpy(bytes.data() + sizeof header, words.nodes() + 1, cells * 4);
    header.checksum = Checksum(bytes);
    std::memcpy(bytes.data(), &header, sizeof header);
    return bytes;
}

bool DecodeDictionary(std::span<const std::byte> bytes, DictionaryContent& content) {
    Header header{};
    if (bytes.size() < sizeof header || bytes.size() % 4 != 0) return false;
    std::memcpy(&header, bytes.data(), sizeof header);
    if (header.magic != Magic || header.version != Version || header.maxWordSize < 2 ||
        header.maxWordSize > LongestWord || header.checksum != Checksum(bytes)) {
        return false;
    }
    const std::size_t cells = (bytes.size() - sizeof header) / 4;
    auto store = std::make_shared<NodeStore>();
    store->reserve(cells);
    std::memcpy(store->words() + store->append(cells), bytes.data() + sizeof header, cells * 4);
    if (!NodeChecker({store->words(), cells + 1}).check(header.root, header.words)) return false;
    store->closeBase(header.root);
    content.words = WordGraph(std::move(store), header.words);
    content.maxWordSize = static_cast<std::int32_t>(header.maxWordSize);
    return true;
}
