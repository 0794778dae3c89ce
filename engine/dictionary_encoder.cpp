#include "dictionary_encoder.h"

#include <algorithm>

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

/// At most `most` of the values that occur, the most frequent first.
std::vector<std::uint32_t> Frequent(const Codes& uses, std::size_t most) {
    std::vector<std::pair<std::uint32_t, std::uint32_t>> order;
    order.reserve(uses.size());
    for (const auto& [value, count] : uses) order.emplace_back(~count, value);
    std::sort(order.begin(), order.end());
    order.resize(std::min(order.size(), most));
    std::vector<std::uint32_t> values(order.size());
    std::transform(order.begin(), order.end(), values.begin(),
                   [](const auto& use) { return use.second; });
    return values;
}

Codes Numbered(const std::vector<std::uint32_t>& values, std::uint32_t first) {
    Codes codes;
    for (const std::uint32_t value : values) codes.emplace(value, first++);
    return codes;
}

}  // namespace

DictionaryEncoder::DictionaryEncoder(const WordGraph& graph) : nodes_(graph.nodes()) {
    if (graph.root() == NoNode) return;
    // In a minimal graph every node stands before its parents, the root last.
    uses_.resize(graph.root() + 1);
    numbers_.resize(graph.root() + 1, NotSeen);
    for (NodeIndex node = 1; node <= graph.root(); node += 1 + 2 * EdgeCount(nodes_[node])) {
        countUses(node);
    }
    flatten(graph.root());
    makeTables();
}

void DictionaryEncoder::countUses(NodeIndex node) {
    const std::uint32_t edges = EdgeCount(nodes_[node]);
    for (std::uint32_t i = 0; i < edges; ++i) ++uses_[ChildOf(nodes_[node + 1 + 2 * i])];
    edges_ += edges;
    ++count_;
}

// Children before their parent, the last letter's first: a reader that stacks nodes finds each
// letter's new child on top.
void DictionaryEncoder::flatten(NodeIndex node) {
    const std::uint32_t edges = EdgeCount(nodes_[node]);
    std::uint32_t newChildren = 0;
    for (std::uint32_t i = edges; i-- > 0;) {
        const NodeIndex child = ChildOf(nodes_[node + 1 + 2 * i]);
        if (child == NoNode || numbers_[child] != NotSeen) continue;
        flatten(child);
        newChildren |= 1U << i;
    }
    stream_.push_back(nodes_[node]);
    for (std::uint32_t i = 0; i < edges; ++i) {
        stream_.push_back(linkCode(nodes_[node + 1 + 2 * i], (newChildren >> i & 1) != 0));
    }
    numbers_[node] = NotShared;
    if (uses_[node] < 2) return;
    numbers_[node] = shared_++;
    stream_.push_back(ShareCode);
}

// The code of a link as if there were no table of frequent ones.
std::uint32_t DictionaryEncoder::linkCode(std::uint32_t link, bool isNew) const {
    const std::uint32_t wordEnds = link >> 31;
    if (ChildOf(link) == NoNode) return EndCode;
    if (isNew) return NewChildCode + wordEnds;
    return FirstSharedCode + 2 * numbers_[ChildOf(link)] + wordEnds;
}

void DictionaryEncoder::makeTables() {
    Codes masks;
    Codes links;
    for (std::size_t at = 0; at < stream_.size();) {
        const std::uint32_t mask = stream_[at++];
        if (mask != ShareCode) ++masks[mask];
        for (std::uint32_t left = EdgeCount(mask); left > 0; --left) {
            const std::uint32_t code = stream_[at++];
            if (code >= FirstSharedCode) ++links[code - FirstSharedCode];
        }
    }
    masks_ = Frequent(masks, MostMasks);
    hotLinks_ = Frequent(links, MostHotLinks);
    maskCodes_ = Numbered(masks_, FirstMaskCode);
    hotCodes_ = Numbered(hotLinks_, FirstSharedCode);
}

void DictionaryEncoder::write(std::vector<std::byte>& out, DictionaryHeader& header) const {
    header.nodes = count_;
    header.edges = edges_;
    header.shared = shared_;
    header.masks = static_cast<std::uint16_t>(masks_.size());
    header.hotLinks = static_cast<std::uint16_t>(hotLinks_.size());
    for (const std::uint32_t mask : masks_) PutBytes(out, mask, 4);
    for (const std::uint32_t link : hotLinks_) PutBytes(out, link, 4);
    const auto hotLinks = static_cast<std::uint32_t>(hotLinks_.size());
    for (std::size_t at = 0; at < stream_.size();) {
        const std::uint32_t mask = stream_[at++];
        const auto known = maskCodes_.find(mask);
        if (mask == ShareCode || known != maskCodes_.end()) {
            PutCode(out, mask == ShareCode ? ShareCode : known->second);
        } else {
            PutBytes(out, LongCode, 1);
            PutBytes(out, mask, 4);
        }
        for (std::uint32_t left = EdgeCount(mask); left > 0; --left) {
            std::uint32_t code = stream_[at++];
            if (code >= FirstSharedCode) {
                const auto hot = hotCodes_.find(code - FirstSharedCode);
                code = hot != hotCodes_.end() ? hot->second : code + hotLinks;
            }
            PutCode(out, code);
        }
    }
}
