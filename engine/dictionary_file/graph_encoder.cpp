#include "dictionary_file/graph_codec.h"

#include <algorithm>
#include <unordered_map>

namespace Quorle {

namespace {

using Codes = std::unordered_map<std::uint32_t, std::uint32_t>;

void PutBytes(std::vector<std::byte>& out, std::uint32_t value, int bytes) {
    for (int i = 0; i < bytes; ++i) out.push_back(static_cast<std::byte>(value >> (8 * i)));
}

void PutCode(std::vector<std::byte>& out, std::uint32_t code) {
    if (code < OneByteCodes) {
        PutBytes(out, code, 1);
    } else if (code < TwoByteCodes) {
        PutBytes(out, OneByteCodes + ((code - OneByteCodes) >> 8), 1);
        PutBytes(out, code - OneByteCodes, 1);
    } else {
        PutBytes(out, LongCode, 1);
        PutBytes(out, code, 4);
    }
}

/// Writes at most `most` of the values that occur as a table, the most frequent first; the uses
/// become codes from `first` on. Returns how many there are.
std::uint16_t PutTable(std::vector<std::byte>& out, Codes& uses, std::uint32_t first,
                       std::size_t most) {
    std::vector<std::pair<std::uint32_t, std::uint32_t>> order;
    order.reserve(uses.size());
    for (const auto& [value, count] : uses) order.emplace_back(~count, value);
    std::sort(order.begin(), order.end());
    order.resize(std::min(order.size(), most));
    uses.clear();
    for (const auto& [count, value] : order) {
        PutBytes(out, value, 4);
        uses.emplace(value, first++);
    }
    return static_cast<std::uint16_t>(order.size());
}

class Encoder {
  public:
    explicit Encoder(const WordGraph& graph)
        : edges_(graph.edges()), uses_(graph.edgesEnd()), numbers_(graph.edgesEnd(), NotSeen) {
        if (graph.root().next() == 0) return;
        countUses(graph.root());
        flatten(graph.root());
    }
    void write(std::vector<std::byte>& out, DictionaryHeader& header);

  private:
    static constexpr std::uint32_t NotSeen = ~0U;
    static constexpr std::uint32_t NotShared = NotSeen - 1;

    void countUses(const Edge& to);
    void flatten(const Edge& to);

    const Edge* edges_;
    std::vector<std::uint32_t> uses_;     // of each node, by its first edge
    std::vector<std::uint32_t> numbers_;  // of each node: NotSeen, NotShared, or its number
    std::uint32_t shared_ = 0;
    std::uint32_t nodeCount_ = 0;
    std::uint32_t edgeCount_ = 0;
    // The nodes in file order: letters, a code for each, ...; ShareCode between nodes. Links stand
    // as if there were no table of frequent ones.
    std::vector<std::uint32_t> stream_;
    Codes masks_;
    Codes links_;
};

void Encoder::countUses(const Edge& to) {
    if (to.next() == 0 || uses_[to.first]++ > 0) return;
    ++nodeCount_;
    edgeCount_ += to.count();
    for (std::uint32_t i = 0; i < to.count(); ++i) countUses(edges_[to.first + i]);
}

// Children before their parent, the last letter's first: a reader that stacks nodes finds each
// letter's new child on top.
void Encoder::flatten(const Edge& to) {
    const std::uint32_t count = to.count();
    const Edge* const edges = edges_ + to.first;
    std::uint32_t newChildren = 0;
    for (std::uint32_t i = count; i-- > 0;) {
        if (edges[i].next() == 0 || numbers_[edges[i].first] != NotSeen) continue;
        flatten(edges[i]);
        newChildren |= 1U << i;
    }
    stream_.push_back(to.next());
    ++masks_[to.next()];
    for (std::uint32_t i = 0; i < count; ++i) {
        const std::uint32_t wordEnds = edges[i].isWord() ? 1 : 0;
        if (edges[i].next() == 0) {
            stream_.push_back(EndCode);
        } else if ((newChildren >> i & 1) != 0) {
            stream_.push_back(NewChildCode + wordEnds);
        } else {
            const std::uint32_t link = 2 * numbers_[edges[i].first] + wordEnds;
            stream_.push_back(FirstSharedCode + link);
            ++links_[link];
        }
    }
    numbers_[to.first] = NotShared;
    if (uses_[to.first] < 2) return;
    numbers_[to.first] = shared_++;
    stream_.push_back(ShareCode);
}

void Encoder::write(std::vector<std::byte>& out, DictionaryHeader& header) {
    header.nodes = nodeCount_;
    header.edges = edgeCount_;
    header.shared = shared_;
    header.masks = PutTable(out, masks_, FirstMaskCode, MostMasks);
    header.hotLinks = PutTable(out, links_, FirstSharedCode, MostHotLinks);
    for (auto at = stream_.begin(); at != stream_.end();) {
        const std::uint32_t mask = *at++;
        const auto known = masks_.find(mask);
        if (mask == ShareCode || known != masks_.end()) {
            PutCode(out, mask == ShareCode ? ShareCode : known->second);
        } else {
            PutBytes(out, LongCode, 1);
            PutBytes(out, mask, 4);
        }
        for (std::uint32_t left = mask; left != 0; left &= left - 1) {
            std::uint32_t code = *at++;
            if (code >= FirstSharedCode) {
                const auto hot = links_.find(code - FirstSharedCode);
                code = hot != links_.end() ? hot->second : code + header.hotLinks;
            }
            PutCode(out, code);
        }
    }
}

}  // namespace

void EncodeGraph(const WordGraph& graph, std::vector<std::byte>& out, DictionaryHeader& header) {
    Encoder(graph).write(out, header);
}

}  // namespace Quorle
