#include "graph_builder.h"

#include <algorithm>

namespace {

constexpr std::size_t FirstRegisterSize = 1024;

std::size_t Hash(std::uint32_t mask, const std::uint32_t* content, std::uint32_t edges) {
    std::uint64_t hash = mask * 0x9e3779b97f4a7c15U;
    // The skips follow from the links: words below equal children are equally many.
    for (std::uint32_t i = 0; i < edges; ++i) {
        hash = (std::rotl(hash, 23) ^ content[2 * i]) * 0xd6e8feb86659fd93U;
    }
    return static_cast<std::size_t>(hash ^ (hash >> 32));
}

}  // namespace

GraphBuilder::GraphBuilder()
    : nodes_(std::make_shared<NodeStore>()), register_(FirstRegisterSize) {}

void GraphBuilder::add(std::string_view word) {
    const std::size_t most = std::min(word.size(), lastSize_);
    std::size_t common = 0;
    while (common < most && word[common] == last_[common]) ++common;
    closeNodes(common);
    for (std::size_t i = common; i < word.size(); ++i) {
        OpenNode& node = path_[i];
        last_[i] = word[i];
        node.mask |= LetterBit(word[i]);
        node.content[2 * node.edges] = NoNode;
        node.content[2 * node.edges + 1] = node.words;
        ++node.edges;
        path_[i + 1].mask = path_[i + 1].edges = path_[i + 1].words = 0;
    }
    lastSize_ = word.size();
    OpenNode& end = path_[lastSize_ - 1];
    end.content[2 * end.edges - 2] |= WordEnds;
    ++end.words;
    ++size_;
}

WordGraph GraphBuilder::finish() {
    closeNodes(0);
    nodes_->closeBase(store(path_[0]));
    nodes_->shrink();
    return {std::move(nodes_), size_};
}

// Stores the nodes of the last word below `depth` letters, deepest first, and links to them.
void GraphBuilder::closeNodes(std::size_t depth) {
    for (std::size_t i = lastSize_; i > depth; --i) {
        OpenNode& parent = path_[i - 1];
        parent.content[2 * parent.edges - 2] |= store(path_[i]);
        parent.words += path_[i].words;
    }
}

// The stored node of this content: one that was there before, or a new one.
NodeIndex GraphBuilder::store(const OpenNode& open) {
    if (open.mask == 0) return NoNode;
    if (stored_ * 2 >= register_.size()) growRegister();
    const std::size_t last = register_.size() - 1;
    std::size_t slot = Hash(open.mask, open.content.data(), open.edges) & last;
    for (; register_[slot] != NoNode; slot = (slot + 1) & last) {
        const std::uint32_t* node = nodes_->words() + register_[slot];
        if (node[0] == open.mask &&
            std::equal(node + 1, node + 1 + 2 * open.edges, open.content.data())) {
            return register_[slot];
        }
    }
    nodes_->reserve(1 + 2 * std::size_t{open.edges});
    const NodeIndex index = nodes_->append(1 + 2 * std::size_t{open.edges});
    std::uint32_t* node = nodes_->words() + index;
    node[0] = open.mask;
    std::copy_n(open.content.data(), 2 * open.edges, node + 1);
    register_[slot] = index;
    ++stored_;
    return index;
}

void GraphBuilder::growRegister() {
    std::vector<NodeIndex> grown(register_.size() * 2);
    const std::size_t last = grown.size() - 1;
    for (const NodeIndex index : register_) {
        if (index == NoNode) continue;
        const std::uint32_t* node = nodes_->words() + index;
        std::size_t slot = Hash(node[0], node + 1, EdgeCount(node[0])) & last;
        while (grown[slot] != NoNode) slot = (slot + 1) & last;
        grown[slot] = index;
    }
    register_.swap(grown);
}
