#include "dictionary_file/graph_codec.h"

#include <algorithm>

#include "graph/bit_count.h"
#include "graph/packed_word.h"

// Links lead to nodes read before, so there are no cycles; words and heights add up as the nodes
// come, so no walk of the finished graph is needed to know that it is sound.
//
// Codes of one and two bytes, links to all kinds of nodes alternate at random: they are told apart
// without a branch.

namespace Quorle {

namespace {

std::uint32_t Byte(const std::byte* at) {
    return std::to_integer<std::uint32_t>(*at);
}

std::uint32_t FourBytes(const std::byte* at) {
    return Byte(at) | Byte(at + 1) << 8 | Byte(at + 2) << 16 | Byte(at + 3) << 24;
}

/// 1 when a code that is not long has two bytes.
std::uint32_t IsTwo(std::uint32_t first) {
    static_assert(OneByteCodes == 128);
    return first >> 7;
}

std::uint32_t TwoByteCode(std::uint32_t first, std::uint32_t second) {
    return OneByteCodes + ((first - OneByteCodes) << 8) + second;
}

bool IsMask(std::uint32_t mask) {
    return mask != 0 && mask >> Letters == 0;
}

/// What a link to a node puts into its edge, and what is known of the words below.
struct Node {
    std::uint32_t letters;
    std::uint32_t first;
    std::uint32_t words;
    std::uint32_t height;  // letters of the longest one
};
// The nodes that wait for a parent: at most the later letters of every node on one path.
constexpr std::uint32_t MostWaiting = LongestWord * Letters;

// A link is twice the place of a node behind those that wait, plus 1 when a word ends: nothing
// comes first there, then the shared nodes.
constexpr std::uint32_t FirstLink = 2;

/// What the first byte of a link's code tells.
struct LinkStart {
    std::uint32_t link;
    std::uint16_t secondMask;  // of the second byte, which is added to the link
    std::uint16_t isNew;       // 1: the link is to the newest node that waits
};

constexpr std::ptrdiff_t LongCodeSize = 5;
constexpr std::ptrdiff_t MostNodeBytes = LongCodeSize * (1 + Letters);

class Decoder {
  public:
    Decoder(const DictionaryHeader& header, std::span<const std::byte> bytes)
        : header_(header), code_(bytes.data()), end_(bytes.data() + bytes.size()) {}

    std::shared_ptr<EdgeStore> read();

  private:
    bool isPlausible() const;
    std::uint32_t takeFour();
    bool readTables();
    bool readAllNodes();
    const std::byte* readNodes(const std::byte* code, const std::byte* end);
    bool readNode(const std::byte*& code);
    bool readMask(const std::byte*& code, std::uint32_t& mask) const;
    bool readLink(const std::byte*& code, LinkStart& link) const;
    bool isFinished() const;

    const DictionaryHeader header_;
    const std::byte* code_;
    const std::byte* end_;
    Edge* edges_ = nullptr;
    std::uint32_t edge_ = 1;  // the next one
    std::uint32_t nodeCount_ = 0;
    std::uint32_t waiting_ = 0;
    std::uint32_t shared_ = 0;
    std::vector<std::uint32_t> masks_;
    std::array<LinkStart, 256> links_{};
    std::uint32_t firstNumber_ = 0;  // the code of number 0
    // Those that wait in MostWaiting places, then nothing, then the shared nodes by number.
    std::vector<Node> nodes_;
};

std::shared_ptr<EdgeStore> Decoder::read() {
    if (!isPlausible()) return nullptr;
    auto store = std::make_shared<EdgeStore>();
    store->reserve(header_.edges);
    store->append(header_.edges);
    edges_ = store->edges();
    const std::size_t count = MostWaiting + 1 + std::size_t{header_.shared};
    nodes_.reserve(count);
    nodes_.resize(count);
    if (!readTables() || !readAllNodes() || !isFinished()) return nullptr;
    store->closeBase({nodes_[0].letters, nodes_[0].first});
    return store;
}

// The counts against the bytes there are, before any memory is asked for.
bool Decoder::isPlausible() const {
    const auto bytes = static_cast<std::size_t>(end_ - code_);
    const std::size_t tables = 4 * (std::size_t{header_.masks} + header_.hotLinks);
    return header_.masks <= MostMasks && header_.hotLinks <= MostHotLinks && tables <= bytes &&
           std::size_t{header_.nodes} + header_.edges + header_.shared <= bytes - tables;
}

std::uint32_t Decoder::takeFour() {
    const std::uint32_t value = FourBytes(code_);
    code_ += 4;
    return value;
}

bool Decoder::readTables() {
    masks_.resize(header_.masks);
    for (std::uint32_t& mask : masks_) {
        mask = takeFour();
        if (!IsMask(mask)) return false;
    }
    links_[EndCode] = {1, 0, 0};
    links_[NewChildCode] = {0, 0, 1};
    links_[NewWordCode] = {1, 0, 1};
    firstNumber_ = FirstSharedCode + header_.hotLinks;
    for (std::uint32_t code = FirstSharedCode; code < firstNumber_; ++code) {
        const std::uint32_t link = takeFour();
        if (link >> 1 >= header_.shared) return false;
        links_[code] = {FirstLink + link, 0, 0};
    }
    for (std::uint32_t code = firstNumber_; code < OneByteCodes; ++code) {
        links_[code] = {FirstLink + code - firstNumber_, 0, 0};
    }
    for (std::uint32_t first = OneByteCodes; first < LongCode; ++first) {
        links_[first] = {FirstLink + TwoByteCode(first, 0) - firstNumber_, 0xff, 0};
    }
    return true;
}

// The end is asked for between nodes only: the last ones are read from a copy with room behind it.
bool Decoder::readAllNodes() {
    const std::byte* const code = CountingBits(
        [&] { return readNodes(code_, end_ - std::min(end_ - code_, MostNodeBytes)); });
    if (code == nullptr || code > end_) return false;
    std::array<std::byte, 2 * MostNodeBytes> rest{};
    const std::byte* const restEnd = std::copy(code, end_, rest.data());
    return readNodes(rest.data(), restEnd) == restEnd;
}

/// Reads nodes as long as they begin before `end`, and returns where the last one ends; null when
/// they are wrong.
inline const std::byte* Decoder::readNodes(const std::byte* code, const std::byte* end) {
    while (code < end) {
        if (Byte(code) != ShareCode) {
            if (!readNode(code)) return nullptr;
            continue;
        }
        if (waiting_ == 0 || shared_ == header_.shared) return nullptr;
        nodes_[MostWaiting + ++shared_] = nodes_[waiting_ - 1];
        ++code;
    }
    return code;
}

inline bool Decoder::readNode(const std::byte*& code) {
    std::uint32_t mask = 0;
    if (!readMask(code, mask)) return false;
    const auto count = static_cast<std::uint32_t>(std::popcount(mask));
    if (count > header_.edges + 1 - edge_) return false;
    const Node* const nodes = nodes_.data();
    Edge* edge = edges_ + edge_;
    std::uint32_t waiting = waiting_;
    std::uint64_t words = 0;
    std::uint32_t height = 0;
    for (Edge* const end = edge + count; edge != end; ++edge) {
        LinkStart link{};
        if (!readLink(code, link)) return false;
        if (link.isNew > waiting || link.link >> 1 > shared_) return false;
        const std::uint32_t toNew = (0U - link.isNew) & (MostWaiting + 1 - waiting);
        const Node& child = nodes[MostWaiting + (link.link >> 1) - toNew];
        waiting -= link.isNew;
        words += link.link & 1;
        *edge = {child.letters | link.link << 31, child.first, static_cast<std::uint32_t>(words)};
        words += child.words;
        height = std::max(height, child.height + 1);
    }
    if (words > INT32_MAX || height > LongestWord || waiting == MostWaiting) return false;
    nodes_[waiting] = {mask, edge_, static_cast<std::uint32_t>(words), height};
    edge_ += count;
    ++nodeCount_;
    waiting_ = waiting + 1;
    return true;
}

inline bool Decoder::readMask(const std::byte*& code, std::uint32_t& mask) const {
    const std::uint32_t first = Byte(code);
    if (first == LongCode) [[unlikely]] {
        mask = FourBytes(code + 1);
        code += LongCodeSize;
        return IsMask(mask);
    }
    const std::uint32_t isTwo = IsTwo(first);
    const std::uint32_t number =
        first + ((0 - isTwo) & (TwoByteCode(first, Byte(code + 1)) - first));
    code += 1 + isTwo;
    if (number - FirstMaskCode >= masks_.size()) return false;
    mask = masks_[number - FirstMaskCode];
    return true;
}

inline bool Decoder::readLink(const std::byte*& code, LinkStart& link) const {
    const std::uint32_t first = Byte(code);
    if (first == LongCode) [[unlikely]] {
        const std::uint32_t number = FourBytes(code + 1);
        code += LongCodeSize;
        link = {FirstLink + number - firstNumber_, 0, 0};
        return number >= TwoByteCodes;
    }
    link = links_[first];
    link.link += link.secondMask & Byte(code + 1);
    code += 1 + IsTwo(first);
    return true;
}

// Exactly one node has no parent, all counts are used up, and no word has one letter only.
bool Decoder::isFinished() const {
    if (edge_ != header_.edges + 1 || nodeCount_ != header_.nodes) return false;
    if (shared_ != header_.shared) return false;
    if (nodes_[0].words != header_.words || waiting_ != (header_.nodes == 0 ? 0 : 1)) return false;
    const Edge root{nodes_[0].letters, nodes_[0].first};
    return std::none_of(edges_ + root.first, edges_ + root.first + root.count(),
                        [](const Edge& edge) { return edge.isWord(); });
}

}  // namespace

std::shared_ptr<EdgeStore> DecodeGraph(const DictionaryHeader& header,
                                       std::span<const std::byte> bytes) {
    return Decoder(header, bytes).read();
}

}  // namespace Quorle
