#include <algorithm>
#include <cstring>

#include "dictionary_file/dictionary_file.h"
#include "dictionary_file/file_form.h"

// Links lead to nodes read before, so there are no cycles; words and heights add up as the nodes
// come, so no walk of the finished graph is needed to know that it is sound.
//
// Codes of one and two bytes, links to all kinds of nodes alternate at random: they are told apart
// without a branch.

namespace Quorle {

namespace {

std::uint32_t FourBytes(const std::byte* at) {
    std::uint32_t value = 0;
    std::memcpy(&value, at, sizeof value);
    return value;
}

/// The first byte of a code, and what the bytes after it add.
struct Code {
    std::uint32_t first;
    std::uint32_t rest;
};
constexpr std::ptrdiff_t MostNodeBytes = 5 * (1 + Letters);

/// What the first byte of a code stands for by itself.
constexpr std::uint32_t StartOf(std::uint32_t first) {
    if (first == LongCode) return 0;
    return first < OneByteCodes ? first : OneByteCodes + (first - OneByteCodes) * 256;
}

/// The code at `at`, which moves behind it.
inline Code TakeCode(const std::byte*& at) {
    const auto first = std::to_integer<std::uint32_t>(at[0]);
    if (first == LongCode) [[unlikely]] {
        at += 5;
        return {first, FourBytes(at - 4)};
    }
    static_assert(OneByteCodes == 1 << 7);
    const std::uint32_t isTwo = first >> 7;
    const std::uint32_t rest = std::to_integer<std::uint32_t>(at[1]) & (0 - isTwo);
    at += 1 + isTwo;
    return {first, rest};
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

/// To the newest node that waits, or to a place behind those that wait: nothing comes first there,
/// then the shared nodes.
struct Link {
    std::uint32_t place;  // twice, plus 1 when a word ends
    std::uint32_t isNew;
};
constexpr std::uint32_t FirstShared = 2;  // as a place

class Decoder {
  public:
    Decoder(const DictionaryHeader& header, std::span<const std::byte> file)
        : header_(header), code_(file.data() + HeaderSize), end_(file.data() + file.size()) {}

    /// The finished base, or null.
    std::shared_ptr<EdgeStore> read() {
        auto store = std::make_shared<EdgeStore>();
        store->reserve(header_.edges);
        store->append(header_.edges);
        edges_ = store->edges();
        nodes_.resize(MostWaiting + 1 + std::size_t{header_.shared});
        if (!readTables() || !readAllNodes() || !isFinished()) return nullptr;
        store->closeBase({nodes_[0].first, nodes_[0].letters});
        return store;
    }

  private:
    bool readTables() {
        masks_.resize(FirstMaskCode);
        for (int left = header_.masks; left > 0; --left, code_ += 4) {
            masks_.push_back(FourBytes(code_));
            if (!IsMask(masks_.back())) return false;
        }
        const std::uint32_t numbers = FirstSharedCode + header_.hotLinks;
        for (std::uint32_t first = 0; first < 256; ++first) {
            links_[first] = {FirstShared + StartOf(first) - numbers, 0};
        }
        links_[EndCode] = {1, 0};
        links_[NewChildCode] = {0, 1};
        links_[NewWordCode] = {1, 1};
        for (std::uint32_t code = FirstSharedCode; code < numbers; ++code, code_ += 4) {
            links_[code] = {FirstShared + FourBytes(code_), 0};
            if (FourBytes(code_) >> 1 >= header_.shared) return false;
        }
        return true;
    }

    // The end is asked for between nodes only: the last ones are read from a copy with room behind
    // it.
    bool readAllNodes() {
        code_ = readNodes(code_, end_ - std::min(end_ - code_, MostNodeBytes));
        if (code_ == nullptr) return false;
        std::array<std::byte, 2 * MostNodeBytes> rest{};
        const std::byte* const restEnd = std::copy(code_, end_, rest.data());
        return readNodes(rest.data(), restEnd) == restEnd;
    }

    /// Reads nodes as long as they begin before `end`, and returns where the last one ends; null
    /// when they are wrong.
    const std::byte* readNodes(const std::byte* code, const std::byte* end) {
        while (code < end) {
            if (*code == std::byte{ShareCode}) {
                if (waiting_ == 0 || shared_ == header_.shared) return nullptr;
                nodes_[MostWaiting + ++shared_] = nodes_[waiting_ - 1];
                ++code;
            } else if (!readNode(code)) {
                return nullptr;
            }
        }
        return code;
    }

    bool readNode(const std::byte*& code) {
        const std::uint32_t mask = readMask(code);
        if (!IsMask(mask)) return false;
        const Node* const nodes = nodes_.data();
        const Edge* const end = edges_ + header_.edges + 1;
        Edge* edge = edges_ + edge_;
        std::uint32_t waiting = waiting_;
        std::uint64_t words = 0;
        std::uint32_t height = 0;
        for (std::uint32_t left = mask; left != 0; left &= left - 1, ++edge) {
            if (edge == end) return false;
            const Code link = TakeCode(code);
            if (link.first == LongCode && link.rest < TwoByteCodes) return false;
            const std::uint32_t isNew = links_[link.first].isNew;
            const std::uint32_t place = links_[link.first].place + link.rest;
            if (isNew > waiting || place >> 1 > shared_) return false;
            const std::uint32_t toNew = (0 - isNew) & (MostWaiting + 1 - waiting);
            const Node& child = nodes[MostWaiting + (place >> 1) - toNew];
            waiting -= isNew;
            words += place & 1;
            *edge = {child.first, child.letters | place << 31, static_cast<std::uint32_t>(words)};
            words += child.words;
            height = std::max(height, child.height + 1);
        }
        if (words > INT32_MAX || height > LongestWord || waiting == MostWaiting) return false;
        nodes_[waiting] = {mask, edge_, static_cast<std::uint32_t>(words), height};
        edge_ = static_cast<std::uint32_t>(edge - edges_);
        ++nodeCount_;
        waiting_ = waiting + 1;
        return true;
    }

    std::uint32_t readMask(const std::byte*& code) const {
        const Code mask = TakeCode(code);
        if (mask.first == LongCode) return mask.rest;
        const std::uint32_t number = StartOf(mask.first) + mask.rest;
        return number < masks_.size() ? masks_[number] : 0;
    }

    // Exactly one node has no parent, all counts are used up, and no word has one letter only.
    bool isFinished() const {
        const Edge root{nodes_[0].first, nodes_[0].letters};
        const std::span edges(edges_ + root.first, root.count());
        return edge_ == header_.edges + 1 && nodeCount_ == header_.nodes &&
               shared_ == header_.shared && waiting_ == std::min(nodeCount_, 1U) &&
               nodes_[0].words == header_.words && std::ranges::none_of(edges, &Edge::isWord);
    }

    const DictionaryHeader header_;
    const std::byte* code_;
    const std::byte* end_;
    Edge* edges_ = nullptr;
    std::uint32_t edge_ = 1;  // the next one
    std::uint32_t nodeCount_ = 0;
    std::uint32_t waiting_ = 0;
    std::uint32_t shared_ = 0;
    std::vector<std::uint32_t> masks_;  // by code
    std::array<Link, 256> links_{};     // by the first byte of a code
    // Those that wait in MostWaiting places, then nothing, then the shared nodes by number.
    std::vector<Node> nodes_;
};

/// Whether it is a header of ours, the checksum right, and the counts no more than the bytes can
/// hold: memory is asked for by them.
bool IsSound(const DictionaryHeader& header, std::span<const std::byte> file) {
    const std::size_t tables = 4 * (std::size_t{header.masks} + header.hotLinks);
    const std::size_t codes = std::size_t{header.nodes} + header.edges + header.shared;
    return header.magic == DictionaryHeader{}.magic &&
           header.version == DictionaryHeader{}.version && header.maxWordSize >= 2 &&
           header.maxWordSize <= LongestWord && header.masks <= MostMasks &&
           header.hotLinks <= MostHotLinks && HeaderSize + tables + codes <= file.size() &&
           header.checksum == Checksum(file);
}

}  // namespace

bool DecodeDictionary(std::span<const std::byte> file, DictionaryContent& content) {
    DictionaryHeader header;
    if (file.size() < HeaderSize) return false;
    std::memcpy(&header, file.data(), HeaderSize);
    const auto store = IsSound(header, file) ? Decoder(header, file).read() : nullptr;
    if (!store) return false;
    content = {WordGraph(store), header.maxWordSize};
    return true;
}

}  // namespace Quorle
